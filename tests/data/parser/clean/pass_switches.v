// Bidirectional pass-switch structures: a bus isolator, a 4-way analog-style
// crossbar and an I2C-like open-drain pair with pull-ups.
module bus_isolator (
    inout wire [3:0] left,
    inout wire [3:0] right,
    input wire       connect
);
    tranif1 sw0 (left[0], right[0], connect);
    tranif1 sw1 (left[1], right[1], connect);
    tranif1 sw2 (left[2], right[2], connect);
    tranif1 sw3 (left[3], right[3], connect);
endmodule

module xbar4 (
    inout wire [3:0] port,
    input wire [5:0] close_n     // one active-low control per pair
);
    // Pairs: 01 02 03 12 13 23
    tranif0  #(1, 1) p01 (port[0], port[1], close_n[0]);
    tranif0  #(1, 1) p02 (port[0], port[2], close_n[1]);
    tranif0  #(1, 1) p03 (port[0], port[3], close_n[2]);
    rtranif0 #(2, 2) p12 (port[1], port[2], close_n[3]);
    rtranif0 #(2, 2) p13 (port[1], port[3], close_n[4]);
    rtranif1 #(2, 2) p23 (port[2], port[3], ~close_n[5]);
endmodule

module i2c_pads (
    inout  wire scl_pad,
    inout  wire sda_pad,
    input  wire scl_drive_low,
    input  wire sda_drive_low,
    output wire scl_in,
    output wire sda_in
);
    wire scl_int, sda_int;

    pullup   (pull1) pu_scl (scl_pad);
    pullup   (pull1) pu_sda (sda_pad);

    tran     t_scl (scl_pad, scl_int);
    rtran    t_sda (sda_pad, sda_int);

    bufif1   (strong0, highz1) dscl (scl_int, 1'b0, scl_drive_low);
    bufif1   (strong0, highz1) dsda (sda_int, 1'b0, sda_drive_low);

    buf      bscl (scl_in, scl_int);
    buf      bsda (sda_in, sda_int);
endmodule

module pass_top (
    inout  wire [3:0] a,
    inout  wire [3:0] b,
    inout  wire [3:0] x,
    inout  wire       scl,
    inout  wire       sda,
    input  wire       link,
    input  wire [5:0] ctl,
    input  wire       scl_low,
    input  wire       sda_low,
    output wire       scl_seen,
    output wire       sda_seen,
    output wire       idle
);
    wire quiet;

    bus_isolator iso (.left(a), .right(b), .connect(link));
    xbar4        xb  (.port(x), .close_n(ctl));
    i2c_pads     pads (scl, sda, scl_low, sda_low, scl_seen, sda_seen);

    pulldown (weak0) pd_quiet (quiet);
    and      g_idle (idle, scl_seen, sda_seen, ~quiet);
endmodule
