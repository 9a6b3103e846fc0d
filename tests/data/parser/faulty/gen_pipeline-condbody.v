// Parameterised multiply-accumulate pipeline.  Which stages carry a register
// is chosen per stage by a bit mask; the final adder architecture by a
// parameter.  Everything below is structured with generate constructs.
module pipe_reg #(parameter W = 8) (
    input  wire         clk,
    input  wire         ce,
    input  wire [W-1:0] d,
    output reg  [W-1:0] q
);
    always @(posedge clk)
        if (ce) q <= d;
endmodule

module adder_ripple #(parameter W = 16) (
    input  wire [W-1:0] a, b,
    output wire [W:0]   s
);
    wire [W:0] c;
    assign c[0] = 1'b0;
    genvar i;
    generate
        for (i = 0; i < W; i = i + 1) begin : fa
            assign s[i]   = a[i] ^ b[i] ^ c[i];
            assign c[i+1] = (a[i] & b[i]) | (c[i] & (a[i] ^ b[i]));
        end
    endgenerate
    assign s[W] = c[W];
endmodule

// Sklansky-style prefix adder; W must be a power of two.
module adder_prefix #(parameter W = 16, parameter LOGW = 4) (
    input  wire [W-1:0] a, b,
    output wire [W:0]   s
);
    wire [W-1:0] g [0:LOGW];
    wire [W-1:0] p [0:LOGW];

    assign g[0] = a & b;
    assign p[0] = a ^ b;

    genvar lvl, j;
    generate
        for (lvl = 0; lvl < LOGW; lvl = lvl + 1) begin : level
            localparam SPAN = 1 << lvl;
            for (j = 0; j < W; j = j + 1) if ((j / SPAN) % 2 == 1) begin : combine
                    localparam SRC = (j / SPAN) * SPAN - 1;
                    assign g[lvl+1][j] = g[lvl][j] | (p[lvl][j] & g[lvl][SRC]);
                    assign p[lvl+1][j] = p[lvl][j] & p[lvl][SRC];
                end else begin : pass
                    assign g[lvl+1][j] = g[lvl][j];
                    assign p[lvl+1][j] = p[lvl][j];
                end
        end
    endgenerate

    assign s = {g[LOGW][W-1], p[0] ^ {g[LOGW][W-2:0], 1'b0}};
endmodule

module gen_pipeline #(
    parameter W        = 8,
    parameter TAPS     = 4,
    parameter REG_MASK = 4'b1011,     // stage s is registered when bit s is set
    parameter ADDER    = 1            // 1: prefix adder, otherwise ripple
) (
    input  wire                  clk,
    input  wire                  ce,
    input  wire [W-1:0]          x,
    input  wire [TAPS*W-1:0]     coef,
    output wire [2*W+TAPS-1:0]   y
);
    localparam PW = 2 * W + TAPS;

    // Tap delay line: x delayed by 0..TAPS-1 samples.
    wire [W-1:0] tap [0:TAPS-1];
    assign tap[0] = x;

    genvar t;
    generate
        for (t = 1; t < TAPS; t = t + 1) begin : delay
            reg [W-1:0] r;
            always @(posedge clk)
                if (ce) r <= tap[t-1];
            assign tap[t] = r;
        end
    endgenerate

    // Products and an accumulation chain, optionally registered per stage.
    wire [PW-1:0] acc [0:TAPS];
    assign acc[0] = {PW{1'b0}};

    genvar s;
    generate
        for (s = 0; s < TAPS; s = s + 1) begin : stage
            wire [2*W-1:0] prod = tap[s] * coef[s*W +: W];
            wire [PW-1:0]  sum  = acc[s] + {{TAPS{1'b0}}, prod};
            if (REG_MASK[s]) begin : q
                pipe_reg #(.W(PW)) r (.clk(clk), .ce(ce), .d(sum), .q(acc[s+1]));
            end else begin : c
                assign acc[s+1] = sum;
            end
        end
    endgenerate

    // Rounding add of a constant, with the adder chosen by parameter.
    wire [PW:0] rounded;
    generate
        case (ADDER)
            1: begin : fast
                wire [32:0] rounded_wide;
                adder_prefix #(.W(32), .LOGW(5)) add (
                    .a({{32-PW{1'b0}}, acc[TAPS]}), .b(32'h0000_0080), .s(rounded_wide));
                assign rounded = rounded_wide[PW:0];
            end
            default: begin : slow
                adder_ripple #(PW) add (acc[TAPS], {{PW-8{1'b0}}, 8'h80}, rounded);
            end
        endcase
    endgenerate

    assign y = rounded[PW-1:0];
endmodule
