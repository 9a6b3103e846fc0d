// Verilog-1995 counters and shift registers, written the way older code
// bases do: port names in the header, directions and types in the body.

module updown_counter (clk, reset, load, up, enable, d, q, carry);
    parameter WIDTH = 8;
    input              clk;
    input              reset;
    input              up;
    input              enable;
    input  [WIDTH-1:0] d;
    output [WIDTH-1:0] q;
    output             carry;

    reg    [WIDTH-1:0] q;
    reg                carry;

    always @(posedge clk or posedge reset)
    begin
        if (reset)
        begin
            q     <= {WIDTH{1'b0}};
            carry <= 1'b0;
        end
        else if (load)
            q <= d;
        else if (enable)
        begin
            if (up)
                {carry, q} <= q + 1;
            else
                {carry, q} <= {1'b0, q} - 1;
        end
    end
endmodule

// Johnson counter with a self-correcting feedback term.
module johnson (clk, rst_n, q);
    input        clk, rst_n;
    output [5:0] q;
    reg    [5:0] q;

    always @(posedge clk or negedge rst_n)
        if (!rst_n)
            q <= 6'b000000;
        else if (q[5:4] == 2'b01 && q[0] == 1'b0)
            q <= 6'b000001;            // illegal state: restart the sequence
        else
            q <= {q[4:0], ~q[5]};
endmodule

// Universal shift register: hold, shift right, shift left, parallel load.
module univ_shift (clk, clr, mode, sin_r, sin_l, pin, pout);
    input        clk, clr;
    input  [1:0] mode;
    input        sin_r, sin_l;
    input  [7:0] pin;
    output [7:0] pout;
    reg    [7:0] pout;

    always @(posedge clk)
        if (clr)
            pout = 8'h00;
        else
            case (mode)
                2'b00: pout = pout;
                2'b01: pout = {sin_r, pout[7:1]};
                2'b10: pout = {pout[6:0], sin_l};
                2'b11: pout = pin;
            endcase
endmodule

// A prescaler and a two-digit BCD counter built from the pieces above.
module bcd_clock (clk, reset, tick_in, tens, ones, wrap);
    input        clk, reset, tick_in;
    output [3:0] tens, ones;
    output       wrap;

    wire   [7:0] pre_q;
    wire         pre_c;
    wire         ones_c, tens_c;
    reg    [3:0] tens, ones;
    reg          wrap;

    updown_counter prescale (clk, reset, 1'b0, 1'b1, tick_in, 8'h00, pre_q, pre_c);
    defparam prescale.WIDTH = 8;

    always @(posedge clk or posedge reset)
        if (reset)
        begin
            ones <= 4'h0;
            tens <= 4'h0;
            wrap <= 1'b0;
        end
        else
        begin
            wrap <= 1'b0;
            if (pre_c)
            begin
                if (ones == 4'h9)
                begin
                    ones <= 4'h0;
                    if (tens == 4'h5)
                    begin
                        tens <= 4'h0;
                        wrap <= 1'b1;
                    end
                    else
                        tens <= tens + 1;
                end
                else
                    ones <= ones + 1;
            end
        end
endmodule

module counters_top (clk, reset, rst_n, load, up, en, d, q, carry, jq, mode, sr, tens, ones, wrap);
    input        clk, reset, rst_n, load, up, en;
    input  [3:0] d;
    output [3:0] q;
    output       carry;
    output [5:0] jq;
    input  [1:0] mode;
    output [7:0] sr;
    output [3:0] tens, ones;
    output       wrap;

    updown_counter #(4) c4 (.clk(clk), .reset(reset), .load(load), .up(up),
                            .enable(en), .d(d), .q(q), .carry(carry));
    johnson        jc (clk, rst_n, jq);
    univ_shift     us (clk, reset, mode, d[0], d[3], {d, d}, sr);
    bcd_clock      bc (clk, reset, en, tens, ones, wrap);
endmodule
