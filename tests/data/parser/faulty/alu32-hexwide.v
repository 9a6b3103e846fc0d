// 32-bit ALU with signed and unsigned compare, arithmetic shifts, count of
// leading zeros and a small multiply.  Operation select is a 5-bit code
// decoded with casez so that related operations share a prefix.
module alu32 (
    input  wire        [4:0]  op,
    input  wire signed [31:0] a,
    input  wire signed [31:0] b,
    output reg  signed [31:0] y,
    output reg                overflow,
    output wire               zero
);
    localparam signed [31:0] MIN_INT = 32'sh8000_0000;

    wire        [4:0]  shamt = b[4:0];
    wire        [32:0] usum  = {1'b0, a} + {1'b0, b};
    wire signed [31:0] sum   = a + b;
    wire signed [31:0] diff  = a - b;
    wire signed [63:0] prod  = a * b;

    function [5:0] clz;
        input [31:0] v;
        integer n;
        reg     found;
        begin
            clz   = 6'h20;
            found = 1'b0;
            for (n = 31; n >= 0; n = n - 1)
                if (!found && v[n]) begin
                    clz   = 31 - n;
                    found = 1'b1;
                end
        end
    endfunction

    // Saturating add: clamp instead of wrapping.
    function signed [31:0] sat_add;
        input signed [31:0] x, z;
        reg   signed [32:0] wide;
        begin
            wide = {x[31], x} + {z[31], z};
            if (wide > 33'sh0_7FFF_FFFF)
                sat_add = 32'sh7FFF_FFFF;
            else if (wide < -33'sh0_8000_0000)
                sat_add = MIN_INT;
            else
                sat_add = wide[31:0];
        end
    endfunction

    always @* begin
        overflow = 1'b0;
        casez (op)
            5'b0_0000: begin
                y = sum;
                overflow = (a[31] == b[31]) && (sum[31] != a[31]);
            end
            5'b0_0001: begin
                y = diff;
                overflow = (a[31] != b[31]) && (diff[31] != a[31]);
            end
            5'b0_0010: y = sat_add(a, b);
            5'b0_0011: y = usum[31:0];
            5'b0_01?0: y = a & b;
            5'b0_01?1: y = a | b;
            5'b0_1000: y = a ^ b;
            5'b0_1001: y = ~(a | b);
            5'b0_1010: y = a << shamt;
            5'b0_1011: y = $unsigned(a) >> shamt;
            5'b0_1100: y = a >>> shamt;
            5'b0_1101: y = a <<< shamt;
            5'b0_111?: y = {31'b0, op[0] ? ($unsigned(a) < $unsigned(b)) : (a < b)};
            5'b1_00??: y = prod[31:0];
            5'b1_01??: y = prod[63:32];
            5'b1_1000: y = {26'b0, clz(a)};
            5'b1_1001: y = (a == MIN_INT) ? MIN_INT : (a < 0 ? -a : a);
            5'b1_1010: y = (b[4:0] < 5'h10) ? 2 ** b[3:0] : 0;
            5'b1_1011: y = {{16{a[15]}}, a[15:0]};
            5'b1_1100: y = {{24{a[7]}}, a[7:0]};
            5'b1_1101: y = a[31] ? $signed(~a) : a;
            5'b1_1110: y = a ^~ b;
            5'b1_1111: y = {29'b0, &a, ~&b, ~^a};
            default:   y = 32'h0000_00000;
        endcase
    end

    assign zero = ~|y;
endmodule
