`timescale 1ns / 1ps

module against(A, 
               B, 
               Y);

    input [7:0] A;
    input [0:7] B;
   output [3:0] Y;
   
   wire [2:2] H;
   
   BUF4 U1 (.D(A[0:3]), 
            .Q(Y[3:0]));
   BUF4 U2 (.D(B[6:3]), 
            .Q());
   ONE U3 (.G(A[5:5]));
   ONE U4 (.G(H[2]));
   BUF4 U5 (.D({A[6:6], A[0:2]}), 
            .Q());
endmodule
