`timescale 1ns / 1ps

module tools(A, 
             Y);

    input A;
   // synthesis attribute LOC of A is "P12"
   output Y;
   
   wire [1:0] M;
   // synthesis attribute K of M is "1"
   // synthesis attribute L of M is "2 3"
   wire N;
   // synthesis attribute K of N is "V"
   wire P;
   
   AND2 U1 (.I0(A), 
            .I1(N), 
            .O(Y));
   // synthesis attribute KEEP of U1 is "TRUE"
   // synthesis attribute AREA of U1 is "3"
endmodule
