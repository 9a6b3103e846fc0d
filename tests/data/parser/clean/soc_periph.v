// Peripherals of the small SoC: a GPIO port with edge interrupts and a
// down-counting timer with reload.
`ifndef SOC_DEFS_LOADED
    `include "soc_defs_missing.vh"
`endif

module soc_gpio (
    input  wire                   clk,
    input  wire                   rst_n,
    input  wire                   we,
    input  wire [1:0]             addr,
    input  wire [31:0]            wdata,
    output reg  [31:0]            rdata,
    input  wire [`GPIO_WIDTH-1:0] pins_in,
    output wire [`GPIO_WIDTH-1:0] pins_out,
    output wire [`GPIO_WIDTH-1:0] pins_oe,
    output wire                   irq
);
    reg [`GPIO_WIDTH-1:0] out_r, oe_r, ie_r, pend, sync1, sync2, prev;

    always @(posedge clk or negedge rst_n)
        if (!rst_n) begin
            {out_r, oe_r, ie_r, pend} <= 0;
            {sync1, sync2, prev}      <= 0;
        end else begin
            sync1 <= pins_in;
            sync2 <= sync1;
            prev  <= sync2;
            pend  <= pend | (ie_r & (sync2 ^ prev));
            if (we)
                case (addr)
                    2'b00: out_r <= wdata[`GPIO_WIDTH-1:0];
                    2'b01: oe_r  <= wdata[`GPIO_WIDTH-1:0];
                    2'b10: ie_r  <= wdata[`GPIO_WIDTH-1:0];
                    2'b11: pend  <= pend & ~wdata[`GPIO_WIDTH-1:0];
                endcase
        end

    always @(*)
        case (addr)
            2'b00:   rdata = out_r;
            2'b01:   rdata = oe_r;
            2'b10:   rdata = sync2;
            default: rdata = pend;
        endcase

    assign pins_out = out_r;
    assign pins_oe  = oe_r;
    assign irq      = |pend;
endmodule

module soc_timer #(parameter BITS = `TIMER_BITS) (
    input  wire            clk,
    input  wire            rst_n,
    input  wire            we,
    input  wire            addr,
    input  wire [31:0]     wdata,
    output wire [31:0]     rdata,
    output reg             irq
);
    reg [BITS-1:0] count, reload;
    reg            run;

    always @(posedge clk or negedge rst_n)
        if (!rst_n) begin
            count  <= {BITS{1'b0}};
            reload <= {BITS{1'b1}};
            run    <= 1'b0;
            irq    <= 1'b0;
        end else if (we) begin
            if (addr) begin
                reload <= wdata[BITS-1:0];
                count  <= wdata[BITS-1:0];
            end else begin
                run <= wdata[0];
                irq <= irq & ~wdata[1];
            end
        end else if (run) begin
            if (count == {BITS{1'b0}}) begin
                count <= reload;
                irq   <= 1'b1;
            end else
                count <= count - 1'b1;
        end

    assign rdata = addr ? {{32-BITS{1'b0}}, count} : {30'b0, irq, run};
endmodule
