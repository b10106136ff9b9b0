`timescale 1ns / 1ps

module Cases(IN_A, 
             YES);

    input IN_A;
   output YES;
   
   wire [3:0] DATA;
   wire NET;
   
   assign YES = NET;
   Mix uOne (.I0(IN_A), 
             .I1(DATA[3]), 
             .O({NET, DATA[1:0]}));
endmodule
