// Loopback wrapper: the transmitter drives the receiver through a wire that
// a test can break with force/release.
`timescale 1ns / 1ps

module uart_top (
    input  wire       clk,
    input  wire       rst,
    input  wire [7:0] tx_data,
    input  wire       tx_start,
    output wire       tx_busy,
    output wire [7:0] rx_data,
    output wire       rx_valid,
    output wire       rx_error
);
    wire line;
    wire perr, ferr;

    uart_tx #(16) tx (
        .clk(clk), .rst(rst),
        .parity_en(1'b1), .parity_odd(1'b0), .two_stop(1'b0),
        .data(tx_data), .start(tx_start),
        .txd(line), .busy(tx_busy)
    );

    uart_rx #(.CLKS_PER_SAMPLE(1)) rx (
        .clk(clk), .rst(rst), .rxd(line),
        .parity_en(1'b1), .parity_odd(1'b0),
        .data(rx_data), .valid(rx_valid),
        .parity_err(perr), .frame_err(ferr)
    );

    assign rx_error = perr | ferr;
endmodule
