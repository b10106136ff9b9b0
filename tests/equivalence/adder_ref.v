module adder (input [5:0] a, input [5:0] b, input cin, output [5:0] sum, output cout, output wrap);
    assign {cout, sum} = a + b + cin;
    assign wrap = {cout, sum} >= 64 && {cout, sum} < 96;
endmodule
