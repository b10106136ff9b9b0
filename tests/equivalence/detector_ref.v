// Looks for 1, 0, 1 in x, counts what it finds and keeps in mind that it found any.
module detector (input clk, input rst, input x, input spare,
                 output hit, output reg locked, output reg [1:0] count);
    localparam NONE = 2'd0, SAW_1 = 2'd1, SAW_10 = 2'd2, SAW_101 = 2'd3;
    reg [1:0] state;
    assign hit = state == SAW_101;
    always @(posedge clk)
        if (rst) {state, locked, count} <= 0;
        else begin
            case (state)
                NONE: state <= x ? SAW_1 : NONE;
                SAW_1: state <= x ? SAW_1 : SAW_10;
                SAW_10: state <= x ? SAW_101 : NONE;
                SAW_101: state <= x ? SAW_1 : SAW_10;
            endcase
            if (hit) begin
                locked <= 1;
                count <= count + 1;
            end
        end
endmodule
