`include "definitions.vh"
`include "quoted path/more.vh"
`timescale 1ns / 1ps

module libs(A, 
            Y);

    input A;
   output Y;
   
   
   assign Y = A;
endmodule
