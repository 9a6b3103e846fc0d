// Sequential cell library with the full set of timing checks.  Each cell
// keeps a notifier register; a violation drives the functional model's
// output to x through the UDP below.
`timescale 1ns / 1ps

primitive udp_dff_n (q, d, clk, rn, sn, ntfr);
    output q;
    reg    q;
    input  d, clk, rn, sn, ntfr;
    table
    //  d  clk  rn sn ntfr : q : q+
        0   r   1  1   ?   : ? : 0;
        1   r   1  1   ?   : ? : 1;
        ?   ?   0  1   ?   : ? : 0;
        ?   ?   1  0   ?   : ? : 1;
        ?   ?   0  0   ?   : ? : 1;
        0   p   1  1   ?   : 0 : 0;
        1   p   1  1   ?   : 1 : 1;
        ?   n   1  1   ?   : ? : -;
        *   ?   1  1   ?   : ? : -;
        ?   ?  (?1) 1  ?   : ? : -;
        ?   ?   1 (?1) ?   : ? : -;
        ?   ?   1  1   *   : ? : x;
    endtable
endprimitive

`celldefine
module DFFRSX1 (Q, QN, D, CK, RN, SN);
    output Q, QN;
    input  D, CK, RN, SN;
    reg    notifier;
    wire   d_d, ck_d, rn_d, sn_d;
    wire   chk_en  = RN & SN;
    wire   rn_sn_1 = SN;

    udp_dff_n ff (Q, d_d, ck_d, rn_d, sn_d, notifier);
    not       (QN, Q);

    specify
        specparam tsu_r = 0.08, tsu_f = 0.09, th_r = 0.02, th_f = 0.03;
        specparam trec = 0.10, trem = 0.05, tpwh = 0.20, tpwl = 0.22;
        specparam tper = 0.50, tpw_rn = 0.25;

        (posedge CK => (Q +: D)) = (0.20, 0.22);
        (negedge RN => (Q +: 1'b0)) = (0.15, 0.17);
        (negedge SN => (Q +: 1'b1)) = (0.14, 0.16);

        $setuphold(posedge CK &&& chk_en, posedge D, tsu_r, th_r, notifier, , , ck_d, d_d);
        $setuphold(posedge CK &&& chk_en, negedge D, tsu_f, th_f, notifier, , , ck_d, d_d);
        $recrem(posedge RN, posedge CK &&& rn_sn_1, trec, trem, notifier, , , rn_d, ck_d);
        $recrem(posedge SN, posedge CK &&& RN, trec, trem, notifier, , , sn_d, ck_d);
        $width(posedge CK &&& chk_en, tpwh, 0, notifier);
        $width(negedge CK &&& chk_en, tpwl, 0, notifier);
        $width(negedge RN, tpw_rn, 0, notifier);
        $pulsewidth(negedge SN, tpw_rn);
        $period(posedge CK &&& chk_en, tper, notifier);
    endspecify
endmodule
`endcelldefine

`celldefine
module DFFX2 (Q, D, CK, SE, SI);
    output Q;
    input  D, CK, SE, SI;
    reg    Q, notifier;
    wire   dsel = SE ? SI : D;
    wire   se_low = ~SE;

    always @(posedge CK or notifier)
        if (notifier !== 1'bz && $time > 0 && CK === 1'b1)
            Q <= dsel;

    specify
        (posedge CK => (Q +: dsel)) = (0.21, 0.23);

        $setup(D, posedge CK &&& (se_low == 1'b1), 0.08, notifier);
        $hold(posedge CK &&& (se_low == 1'b1), D, 0.02, notifier);
        $setup(SI, posedge CK &&& SE, 0.10, notifier);
        $hold(posedge CK &&& SE, SI, 0.03, notifier);
        $setup(SE, edge[01, x1] CK, 0.12, notifier);
        $hold(edge[01, x1] CK, SE, 0.04, notifier);
        $period(edge[01, 0x] CK, 0.50);
    endspecify
endmodule
`endcelldefine

`celldefine
module LATNX1 (Q, D, GN, RN);
    output Q;
    input  D, GN, RN;
    reg    Q, notifier;

    always @(D or GN or RN or notifier)
        if (!RN)
            Q = 1'b0;
        else if (!GN)
            Q = D;

    specify
        (D => Q) = (0.15, 0.16);
        (negedge GN => (Q +: D)) = (0.18, 0.19);
        (negedge RN => (Q +: 1'b0)) = 0.12;

        $setup(D, posedge GN, 0.07, notifier);
        $hold(posedge GN, D, 0.03, notifier);
        $recovery(posedge RN, posedge GN, 0.09, notifier);
        $removal(posedge RN, posedge GN, 0.04, notifier);
        $width(negedge GN, 0.25, 0, notifier);
        $nochange(negedge GN, D, 0.01, 0.02, notifier);
    endspecify
endmodule
`endcelldefine

// Two-phase clock checker: skew checks between the two clocks of a pair.
`celldefine
module CLKPAIRX1 (Y1, Y2, C1, C2);
    output Y1, Y2;
    input  C1, C2;
    reg    notifier;

    buf (Y1, C1);
    buf (Y2, C2);

    specify
        (C1 => Y1) = 0.05;
        (C2 => Y2) = 0.05;
        $skew(posedge C1, posedge C2, 0.03, notifier);
        $timeskew(posedge C1, negedge C2, 0.04, notifier);
        $fullskew(posedge C1, posedge C2, 0.03, 0.05, notifier);
    endspecify
endmodule
`endcelldefine

module tchk_demo (
    input  wire       clk, clk2, rst_n, set_n, se, si,
    input  wire [2:0] d,
    output wire [3:0] q
);
    wire qn, y1, y2;
    CLKPAIRX1 cp (y1, y2, clk, clk2);
    DFFRSX1   f0 (.Q(q[0]), .QN(qn), .D(d[0]), .CK(y1), .RN(rst_n), .SN(set_n));
    DFFX2     f1 (.Q(q[1]), .D(d[1]), .CK(y1), .SE(se), .SI(q[0]));
    LATNX1    l2 (.Q(q[2]), .D(d[2]), .GN(y2), .RN(rst_n));
    assign q[3] = qn;
endmodule
