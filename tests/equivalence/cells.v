// What the cells of the designs do. The flip-flops reset at a clock edge, before they are enabled.
`timescale 1ns / 1ps

module INV (input A, output Y);
    assign Y = ~A;
endmodule

module AND2 (input A, input B, output Y);
    assign Y = A & B;
endmodule

module OR2 (input A, input B, output Y);
    assign Y = A | B;
endmodule

module XOR2 (input A, input B, output Y);
    assign Y = A ^ B;
endmodule

module FA (input A, input B, input CI, output S, output CO);
    assign S = A ^ B ^ CI;
    assign CO = (A & B) | (A & CI) | (B & CI);
endmodule

module MUX2X4 (input [3:0] A, input [3:0] B, input S, output [0:3] Y);
    assign Y = S ? B : A;
endmodule

module MUX2X16 (input [15:0] A, input [15:0] B, input S, output [15:0] Y);
    assign Y = S ? B : A;
endmodule

module DFF (input C, input R, input E, input D, output reg Q, output QN);
    always @(posedge C)
        if (R) Q <= 1'b0;
        else if (E) Q <= D;
    assign QN = ~Q;
endmodule

module REG8 (input C, input R, input E, input [0:7] D, output reg [7:0] Q);
    always @(posedge C)
        if (R) Q <= 8'b0;
        else if (E) Q <= D;
endmodule
