// SPI master with run-time CPOL/CPHA, configurable word length and bit
// order, optional slave-select decoder.  SPI_MULTI_SS selects the decoder.
`timescale 1ns / 1ps
`define SPI_MAX_BITS 32

module spi_master #(
    parameter BITS      = 8,
    parameter LSB_FIRST = 0,
    parameter DIV_W     = 8
) (
    input  wire             clk,
    input  wire             rst,
    input  wire             cpol,
    input  wire             cpha,
    input  wire [DIV_W-1:0] half_period,
    input  wire             start,
    input  wire [BITS-1:0]  tx,
    output reg  [BITS-1:0]  rx,
    output reg              done,
    output wire             busy,
    output reg              sclk,
    output wire             mosi,
    input  wire             miso,
    output reg              ss_n
);
    reg [DIV_W-1:0] div;
    reg [BITS-1:0]  sh_tx, sh_rx;
    reg [5:0]       edges;                 // two per bit
    reg             active;

    wire tick       = (div == half_period);
    wire lead_edge  = tick && !edges[0];
    wire trail_edge = tick &&  edges[0];
    wire sample     = cpha ? trail_edge : lead_edge;
    wire shift      = cpha ? lead_edge  : trail_edge;

    generate
        if (LSB_FIRST) begin : lsb
            assign mosi = sh_tx[0];
        end else begin : msb
            assign mosi = sh_tx[BITS-1];
        end
    endgenerate

    assign busy = active;

    always @(posedge clk)
        if (rst) begin
            active <= 1'b0;
            done   <= 1'b0;
            ss_n   <= 1'b1;
            sclk   <= 1'b0;
            div    <= {DIV_W{1'b0}};
        end else begin
            done <= 1'b0;
            if (!active) begin
                sclk <= cpol;
                if (start) begin
                    active <= 1'b1;
                    ss_n   <= 1'b0;
                    sh_tx  <= tx;
                    edges  <= 6'd0;
                    div    <= {DIV_W{1'b0}};
                end
            end else begin
                div <= tick ? {DIV_W{1'b0}} : div + 1'b1;
                if (tick) begin
                    sclk  <= ~sclk;
                    edges <= edges + 6'd1;
                end
                if (sample)
                    sh_rx <= LSB_FIRST ? {miso, sh_rx[BITS-1:1]} : {sh_rx[BITS-2:0], miso};
                if (shift && !(cpha && edges == 6'd0))
                    sh_tx <= LSB_FIRST ? sh_tx >> 1 : sh_tx << 1;
                if (tick && edges == 2 * BITS - 1) begin
                    active <= 1'b0;
                    ss_n   <= 1'b1;
                    done   <= 1'b1;
                    rx     <= LSB_FIRST ? {miso, sh_rx[BITS-1:1]} : {sh_rx[BITS-2:0], miso};
                end
            end
        end

    initial
        if (BITS > `SPI_MAX_BITS)
            $display("%m: BITS=%0d exceeds %0d", BITS, `SPI_MAX_BITS);
endmodule

module spi_port (
    input  wire        clk,
    input  wire        rst,
    input  wire [1:0]  target,
    input  wire        go,
    input  wire [15:0] word,
    output wire [15:0] reply,
    output wire        ready,
    output wire        sclk,
    output wire        mosi,
    input  wire        miso,
`ifdef SPI_MULTI_SS
    output wire [3:0]  ss_n
`else
    output wire        ss_n
`endif
);
    wire busy, ss_single;

    spi_master #(.BITS(16), .LSB_FIRST(0), .DIV_W(4)) core (
        .clk(clk), .rst(rst), .cpol(1'b0), .cpha(1'b1), .half_period(4'h3),
        .start(go), .tx(word), .rx(reply), .done(ready), .busy(busy),
        .sclk(sclk), .mosi(mosi), .miso(miso), .ss_n(ss_single));

`ifdef SPI_MULTI_SS
    assign ss_n = ss_single ? 4'b1111 : ~(4'b0001 << target);
`else
    assign ss_n = ss_single;
`endif
endmodule
