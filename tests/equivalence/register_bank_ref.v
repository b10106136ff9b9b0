module register_bank (input clk, input rst, input we, input addr, input [15:0] d,
                      output [15:0] q, output reg [0:15] past, output reg [7:0] low,
                      output [15:0] mark);
    reg [15:0] word0, word1;
    assign q = addr ? word1 : word0;
    assign mark = past[3] ? {past[8:15], low} : 16'hA536;
    always @(posedge clk) begin
        past <= q;
        if (rst) {word0, word1, low} <= 0;
        else if (we) begin
            low <= past[0:7];
            if (addr) word1 <= {d[7:0], d[15:8]};
            else word0 <= d;
        end
    end
endmodule
