// Sequential shift-and-add multiplier and a restoring divider, in the
// Verilog-1995 style with an explicit controller state machine.

module seq_mult (clk, rst, start, a, b, busy, done, p);
    parameter N = 8;
    input            clk, rst, strt;
    input  [N-1:0]   a, b;
    output           busy, done;
    output [2*N-1:0] p;

    reg    [2*N-1:0] p;
    reg    [2*N-1:0] mcand;
    reg    [N-1:0]   mplier;
    reg    [3:0]     count;
    reg              busy, done;

    always @(posedge clk)
        if (rst)
        begin
            busy <= 0;
            done <= 0;
            p    <= 0;
        end
        else if (start && !busy)
        begin
            mcand  <= {{N{1'b0}}, a};
            mplier <= b;
            p      <= 0;
            count  <= N;
            busy   <= 1;
            done   <= 0;
        end
        else if (busy)
        begin
            if (mplier[0])
                p <= p + mcand;
            mcand  <= mcand << 1;
            mplier <= mplier >> 1;
            count  <= count - 1;
            if (count == 1)
            begin
                busy <= 0;
                done <= 1;
            end
        end
        else
            done <= 0;
endmodule

module seq_div (clk, rst, start, dividend, divisor, busy, quotient, remainder, div_by_zero);
    input        clk, rst, start;
    input  [7:0] dividend, divisor;
    output       busy;
    output [7:0] quotient, remainder;
    output       div_by_zero;

    reg    [7:0] quotient;
    reg    [8:0] rem;
    reg    [7:0] dsr;
    reg    [3:0] step;
    reg          busy, div_by_zero;
    wire   [8:0] trial;

    assign trial     = {rem[7:0], quotient[7]} - {1'b0, dsr};
    assign remainder = rem[7:0];

    always @(posedge clk)
        if (rst)
        begin
            busy        <= 0;
            div_by_zero <= 0;
        end
        else if (start && !busy)
        begin
            div_by_zero <= (divisor == 0);
            busy        <= (divisor != 0);
            quotient    <= dividend;
            dsr         <= divisor;
            rem         <= 0;
            step        <= 0;
        end
        else if (busy)
        begin
            if (trial[8])
            begin
                rem      <= {rem[7:0], quotient[7]};
                quotient <= {quotient[6:0], 1'b0};
            end
            else
            begin
                rem      <= trial;
                quotient <= {quotient[6:0], 1'b1};
            end
            step <= step + 1;
            if (step == 7)
                busy <= 0;
        end
endmodule

module muldiv_unit (clk, rst, go, op, x, y, result, ready);
    input         clk, rst, go, op;
    input  [7:0]  x, y;
    output [15:0] result;
    output        ready;

    wire   [15:0] prod;
    wire   [7:0]  quo, rem;
    wire          mbusy, mdone, dbusy, dz;
    reg           dbusy_q;

    seq_mult #(8) mul (clk, rst, go & ~op, x, y, mbusy, mdone, prod);
    seq_div       div (clk, rst, go & op, x, y, dbusy, quo, rem, dz);

    always @(posedge clk)
        dbusy_q <= dbusy;

    assign result = op ? (dz ? 16'hFFFF : {rem, quo}) : prod;
    assign ready  = op ? (dbusy_q & ~dbusy) | dz : mdone;
endmodule
