// cpu8 arithmetic and logic unit: combinational, flags computed alongside.
`include "cpu8_defs.vh"

module cpu8_alu (
    input  wire [`CPU8_DATA_W-1:0] a,
    input  wire [`CPU8_DATA_W-1:0] b,
    input  wire [2:0]              fn,
    output reg  [`CPU8_DATA_W-1:0] y,
    output reg                     carry,
    output wire                    zero,
    output wire                    negative
);
    always @(a or b or fn) begin
        carry = 1'b0;
        case (fn)
            `ALU_ADD:  {carry, y} = a + b;
            `ALU_SUB:  {carry, y} = {1'b0, a} - {1'b0, b};
            `ALU_AND:  y = a & b;
            `ALU_OR:   y = a | b;
            `ALU_XOR:  y = a ^ b;
            `ALU_SHL:  {carry, y} = {a, 1'b0};
            `ALU_SHR:  {y, carry} = {1'b0, a};
            default:   y = b;
        endcase
    end

    assign zero     = (y == {`CPU8_DATA_W{1'b0}});
    assign negative = y[`CPU8_DATA_W-1];
endmodule
