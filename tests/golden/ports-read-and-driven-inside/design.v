`timescale 1ns / 1ps

module feedback(A, 
                B, 
                N, 
                P, 
                Q, 
                V, 
                W);

    input A;
    input B;
    input N;
   output P;
   output Q;
   output [7:0] V;
   output W;
   
   wire N_DUMMY;
   wire P_DUMMY;
   wire Q_DUMMY;
   wire [7:0] V_DUMMY;
   wire W_DUMMY;
   
   assign N_DUMMY = N;
   assign P = P_DUMMY;
   assign Q = Q_DUMMY;
   assign V[7:0] = V_DUMMY[7:0];
   assign W = W_DUMMY;
   AND2 U1 (.I0(A), 
            .I1(B), 
            .O(Q_DUMMY));
   AND2 U2 (.I0(Q_DUMMY), 
            .I1(A), 
            .O(N_DUMMY));
   AND2 U3 (.I0(N_DUMMY), 
            .I1(B), 
            .O(W_DUMMY));
   AND2 U4 (.I0(A), 
            .I1(B), 
            .O(W_DUMMY));
   BUF4 U5 (.D(V_DUMMY[7:4]), 
            .Q(V_DUMMY[3:0]));
   BUF4 U6 (.D(V_DUMMY[3:0]), 
            .Q(V_DUMMY[7:4]));
   PAD U7 (.I(V_DUMMY[0]), 
           .IO(P_DUMMY));
endmodule
