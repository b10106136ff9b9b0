`timescale 1ns / 1ps

module w(A);

    input A;
   
   
endmodule
