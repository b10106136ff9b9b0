`timescale 1ns / 1ps

module parts(A, 
             X);

    input A;
   output [3:0] X;
   
   wire [3:0] U1_D_CONST_SIGNAL;
   wire [0:3] W;
   
   assign U1_D_CONST_SIGNAL = 1100;
   assign W = 01;
   assign X = 2'b10;
   assign X = 1;
   assign X = 1;
   assign W(2) = A;
   assign W(3) = X(3);
   BUF4 U1 (.D(U1_D_CONST_SIGNAL[3:0]), 
            .Q());
endmodule
