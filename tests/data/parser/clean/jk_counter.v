// Synchronous 4-bit up/down counter from JK flip-flops (toggle enables from
// an AND chain), with terminal count and a divide-by-two output.
`timescale 1ns / 1ps

module jk_counter4 (
    input  wire       clk_n,
    input  wire       clr_n,
    input  wire       en,
    input  wire       up,
    output wire [3:0] q,
    output wire       tc,
    output wire       half
);
    wire [3:0] t;
    wire [3:0] qd = up ? q : ~q;

    assign t[0] = en;
    assign t[1] = en & qd[0];
    assign t[2] = en & qd[0] & qd[1];
    assign t[3] = en & qd[0] & qd[1] & qd[2];
    assign tc   = t[3] & qd[3];

    udp_jkff b0 (q[0], t[0], t[0], clk_n, clr_n);
    udp_jkff b1 (q[1], t[1], t[1], clk_n, clr_n);
    udp_jkff b2 (q[2], t[2], t[2], clk_n, clr_n);
    udp_jkff b3 (q[3], t[3], t[3], clk_n, clr_n);

    wire unused_qn;
    jk_dff div2 (.q(half), .qn(unused_qn), .d(~half), .clk_n(tc), .clr_n(clr_n));
endmodule

module jk_counter_tb;
    reg        clk_n = 1'b1, clr_n = 1'b0, en = 1'b0, up = 1'b1;
    wire [3:0] q;
    wire       tc, half;
    integer    edges;

    jk_counter4 dut (.clk_n(clk_n), .clr_n(clr_n), .en(en), .up(up), .q(q), .tc(tc), .half(half));

    always #5 clk_n = ~clk_n;

    initial begin
        edges = 0;
        #12 clr_n = 1'b1;
        en = 1'b1;
        repeat (20) @(negedge clk_n) edges = edges + 1;
        up = 1'b0;
        repeat (5) @(negedge clk_n);
        #1 $display("q=%h tc=%b half=%b after %0d edges", q, tc, half, edges);
        $finish;
    end
endmodule
