// APB register block whose ports, register map and feature set come from
// macros.  Compiled with BUS_WIDTH and the protocol flavour on the command
// line.
`include "bus_cfg.vh"
`timescale 1ns / 1ps

`define WAIT_CYCLES 1
`ifdef BUS_HAS_WAIT
    `define READY_LOGIC(cnt) (cnt == `WAIT_CYCLES)
`else
    `define READY_LOGIC(cnt) 1'b1
`endif

module apb_regs #(
    parameter [31:0] RESET_CTRL = `CTRL_RESET_VALUE,
    parameter        N_EVENTS   = 4
) (
    input  wire                  pclk,
    input  wire                  presetn,
    input  wire                  psel,
    input  wire                  penable,
    input  wire                  pwrite,
    input  wire [11:0]           paddr,
    input  wire [`BUS_WIDTH-1:0] pwdata,
`ifdef BUS_HAS_STRB
    input  wire [`BUS_BYTES-1:0] pstrb,
`endif
    output reg  [`BUS_WIDTH-1:0] prdata,
    output wire                  pready,
    output wire                  pslverr,
    input  wire [7:0]            hw_status,
    input  wire [N_EVENTS-1:0]   hw_events,
    output wire                  irq,
    output wire [1:0]            mode,
    output wire                  enable
);
    localparam EV = `MAX(N_EVENTS, `MIN(8, `BUS_WIDTH));

    reg [`BUS_WIDTH-1:0] ctrl, scratch;
    reg [EV-1:0]         irq_en, irq_stat;
    reg [1:0]            wait_cnt;

    wire access = psel & penable;
    wire wr     = access & pwrite & pready;
    wire [`BUS_WIDTH-1:0] wmask;

`ifdef BUS_HAS_STRB
    genvar lane;
    generate
        for (lane = 0; lane < `BUS_BYTES; lane = lane + 1) begin : strb
            assign wmask[lane*8 +: 8] = {8{pstrb[lane]}};
        end
    endgenerate
`else
    assign wmask = {`BUS_WIDTH{1'b1}};
`endif

    always @(posedge pclk or negedge presetn)
        if (!presetn)
            wait_cnt <= 2'b00;
        else if (psel && !pready)
            wait_cnt <= wait_cnt + 2'b01;
        else
            wait_cnt <= 2'b00;

    assign pready  = `READY_LOGIC(wait_cnt);
    assign pslverr = access && (paddr > `REG_ID);

    always @(posedge pclk or negedge presetn) begin
        if (!presetn) begin
            ctrl     <= RESET_CTRL;
            scratch  <= {`BUS_WIDTH{1'b0}};
            irq_en   <= {EV{1'b0}};
            irq_stat <= {EV{1'b0}};
        end else begin
            irq_stat <= `SET_BITS(irq_stat, hw_events);
            if (wr)
                case (paddr)
                    `REG_CTRL:     ctrl     <= (ctrl & ~wmask) | (pwdata & wmask);
                    `REG_IRQ_EN:   irq_en   <= pwdata[EV-1:0];
                    `REG_IRQ_STAT: irq_stat <= `CLR_BITS(irq_stat, pwdata[EV-1:0]);
                    `REG_SCRATCH:  scratch  <= `STRB_LANE(scratch, pwdata, wmask, 0) |
                                               (scratch & ~32'h0000_00FF);
                    default: ;
                endcase
        end
    end

    always @* begin
        prdata = {`BUS_WIDTH{1'b0}};
        case (paddr)
            `REG_CTRL:     prdata = ctrl;
            `REG_STATUS:   prdata[7:0] = hw_status;
            `REG_IRQ_EN:   prdata[EV-1:0] = irq_en;
            `REG_IRQ_STAT: prdata[EV-1:0] = irq_stat;
            `REG_SCRATCH:  prdata = scratch;
            `REG_ID:       prdata = `BLOCK_ID;
            default:       prdata = {`BUS_WIDTH{1'b0}};
        endcase
    end

    assign irq    = |(irq_stat & irq_en);
    assign mode   = `FIELD(ctrl, 2, 1);
    assign enable = ctrl[`CTRL_ENABLE];

    initial
        $display("%m: %s bus, %0d bits, %0d event inputs", `BUS_FLAVOUR, `BUS_WIDTH, N_EVENTS);
endmodule

`undef READY_LOGIC
`undef WAIT_CYCLES

`ifdef READY_LOGIC
    `error_this_branch_is_never_compiled
`endif
