`timescale 1ns / 1ps

module openpins(A);

    input A;
   
   wire [3:0] U1_D_openSignal;
   wire U2_I0_openSignal;
   wire U3_I_openSignal;
   
   BUF4 U1 (.D(U1_D_openSignal[3:0]), 
            .Q());
   AND2 U2 (.I0(U2_I0_openSignal), 
            .I1(A), 
            .O());
   PAD U3 (.I(U3_I_openSignal), 
           .IO());
endmodule
