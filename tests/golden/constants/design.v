`timescale 1ns / 1ps

module constants(A, 
                 K, 
                 V, 
                 Y);

    input A;
   output K;
   output [3:0] V;
   output Y;
   
   wire G;
   wire [0:5] O;
   wire S;
   wire [7:0] T;
   wire U1_I0_CONST_SIGNAL;
   wire U1_I1_CONST_SIGNAL;
   wire [3:0] U2_D_CONST_SIGNAL;
   wire [3:0] U10_D_CONST_SIGNAL;
   
   assign G = 0;
   assign O = 6'o52;
   assign S = 1;
   assign T = 8'hA5;
   assign U1_I0_CONST_SIGNAL = 0;
   assign U1_I1_CONST_SIGNAL = 1;
   assign U2_D_CONST_SIGNAL = 4'b1010;
   assign U10_D_CONST_SIGNAL = 4'hF;
   assign K = 0;
   AND2 U1 (.I0(U1_I0_CONST_SIGNAL), 
            .I1(U1_I1_CONST_SIGNAL), 
            .O(Y));
   BUF4 U2 (.D(U2_D_CONST_SIGNAL[3:0]), 
            .Q(V[3:0]));
   BUF4 U10 (.D(U10_D_CONST_SIGNAL[3:0]), 
             .Q());
endmodule
