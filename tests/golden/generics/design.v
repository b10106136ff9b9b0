`timescale 1ns / 1ps

module generics(I, 
                O);

   parameter WIDTH = 8;
   // synopsys translate_off
   parameter EDGE = 1'b1;
   // synopsys translate_on
   
    input I;
   output [4:0] O;
   
   
   MEM U1 (.A(I), 
           .O(O[0]));
   defparam U1.DEPTH = 32;
   defparam U1.TITLE = "mem a";
   defparam U1.MASK = 8'hA5;
   defparam U1.MODE = "FAST";
   // synopsys translate_off
   defparam U1.DELAY = 2.25;
   defparam U1.CHECK = "TRUE";
   // synopsys translate_on
   MEM U2 (.A(I), 
           .O(O[1]));
   defparam U2.DEPTH = 16;
   defparam U2.TITLE = "mem a";
   defparam U2.MASK = 8'hA5;
   defparam U2.MODE = "FAST";
   // synopsys translate_off
   defparam U2.DELAY = 12.0;
   defparam U2.CHECK = "TRUE";
   // synopsys translate_on
   MEM U3 (.A(I), 
           .O(O[2]));
   defparam U3.DEPTH = 4;
   defparam U3.MASK = 8'b00001111;
   defparam U3.TITLE = "mem a";
   defparam U3.MODE = "FAST";
   // synopsys translate_off
   defparam U3.DELAY = 1.50;
   defparam U3.CHECK = "TRUE";
   // synopsys translate_on
   MEM U4 (.A(I), 
           .O(O[3]));
   defparam U4.TITLE = "mem a";
   defparam U4.MASK = 8'hA5;
   defparam U4.MODE = "FAST";
   // synopsys translate_off
   defparam U4.DELAY = 1.50;
   defparam U4.CHECK = "TRUE";
   // synopsys translate_on
   DLY U5 (.A(I), 
           .O(O[4]));
   // synopsys translate_off
   defparam U5.T = 0.5;
   // synopsys translate_on
endmodule
