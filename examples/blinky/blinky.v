// A small design to try tarn on: a prescaled LED blinker with a
// parameterised counter and a synchroniser, in Verilog-2001 style.
`timescale 1ns / 1ps
`include "blinky_defs.vh"

module blinky #(parameter WIDTH = `BLINKY_WIDTH) (
    input  wire clk,
    input  wire rst_n,
    input  wire enable_async,
    output wire led
);
    wire enable;
    wire [WIDTH-1:0] count;

    sync2 u_sync (.clk(clk), .d(enable_async), .q(enable));
    counter #(.WIDTH(WIDTH)) u_count (.clk(clk), .rst_n(rst_n), .en(enable), .q(count));

    assign led = count[WIDTH-1];
endmodule

module counter #(parameter WIDTH = 8) (
    input  wire             clk,
    input  wire             rst_n,
    input  wire             en,
    output reg  [WIDTH-1:0] q
);
    always @(posedge clk or negedge rst_n)
        if (!rst_n)
            q <= {WIDTH{1'b0}};
        else if (en)
            q <= q + 1'b1;
endmodule

module sync2 (input wire clk, input wire d, output reg q);
    reg meta;
    always @(posedge clk) begin
        meta <= d;
        q    <= meta;
    end
endmodule
