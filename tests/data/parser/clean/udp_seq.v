// Sequential UDP library (Verilog-1995): level-sensitive latch, edge-triggered
// flip-flops with clear and preset, a toggle flip-flop and an enabled DFF,
// plus two small netlists built from them.
primitive udp_latch (q, d, en);
    output q;
    reg    q;
    input  d, en;
    initial q = 1'bx;
    table
    //  d  en : q : q+
        0  1  : ? : 0;
        1  1  : ? : 1;
        ?  0  : ? : -;
        0  x  : 0 : 0;
        1  x  : 1 : 1;
    endtable
endprimitive

primitive udp_dff_cp (q, d, clk, clr_n, pre_n);
    output q;
    reg    q;
    input  d, clk, clr_n, pre_n;
    table
    //  d  clk   clr_n pre_n : q : q+
        ?   ?     0     1    : ? : 0;   // asynchronous clear
        ?   ?     1     0    : ? : 1;   // asynchronous preset
        ?   ?     0     0    : ? : x;
        0   r     1     1    : ? : 0;
        1   r     1     1    : ? : 1;
        0  (0x)   1     1    : 0 : 0;   // possible edge, value unchanged
        1  (0x)   1     1    : 1 : 1;
        0  (x1)   1     1    : 0 : 0;
        1  (x1)   1     1    : 1 : 1;
        ?  (?0)   1     1    : ? : -;   // falling clock
        *   ?     1     1    : ? : -;   // data change
        ?   ?    (?1)   1    : ? : -;   // clear released
        ?   ?     1    (?1)  : ? : -;   // preset released
    endtable
endprimitive

primitive udp_tff (q, t, clk);
    output q;
    reg    q;
    input  t, clk;
    initial q = 1'b0;
    table
    //  t  clk  : q : q+
        0   f   : ? : -;
        1   f   : 0 : 1;
        1   f   : 1 : 0;
        ?  (?1) : ? : -;
        ?  (0x) : ? : -;
        *   ?   : ? : -;
    endtable
endprimitive

primitive udp_dffe (q, d, clk, en);
    output q;
    reg    q;
    input  d, clk, en;
    initial q = 1'b0;
    table
    //  d  clk   en : q : q+
        0   r    1  : ? : 0;
        1   r    1  : ? : 1;
        b   r    0  : ? : -;
        0   r    x  : 0 : 0;
        1   r    x  : 1 : 1;
        ?  (?0)  ?  : ? : -;
        *   ?    ?  : ? : -;
        ?   ?    *  : ? : -;
    endtable
endprimitive

// Ripple counter: each stage toggles on the falling edge of the previous one.
module ripple_count4 (q, clk);
    output [3:0] q;
    input        clk;
    supply1      one;

    udp_tff #(1) t0 (q[0], one, clk);
    udp_tff #(1) t1 (q[1], one, q[0]);
    udp_tff #(1) t2 (q[2], one, q[1]);
    udp_tff #(1) t3 (q[3], one, q[2]);
endmodule

module shift_cp4 (q, si, clk, clr_n, load_n, en, l);
    output [3:0] q;
    output       l;
    input        si, clk, clr_n, load_n, en;
    wire   [3:0] s;
    supply1      one;

    udp_dff_cp #(2, 3) s0 (s[0], si,   clk, clr_n, load_n);
    udp_dff_cp #(2, 3) s1 (s[1], s[0], clk, clr_n, one);
    udp_dff_cp #(2, 3) s2 (s[2], s[1], clk, clr_n, one);
    udp_dff_cp #(2, 3) s3 (s[3], s[2], clk, clr_n, one);
    udp_dffe           e0 (q[0], s[3], clk, en);
    udp_dffe           e1 (q[1], q[0], clk, en);
    udp_dffe           e2 (q[2], q[1], clk, en);
    udp_dffe           e3 (q[3], q[2], clk, en);
    udp_latch          lt (l, q[3], clk);
endmodule
