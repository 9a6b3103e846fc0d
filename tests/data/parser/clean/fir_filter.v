// Symmetric FIR filter with signed fixed-point arithmetic: pre-adder,
// multiplier per tap pair, adder chain, rounding and saturation.
`timescale 1ns / 1ps

module fir_sym #(
    parameter DW   = 12,                       // sample width
    parameter CW   = 10,                       // coefficient width
    parameter TAPS = 8,                        // even
    parameter [TAPS/2*CW-1:0] COEFS = {10'sd12, -10'sd40, 10'sd96, 10'sd300}
) (
    input  wire                 clk,
    input  wire                 en,
    input  wire signed [DW-1:0] x,
    output reg  signed [DW-1:0] y,
    output reg                  clipped
);
    localparam HALF = TAPS / 2;
    localparam AW   = DW + CW + 1 + 3;        // headroom for the sum of HALF products
    localparam FRAC = CW - 1;                 // coefficients are Q1.(CW-1)

    reg  signed [DW-1:0] dly [0:TAPS-1];
    wire signed [AW-1:0] partial [0:HALF];
    integer n;

    always @(posedge clk)
        if (en) begin
            dly[0] <= x;
            for (n = 1; n < TAPS; n = n + 1)
                dly[n] <= dly[n-1];
        end

    assign partial[0] = {AW{1'b0}};

    genvar k;
    generate
        for (k = 0; k < HALF; k = k + 1) begin : tap
            wire signed [CW-1:0] c   = COEFS[k*CW +: CW];
            wire signed [DW:0]   pre = dly[k] + dly[TAPS-1-k];
            wire signed [DW+CW:0] prod = pre * c;
            assign partial[k+1] = partial[k] + prod;
        end
    endgenerate

    // Round to nearest and saturate to the output width.
    wire signed [AW-1:0] rounded = partial[HALF] + ({{AW-1{1'b0}}, 1'b1} <<< (FRAC - 1));
    wire signed [AW-1:0] shifted = rounded >>> FRAC;
    localparam signed [AW-1:0] MAXV = (1 <<< (DW - 1)) - 1;
    localparam signed [AW-1:0] MINV = -(1 <<< (DW - 1));

    always @(posedge clk)
        if (en) begin
            clipped <= (shifted > MAXV) || (shifted < MINV);
            if (shifted > MAXV)
                y <= MAXV[DW-1:0];
            else if (shifted < MINV)
                y <= MINV[DW-1:0];
            else
                y <= shifted[DW-1:0];
        end
endmodule

module fir_tb;
    reg                clk = 1'b0;
    reg                en  = 1'b1;
    reg  signed [11:0] x;
    wire signed [11:0] y;
    wire               clipped;
    real               energy_in, energy_out, gain_db_approx;
    integer            i, seed, n_clip;

    fir_sym #(.DW(12), .CW(10), .TAPS(8)) dut (.clk(clk), .en(en), .x(x), .y(y), .clipped(clipped));

    always #5 clk = ~clk;

    initial begin
        seed       = 7;
        n_clip     = 0;
        energy_in  = 0.0;
        energy_out = 0.0;
        for (i = 0; i < 500; i = i + 1) begin
            // square wave with a little noise
            x = ((i / 16) % 2 ? 12'sd900 : -12'sd900) + ($random(seed) % 64);
            @(posedge clk);
            #1;
            energy_in  = energy_in + $itor(x) * $itor(x);
            energy_out = energy_out + $itor(y) * $itor(y);
            if (clipped)
                n_clip = n_clip + 1;
        end
        gain_db_approx = energy_out / energy_in;
        $display("energy ratio %f, %0d clipped samples", gain_db_approx, n_clip);
        $finish;
    end
endmodule
