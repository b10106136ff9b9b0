`timescale 1ns / 1ps

module tools(A, 
             Y);

    input A;
   // exemplar attribute A LOC P12
   output Y;
   
   wire [1:0] M;
   // exemplar attribute M K 1
   // exemplar attribute M L 2 3
   wire N;
   // exemplar attribute N K V
   wire P;
   
   AND2 U1 (.I0(A), 
            .I1(N), 
            .O(Y));
   // exemplar attribute U1 KEEP TRUE
   // exemplar attribute U1 AREA 3
endmodule
