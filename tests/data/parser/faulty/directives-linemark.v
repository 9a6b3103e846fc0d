// Output of a netlist generator: every compiler directive that affects how
// the following modules are read, with line markers back to the generator's
// source.
`resetall
`timescale 10ns / 1ns
`default_nettype none
`suppress_faults
`enable_portfaults

// Pad ring cells: the input pad has no drive of its own, the core sees a
// pulled-up value when the pin floats.
`celldefine
`unconnected_drive pull1
module PAD_IN (PAD, C, PE);
    input  PAD;
    output C;
    input  PE;           // pull enable, left unconnected in most instances
    wire   PAD, C, PE;
    wire   pulled;
    bufif1 (weak0, weak1) pull (pulled, 1'b1, PE);
    buf    #(0.2) drv (C, PAD);
endmodule
`nounconnected_drive

module PAD_OUT (PAD, I, OE);
    output PAD;
    input  I, OE;
    wire   PAD, I, OE;
    bufif1 #(0.4, 0.3, 0.5) drv (PAD, I, OE);
endmodule
`endcelldefine

`timescale 1ns / 1ps
`line 1 "netgen/core.nv" 0
module core_logic (input wire clk, input wire [3:0] a, output reg [3:0] y);
    wire [3:0] inc
    assign inc = a + 4'h1;
    always @(posedge clk)
        y <= inc;
endmodule
`line 1 "netgen/chip.nv" 0

`protect
module core_secret (input wire [3:0] k, output wire [3:0] h);
    assign h = {k[0] ^ k[3], k[3:1]};
endmodule
`endprotect

`uselib lib=pads
module chip (
    inout  wire       clk_pad,
    inout  wire [3:0] a_pad,
    inout  wire [3:0] y_pad,
    input  wire       oe
);
    wire       clk;
    wire [3:0] a, y, h;

    PAD_IN  p_clk (.PAD(clk_pad), .C(clk), .PE());
    PAD_IN  p_a0  (a_pad[0], a[0], );
    PAD_IN  p_a1  (a_pad[1], a[1], );
    PAD_IN  p_a2  (a_pad[2], a[2], );
    PAD_IN  p_a3  (a_pad[3], a[3], 1'b0);
`uselib
    core_logic  u_core (.clk(clk), .a(a), .y(y));
    core_secret u_key  (.k(y), .h(h));
    PAD_OUT p_y0 (y_pad[0], h[0], oe);
    PAD_OUT p_y1 (y_pad[1], h[1], oe);
    PAD_OUT p_y2 (y_pad[2], h[2], oe);
    PAD_OUT p_y3 (y_pad[3], h[3], oe);
endmodule

`disable_portfaults
`nosuppress_faults
`resetall
