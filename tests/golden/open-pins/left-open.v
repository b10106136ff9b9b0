`timescale 1ns / 1ps

module openpins(A);

    input A;
   
   
   BUF4 U1 (.D(), 
            .Q());
   AND2 U2 (.I0(), 
            .I1(A), 
            .O());
   PAD U3 (.I(), 
           .IO());
endmodule
