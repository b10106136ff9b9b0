// The cells of the designs in golden/ and examples/, without function.
`timescale 1ns / 1ps

module AND2(input I0, input I1, output O);
endmodule

module BUF4(input [3:0] D, output [3:0] Q);
endmodule

module UP4(input [0:3] D, output [0:3] Q);
endmodule

module REG8(input C, input [7:0] D, output [7:0] Q);
endmodule

module ONE(input [0:0] G);
endmodule

module PAD(input I, inout IO);
endmodule

module MEM(input A, output O);
    parameter DEPTH = 1;
    parameter TITLE = "";
    parameter MASK = 8'h00;
    parameter MODE = "";
    parameter DELAY = 1.0;
    parameter CHECK = "";
endmodule

module DLY(input A, output O);
    parameter T = 1.0;
endmodule

module LUT(input A, output O);
    parameter INIT = 0;
    parameter WIDTH = 0;
endmodule

module RAW(input A, output O);
    parameter INIT = 0;
    parameter X = 0;
endmodule

module Mix(input I0, input I1, output [2:0] O);
endmodule

module MIX(input I0, input I1, output [2:0] O);
endmodule

module mix(input I0, input I1, output [2:0] O);
endmodule

module TITLED(input I, output O);
    parameter TITLE = "";
endmodule

module INV(input I, output O);
endmodule

module XOR2(input I0, input I1, output O);
endmodule

module DFF(input C, input D, output Q);
endmodule

module LUT2(input I0, input I1, output O);
    parameter INIT = 0;
endmodule

module ADD4(input [3:0] A, input [3:0] B, input CI, output [3:0] S, output CO);
endmodule

module REG9(input C, input [8:0] D, output [8:0] Q);
endmodule
