`timescale 1ns / 1ps

module tools(A, 
             Y);

    input A;
   //pragma attribute A LOC P12
   output Y;
   
   wire [1:0] M;
   //pragma attribute M K 1
   //pragma attribute M L 2 3
   wire N;
   //pragma attribute N K V
   wire P;
   
   AND2 U1 (.I0(A), 
            .I1(N), 
            .O(Y));
   //pragma attribute U1 KEEP TRUE
   //pragma attribute U1 AREA 3
endmodule
