`timescale 1ns / 1ps

module slices(A, 
              E, 
              F, 
              Y, 
              Z);

    input [7:0] A;
    input E;
   output F;
   output [7:0] Y;
   output [0:3] Z;
   
   wire K;
   wire [2:0] L;
   wire [7:0] M;
   wire [3:0] N;
   
   BUF4 U1 (.D(A[7:4]), 
            .Q(N[3:0]));
   BUF4 U2 (.D(N[3:0]), 
            .Q(Y[7:4]));
   BUF4 U3 (.D({E, A[2:1], N[0]}), 
            .Q(Y[3:0]));
   UP4 U4 (.D({A[3], A[2], A[1:0]}), 
           .Q(Z[0:3]));
   BUF4 U5 (.D(M[3:0]), 
            .Q({K, L[2:0]}));
   REG8 U6 (.C(E), 
            .D(A[7:0]), 
            .Q(M[7:0]));
   AND2 U7 (.I0(M[7]), 
            .I1(K), 
            .O(F));
endmodule
