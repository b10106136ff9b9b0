`timescale 1ns / 1ps

module attributes(A, 
                  Y);

    input A;
   // synthesis attribute PULL of A is "up"
   // synthesis attribute PIN_NO of A is "12"
   // synthesis attribute IOSTD of A is "LVCMOS"
   output [3:0] Y;
   // synthesis attribute PIN_NO of Y is "13"
   
   wire [3:0] B;
   // synthesis attribute NOTE of B is ""
   wire N;
   // synthesis attribute KEEP of N is "TRUE"
   // synthesis attribute pull of N is "down"
   // synthesis attribute RATIO of N is "2.50"
   // synthesis attribute MASK of N is "1010"
   // synthesis attribute EDGE of N is "1"
   // synthesis attribute MODE of N is "FAST"
   wire PLAIN;
   
   assign Y(3) = B(3);
   MEM U1 (.A(A), 
           .O(N));
   // synthesis attribute SPEED of U1 is "FAST"
   // synthesis attribute AREA of U1 is "3"
   MEM U2 (.A(N), 
           .O(Y[0]));
   // synthesis attribute SPEED of U2 is "slow"
   // synthesis attribute LOC of U2 is "R1C1"
   // synthesis attribute IOSTD of U2 is "LVTTL"
   // synthesis attribute AREA of U2 is "3"
   CELL U3 (.A(N), 
            .O(Y[1]));
endmodule
