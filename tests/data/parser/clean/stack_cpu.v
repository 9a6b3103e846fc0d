// A small stack machine: 16-bit data stack and return stack, 8-bit
// instructions, literals pushed with a prefix bit.  The stack depth and
// the multiplier option are selected with macros.
`ifdef STACK_DEEP
    `define DS_DEPTH 32
    `define DS_PTR_W 5
`elsif STACK_SHALLOW
    `define DS_DEPTH 8
    `define DS_PTR_W 3
`else
    `define DS_DEPTH 16
    `define DS_PTR_W 4
`endif

`define I_LIT   8'b1???_????           // push 7-bit literal
`define I_ADD   8'b0000_0001
`define I_SUB   8'b0000_0010
`define I_AND   8'b0000_0011
`define I_XOR   8'b0000_0100
`define I_DUP   8'b0000_0101
`define I_DROP  8'b0000_0110
`define I_OVER  8'b0000_1000
`define I_MUL   8'b0000_1001
`define I_JZ    8'b0001_0???           // jump to T if N is zero, pop both
`define I_CALL  8'b0010_0000
`define I_RET   8'b0010_0001
`define I_LOAD  8'b0011_0000
`define I_STORE 8'b0011_0001
`define I_HALT  8'b0111_1111

macromodule stack16 (
    input  wire        clk,
    input  wire        push,
    input  wire        pop,
    input  wire [15:0] din,
    output wire [15:0] top,
    output wire [15:0] second,
    output reg  [`DS_PTR_W-1:0] depth
);
    reg [15:0] cells [0:`DS_DEPTH-1];

    always @(posedge clk)
        case ({push, pop})
            2'b10: begin cells[depth] <= din; depth <= depth + 1'b1; end
            2'b01: depth <= depth - 1'b1;
            2'b11: cells[depth - 1'b1] <= din;      // replace top
            default: ;
        endcase

    assign top    = cells[depth - 1'b1];
    assign second = cells[depth - 2'b10];

    initial depth = {`DS_PTR_W{1'b0}};
endmodule

module stack_cpu (
    input  wire        clk,
    input  wire        rst,
    output reg  [7:0]  pc,
    input  wire [7:0]  instr,
    output reg  [7:0]  dmem_addr,
    output reg  [15:0] dmem_wdata,
    output reg         dmem_we,
    input  wire [15:0] dmem_rdata,
    output reg         halted
);
    reg         ds_push, ds_pop, rs_push, rs_pop;
    reg  [15:0] ds_din, rs_din;
    wire [15:0] t, n, r, unused_r2;
    wire [`DS_PTR_W-1:0] ds_depth, rs_depth;

    stack16 ds (.clk(clk), .push(ds_push), .pop(ds_pop), .din(ds_din),
                .top(t), .second(n), .depth(ds_depth));
    stack16 rs (.clk(clk), .push(rs_push), .pop(rs_pop), .din(rs_din),
                .top(r), .second(unused_r2), .depth(rs_depth));

    always @* begin
        {ds_push, ds_pop, rs_push, rs_pop} = 4'b0000;
        ds_din     = 16'h0000;
        rs_din     = {8'h00, pc + 8'h01};
        dmem_we    = 1'b0;
        dmem_addr  = t[7:0];
        dmem_wdata = n;
        casez (instr)
            `I_LIT:   begin ds_push = 1'b1; ds_din = {9'b0, instr[6:0]}; end
            `I_ADD:   begin ds_pop = 1'b1; ds_push = 1'b1; ds_din = n + t; end
            `I_SUB:   begin ds_pop = 1'b1; ds_push = 1'b1; ds_din = n - t; end
            `I_AND:   begin ds_pop = 1'b1; ds_push = 1'b1; ds_din = n & t; end
            `I_XOR:   begin ds_pop = 1'b1; ds_push = 1'b1; ds_din = n ^ t; end
`ifdef STACK_NO_MUL
`else
            `I_MUL:   begin ds_pop = 1'b1; ds_push = 1'b1; ds_din = n[7:0] * t[7:0]; end
`endif
            `I_DUP:   begin ds_push = 1'b1; ds_din = t; end
            `I_DROP:  ds_pop = 1'b1;
            `I_OVER:  begin ds_push = 1'b1; ds_din = n; end
            `I_CALL:  begin rs_push = 1'b1; ds_pop = 1'b1; end
            `I_RET:   rs_pop = 1'b1;
            `I_LOAD:  begin ds_pop = 1'b1; ds_push = 1'b1; ds_din = dmem_rdata; end
            `I_STORE: begin ds_pop = 1'b1; dmem_we = 1'b1; end
            default:  ;
        endcase
    end

    always @(posedge clk)
        if (rst) begin
            pc     <= 8'h00;
            halted <= 1'b0;
        end else if (!halted)
            casez (instr)
                `I_JZ:   pc <= (n == 16'h0000) ? t[7:0] : pc + 8'h01;
                `I_CALL: pc <= t[7:0];
                `I_RET:  pc <= r[7:0];
                `I_HALT: halted <= 1'b1;
                default: pc <= pc + 8'h01;
            endcase
endmodule
