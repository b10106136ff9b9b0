`timescale 1ns / 1ps

module tools(A, 
             Y);

    input A/* synthesis "LOC=P12" */;
   output Y;
   
   wire [1:0] M/* synthesis "K=1, \
                         L=2 3" */;
   wire N/* synthesis "K=V" */;
   wire P;
   
   AND2 U1 (.I0(A), 
            .I1(N), 
            .O(Y))/* synthesis "KEEP=TRUE, \
                         AREA=3" */;
endmodule
