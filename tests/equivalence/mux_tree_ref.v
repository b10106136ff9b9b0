module mux_tree (input [3:0] x, input [0:3] y, input p, input q, input [2:0] sel,
                 output reg [3:0] z, output [3:0] w, output v3, output v2, output [1:0] v,
                 output odd);
    reg [7:0] t;
    always @* begin
        if (sel[0]) t = {x[1:0], x[3:2], p, y[1], y[2], q};
        else t = {x, y[0], y[1], y[2], y[3]};
        z = t >> (sel[1] ? 0 : 4);
    end
    assign w = sel[2] ? t[5:2] : {z[1:0], v3, v2};
    assign {v3, v2, v} = p ? z : 4'd6;
    assign odd = z[3] != z[0];
endmodule
