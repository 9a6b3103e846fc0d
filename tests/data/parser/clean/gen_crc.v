// Parallel CRC generator for any polynomial and data width.  Each next-state
// bit is an XOR of selected state and data bits; the selections are computed
// at elaboration time by constant functions and unrolled with generate.
module crc_parallel #(
    parameter CW   = 16,                 // CRC width
    parameter DW   = 8,                  // data bits per clock
    parameter POLY = 16'h1021,           // CCITT
    parameter INIT = 16'hFFFF
) (
    input  wire          clk,
    input  wire          rst,
    input  wire          en,
    input  wire [DW-1:0] data,
    output reg  [CW-1:0] crc
);
    // Column `col` of the transition: which state bits (mode 0) or data bits
    // (mode 1) feed next-state bit `bitpos` after DW serial steps.
    function [CW+DW-1:0] feed_mask;
        input integer bitpos;
        reg [CW+DW-1:0] st [0:CW-1];
        reg [CW+DW-1:0] fb;
        integer k, n;
        begin
            // Each state bit starts as itself (columns 0..CW-1).
            for (k = 0; k < CW; k = k + 1)
                st[k] = {{CW+DW-1{1'b0}}, 1'b1} << k;
            // Serial steps, most significant data bit first.
            for (n = DW - 1; n >= 0; n = n - 1) begin
                fb = st[CW-1] ^ ({{CW+DW-1{1'b0}}, 1'b1} << (CW + n));
                for (k = CW - 1; k > 0; k = k - 1)
                    st[k] = st[k-1] ^ (POLY[k] ? fb : {CW+DW{1'b0}});
                st[0] = POLY[0] ? fb : {CW+DW{1'b0}};
            end
            feed_mask = st[bitpos];
        end
    endfunction

    wire [CW-1:0] next;

    genvar i;
    generate
        for (i = 0; i < CW; i = i + 1) begin : nbit
            localparam [CW+DW-1:0] M = feed_mask(i);
            assign next[i] = ^({data, crc} & M);
        end
    endgenerate

    always @(posedge clk)
        if (rst)
            crc <= INIT;
        else if (en)
            crc <= next;
endmodule

// Additive scrambler, x^7 + x^4 + 1, several bits per clock.
module scrambler #(parameter N = 4) (
    input  wire         clk,
    input  wire         rst,
    input  wire [N-1:0] din,
    output wire [N-1:0] dout
);
    reg  [6:0]   lfsr;
    wire [6:0]   st [0:N];
    wire [N-1:0] key;

    assign st[0] = lfsr;

    genvar b;
    generate
        for (b = 0; b < N; b = b + 1) begin : step
            assign key[b]    = st[b][6] ^ st[b][3];
            assign st[b + 1] = {st[b][5:0], key[b]};
        end
    endgenerate

    always @(posedge clk)
        lfsr <= rst ? 7'h7F : st[N];

    assign dout = din ^ key;
endmodule

module crc_unit (
    input  wire        clk,
    input  wire        rst,
    input  wire        valid,
    input  wire [7:0]  byte_in,
    output wire [15:0] crc16,
    output wire [31:0] crc32,
    output wire [7:0]  scrambled
);
    crc_parallel #(16, 8, 16'h1021, 16'hFFFF) c16 (clk, rst, valid, byte_in, crc16);
    crc_parallel #(.CW(32), .DW(8), .POLY(32'h04C1_1DB7), .INIT(32'hFFFF_FFFF))
        c32 (.clk(clk), .rst(rst), .en(valid), .data(byte_in), .crc(crc32));
    scrambler #(.N(8)) scr (.clk(clk), .rst(rst), .din(byte_in), .dout(scrambled));
endmodule
