// Shared-bus structures at gate level: tristate drivers with strengths,
// instance arrays, wired-AND/OR nets and pulled nets.
`timescale 1ns / 1ps

module tri_driver8 (
    output wire [7:0] bus,
    input  wire [7:0] d,
    input  wire       oe
);
    // One bufif1 per bit, written as an instance array.
    bufif1 #(1.2, 1.0, 0.8) drv [7:0] (bus, d, oe);
endmodule

module open_drain4 (
    output wire [3:0] line,
    input  wire [3:0] pull_low
);
    // Drives strong 0 or nothing; the line is pulled up elsewhere.
    notif1 (strong0, highz1) od [3:0] (line, 4'b0000, pull_low);
endmodule

module bus_fabric (
    input  wire [7:0] a_data,
    input  wire       a_oe,
    input  wire [7:0] b_data,
    input  wire       b_oe,
    input  wire [3:0] req_n,
    input  wire       en,
    output wire [7:0] data,
    output wire [3:0] irq,
    output wire       any_req,
    output wire       all_req,
    output wire       strobe
);
    tri1  [7:0] data_bus;   // floats high when nobody drives
    tri1  [3:0] irq_n;
    wand        all_ack;
    wor         any_ack;
    tri0        strobe_line;
    triand      ack_and;
    trior       ack_or;
    tri   [7:0] data_mirror;
    wire        en_n;

    tri_driver8 drv_a (.bus(data_bus), .d(a_data), .oe(a_oe));
    tri_driver8 drv_b (.bus(data_bus), .d(b_data), .oe(b_oe));
    open_drain4 od    (.line(irq_n), .pull_low(~req_n));

    // Wired functions: each request contributes one driver.
    assign all_ack = ~req_n[0];
    assign all_ack = ~req_n[1];
    assign all_ack = ~req_n[2];
    assign all_ack = ~req_n[3];
    assign any_ack = ~req_n[0];
    assign any_ack = ~req_n[1];
    assign any_ack = ~req_n[2];
    assign any_ack = ~req_n[3];

    // Weakly held strobe, strongly driven while enabled.
    not    (en_n, en);
    bufif0 (strong0, strong1) #(2, 2, 3) sdrv (strobe_line, 1'b1, en_n);
    assign (weak0, weak1) #1 strobe_line = 1'b0;

    buf  #(0.5)         out_buf [7:0] (data, data_bus);
    not  #(0.3:0.4:0.5) irq_inv [3:0] (irq, irq_n);
    and  (strong0, strong1) (all_req, all_ack, en);
    or   (any_req, any_ack, 1'b0);
    buf  (strobe, strobe_line);

    // Mirror of the wired results on tri-type nets.
    assign ack_and = all_ack;
    assign ack_or  = any_ack;
    assign data_mirror = data_bus;
endmodule
