`timescale 1ns / 1ps

module MORVANE_m(A, 
                 Y);

   parameter INIT = 7;
   
    input A;
   output [3:0] Y;
   
   
   LUT U1 (.A(A), 
           .O(Y[0]));
   defparam U1.INIT = INIT;
   RAW U2 (.A(A), 
           .O(Y[1]));
   defparam U2.INIT = INIT;
   defparam U2.X = 1;
   LUT U3 (.A(A), 
           .O(Y[2]));
   defparam U3.INIT = INIT;
   // synopsys translate_off
   defparam U3.WIDTH = 2;
   // synopsys translate_on
   LUT U4 (.A(A), 
           .O(Y[3]));
   defparam U4.INIT = INIT;
   // synopsys translate_off
   defparam U4.INIT = 9;
   // synopsys translate_on
endmodule
