`timescale 1ns / 1ps

module tools(A, 
             Y);

    input A;
   /* synopsys attribute LOC "P12" */
   output Y;
   
   wire [1:0] M;
   /* synopsys attribute K "1"
                         L "2 3" */
   wire N;
   /* synopsys attribute K "V" */
   wire P;
   
   AND2 U1 (.I0(A), 
            .I1(N), 
            .O(Y));
   /* synopsys attribute KEEP "TRUE"
                         AREA "3" */
endmodule
