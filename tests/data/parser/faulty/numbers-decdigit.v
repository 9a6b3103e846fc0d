// Literal constants of every form the language has, used in a checker
// that compares arithmetic results against precomputed values.
module numbers (
    input  wire        clk,
    input  wire [15:0] din,
    output reg  [15:0] dout,
    output reg         ok
);
    localparam        P_DEC     = 1234;
    localparam        P_UNDER   = 1_000_000;
    localparam        P_MAXU    = 32'hFFFF_FFFF;
    localparam [63:0] P_WIDE    = 64'h0123_4567_89AB_CDEF;
    localparam [127:0] P_HUGE   = 128'hFFFF_0000_FFFF_0000_FFFF_0000_FFFF_0000;
    localparam        P_OCT     = 12'o7_654;
    localparam        P_BIN     = 8'b1010_0101;
    localparam        P_SDEC    = -16'sd2000;
    localparam        P_SHEX    = 8'shF0;           // -16 as a signed byte
    localparam        P_UNSIZED = 'hBEEF;
    localparam        P_UNSZ_B  = 'b1;
    localparam        P_SPACE   = 16 'h 00_FF;      // blanks around the base
    localparam        P_XZ      = 8'bxx01_zz10;
    localparam        P_QMARK   = 4'b1?0?;
    localparam        P_UPPER   = 8'HaB;
    localparam        P_OUPPER  = 9'O777;
    localparam        P_DEC_BIG = 40'd999_999_999_999;  
    localparam        P_DEC_SM  = 7'd9x;
    localparam        P_ZERO_D  = 'd0;
    localparam        P_Z_ALL   = 16'hzzzz;
    localparam        P_X_ALL   = 'bx;

    localparam real   R_PLAIN   = 3.14159;
    localparam real   R_EXP     = 6.02e23;
    localparam real   R_EXP_NEG = 1.6E-19;
    localparam real   R_EXP_POS = 2.5e+3;
    localparam real   R_NO_FRAC = 5e2;
    localparam real   R_UNDER   = 1_000.000_5;

    reg [15:0] expected;
    reg [7:0]  scratch;
    integer    i;
    real       r;
    time       t;

    always @(posedge clk) begin
        case (din[3:0])
            4'h0: expected = P_DEC[15:0];
            4'h1: expected = P_OCT;
            4'h2: expected = {8'h00, P_BIN};
            4'h3: expected = P_SDEC;
            4'h4: expected = {{8{P_SHEX[7]}}, P_SHEX};
            4'h5: expected = P_UNSIZED;
            4'h6: expected = P_SPACE;
            4'h7: expected = P_WIDE[31:16];
            4'h8: expected = P_HUGE[127:112];
            4'h9: expected = P_DEC_BIG[39:24];
            default: expected = 16'h0000;
        endcase
        dout <= din ^ expected;
        ok   <= (din ^ expected) !== 16'bx;
    end

    initial begin
        r = R_PLAIN * 2.0 + R_EXP_POS / R_NO_FRAC;
        t = 64'd1000;
        scratch = 8'b0000_0001 << 3'b111;
        for (i = 0; i < 3; i = i + 1)
            scratch = scratch ~^ 8'h0F;
        $display("P_XZ=%b P_QMARK=%b P_UPPER=%h P_OUPPER=%o", P_XZ, P_QMARK, P_UPPER, P_OUPPER);
        $display("P_UNDER=%0d P_MAXU=%0d P_UNSZ_B=%0d P_ZERO_D=%0d P_DEC_SM=%0d",
                 P_UNDER, P_MAXU, P_UNSZ_B, P_ZERO_D, P_DEC_SM);
        $display("P_Z_ALL=%h P_X_ALL=%b", P_Z_ALL, P_X_ALL);
        $display("r=%f exp=%e e-19=%g under=%f t=%0t", r, R_EXP, R_EXP_NEG, R_UNDER, t);
        $display("\"quoted\" tab\there backslash\\ octal\101\102 newline\n-- end");
    end
endmodule
