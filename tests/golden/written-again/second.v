`timescale 1ns / 1ps

module again(A, 
             Q, 
             Y);

    input A;
   output Q;
   output Y;
   
   wire Q_DUMMY;
   wire U1_I1_openSignal;
   
   assign Q = Q_DUMMY;
   AND2 U1 (.I0(A), 
            .I1(U1_I1_openSignal), 
            .O(Q_DUMMY));
   AND2 U2 (.I0(A), 
            .I1(Q_DUMMY), 
            .O(Y));
endmodule
