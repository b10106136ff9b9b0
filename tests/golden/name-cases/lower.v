`timescale 1ns / 1ps

module Cases(in_a, 
             yes);

    input in_a;
   output yes;
   
   wire [3:0] data;
   wire net;
   
   assign yes = net;
   mix uone (.I0(in_a), 
             .I1(data[3]), 
             .O({net, data[1:0]}));
endmodule
