// first note -- of the  module
// second note
`timescale 1ns / 1ps

module commented(A, 
                 Y);

   // of the port
    input A;
   output Y;
   
   // of the bus
   wire [1:0] B;
   // of the signal
   wire N;
   
   // of the component
   // of the instance
   // its second line, which is much longer than eighty columns and for all that stays whole
   AND2 U1 (.I0(A), 
            .I1(N), 
            .O(B[0]));
   // of the component
   AND2 U2 (.I0(A), 
            .I1(B[0]), 
            .O(Y));
endmodule
