// Top level of the attribute/parameter example: parameter overrides by
// position and by name, defparam into nested instances, named and ordered
// port connections (some left open) and module instance arrays.
module sync_bits (
    input  wire       clk,
    input  wire       rst_n,
    input  wire [3:0] bus_d,
    input  wire       bus_we,
    input  wire [1:0] sel,
    input  wire       ext_trig,
    output wire       busy,
    output wire [7:0] mode_q
);
    wire [3:0] ctrl_q;
    wire       trig_sync;

    // Named override of one parameter; the reset value takes the default.
    cfg_reg #(.WIDTH(4)) ctrl (
        .clk(clk), .rst_n(rst_n), .we(bus_we && sel == 2'b00), .d(bus_d), .q(ctrl_q));

    // Positional override of both parameters.
    cfg_reg #(8, 8'hA5) mode (clk, rst_n, bus_we && sel == 2'b01, {bus_d, bus_d}, mode_q);

    (* src = "attr_top.v:25" *)
    sync_bits trig_sync_i (.clk(clk), .async_in(ext_trig), .sync_out(trig_sync));

    pulse_gen #(.LENGTH(6)) pg (.clk(clk), .trigger(trig_sync & ctrl_q[0]), .pulse(busy));
endmodule

module attr_top (
    input  wire        clk,
    input  wire        rst_n,
    input  wire [3:0]  bus_d,
    input  wire        bus_we,
    input  wire [1:0]  sel,
    input  wire [3:0]  triggers,
    input  wire [31:0] a_vec,
    input  wire [31:0] b_vec,
    output wire [3:0]  busy,
    output wire [7:0]  mode0,
    output wire [39:0] mac_out
);
    wire [7:0] mode1, mode2, mode3;
    wire [17:0] chain0, chain1, chain2, chain3;

    ctrl_block blk0 (.clk(clk), .rst_n(rst_n), .bus_d(bus_d), .bus_we(bus_we), .sel(sel),
                     .ext_trig(triggers[0]), .busy(busy[0]), .mode_q(mode0));
    ctrl_block blk1 (.clk(clk), .rst_n(rst_n), .bus_d(bus_d), .bus_we(1'b0), .sel(sel),
                     .ext_trig(triggers[1]), .busy(busy[1]), .mode_q(mode1));
    ctrl_block blk2 (clk, rst_n, bus_d, 1'b0, sel, triggers[2], busy[2], mode2);
    ctrl_block blk3 (clk, rst_n, bus_d, 1'b0, sel, triggers[3], busy[3], );

    // Deeper synchroniser and longer pulses for the second block only.
    defparam blk1.trig_sync_i.STAGES = 3;
    defparam blk1.pg.LENGTH = 12,
             blk1.mode.RESET = 8'h3C;

    // Four chained MAC slices as an instance array.
    mac_slice #(.AW(8), .BW(8)) macs [3:0] (
        .clk(clk),
        .a(a_vec),
        .b(b_vec),
        .cin({chain2, chain1, chain0, 18'h00000}),
        .cout({chain3, chain2, chain1, chain0})
    );

    assign mac_out = {mode3, chain3[17:0], 14'h0000};
    assign mode3   = mode1 ^ mode2;
endmodule
