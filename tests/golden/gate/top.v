`timescale 1ns / 1ps

module top(A, 
           Y);

    input A;
   output Y;
   
   wire MID;
   
   AND2 U1 (.I0(A), 
            .I1(MID), 
            .O(Y));
endmodule
