`timescale 1ns / 1ps

module tools(A, 
             Y);

    input A;
   output Y;
   
   wire [1:0] M;
   wire N;
   wire P;
   
   AND2 U1 (.I0(A), 
            .I1(N), 
            .O(Y));
endmodule
