// Dual-clock FIFO with Gray-coded pointers and two-flop synchronisers.
module gray_sync #(parameter W = 4) (
    input  wire         clk,
    input  wire         rst_n,
    input  wire [W-1:0] d,
    output wire [W-1:0] q
);
    reg [W-1:0] meta, sync;
    always @(posedge clk or negedge rst_n)
        if (!rst_n) {sync, meta} <= {2*W{1'b0}};
        else        {sync, meta} <= {meta, d};
    assign q = sync;
endmodule

module fifo_async #(
    parameter DW = 8,
    parameter AW = 4
) (
    input  wire          wclk,
    input  wire          wrst_n,
    input  wire          winc,
    input  wire [DW-1:0] wdata,
    output reg           wfull,
    output wire [AW:0]   wused,
    input  wire          rclk,
    input  wire          rrst_n,
    input  wire          rinc,
    output wire [DW-1:0] rdata,
    output reg           rempty
);
    reg  [DW-1:0] mem [0:(1<<AW)-1];
    reg  [AW:0]   wbin, rbin, wgray, rgray;
    wire [AW:0]   wgray_next, rgray_next, wbin_next, rbin_next;
    wire [AW:0]   rgray_w, wgray_r;
    wire [AW:0]   rbin_w;

    // Binary to Gray and Gray to binary, bit by bit.
    genvar i;
    generate
        for (i = 0; i <= AW; i = i + 1) begin : g2b
            assign rbin_w[i] = ^rgray_w[AW:i];
        end
    endgenerate

    assign wused = wbin - rbin_w;

    assign wbin_next  = wbin + (winc & ~wfull);
    assign rbin_next  = rbin + (rinc & ~rempty);
    assign wgray_next = (wbin_next >> 1) ^ wbin_next;
    assign rgray_next = (rbin_next >> 1) ^ rbin_next;

    // Write side
    always @(posedge wclk or negedge wrst_n)
        if (!wrst_n) begin
            wbin  <= 0;
            wgray <= 0;
            wfull <= 1'b0;
        end else begin
            wbin  <= wbin_next;
            wgray <= wgray_next;
            wfull <= (wgray_next == {~rgray_w[AW:AW-1], rgray_w[AW-2:0]});
        end

    always @(posedge wclk)
        if (winc && !wfull)
            mem[wbin[AW-1:0]] <= wdata;

    // Read side
    always @(posedge rclk or negedge rrst_n)
        if (!rrst_n) begin
            rbin   <= 0;
            rgray  <= 0;
            rempty <= 1'b1;
        end else begin
            rbin   <= rbin_next;
            rgray  <= rgray_next;
            rempty <= (rgray_next == wgray_r);
        end

    assign rdata = mem[rbin[AW-1:0]];

    gray_sync #(.W(AW+1)) sync_r2w (.clk(wclk), .rst_n(wrst_n), .d(rgray), .q(rgray_w));
    generate
        gray_sync #(.W(AW+1)) sync_w2r (.clk(rclk), .rst_n(rrst_n), .d(wgray), .q(wgray_r));
    endgenerate
endmodule
