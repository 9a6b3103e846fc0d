// cpu8 core: a three-state (fetch, decode, execute) machine over a
// single-ported byte memory.  Instructions are two bytes, high byte first.
`include "cpu8_defs.vh"

module cpu8_core #(
    parameter RESET_PC = 8'h00
) (
    input  wire                    clk,
    input  wire                    rst_n,
    output reg  [`CPU8_ADDR_W-1:0] mem_addr,
    output reg  [`CPU8_DATA_W-1:0] mem_wdata,
    output reg                     mem_we,
    input  wire [`CPU8_DATA_W-1:0] mem_rdata,
    output wire                    halted
);
    localparam S_FETCH_HI = 3'b000,
               S_FETCH_LO = 3'b001,
               S_DECODE   = 3'b010,
               S_MEM      = 3'b011,
               S_WB       = 3'b100,
               S_HALT     = 3'b101;

    reg [2:0]               state
    reg [`CPU8_ADDR_W-1:0]  pc;
    reg [15:0]              ir;
    reg                     flag_z, flag_c;

    wire [3:0] opcode = `OP_FIELD(ir);
    wire [1:0] rd     = `RD_FIELD(ir);
    wire [1:0] rs     = `RS_FIELD(ir);
    wire [7:0] imm    = `IMM_FIELD(ir);

    // Register file and ALU
    wire [`CPU8_DATA_W-1:0] ra, rb, alu_y;
    wire                    alu_c, alu_z, alu_n;
    reg                     rf_we;
    reg  [`CPU8_DATA_W-1:0] rf_wdata;
    reg  [2:0]              alu_fn;

    cpu8_regfile rf (
        .clk(clk), .rst_n(rst_n),
        .we(rf_we), .waddr(rd), .wdata(rf_wdata),
        .raddr_a(rd), .rdata_a(ra),
        .raddr_b(rs), .rdata_b(rb)
    );

    cpu8_alu alu (.a(ra), .b(rb), .fn(alu_fn), .y(alu_y),
                  .carry(alu_c), .zero(alu_z), .negative(alu_n));

    always @* begin
        case (opcode)
            `OP_ADD: alu_fn = `ALU_ADD;
            `OP_SUB: alu_fn = `ALU_SUB;
            `OP_AND: alu_fn = `ALU_AND;
            `OP_OR:  alu_fn = `ALU_OR;
            `OP_XOR: alu_fn = `ALU_XOR;
            `OP_SHL: alu_fn = `ALU_SHL;
            `OP_SHR: alu_fn = `ALU_SHR;
            default: alu_fn = `ALU_PASS;
        endcase
    end

    assign halted = (state == S_HALT);

    always @(posedge clk or negedge rst_n) begin
        if (!rst_n) begin
            state     <= S_FETCH_HI;
            pc        <= RESET_PC;
            ir        <= 16'h0000;
            flag_z    <= 1'b0;
            flag_c    <= 1'b0;
            mem_addr  <= RESET_PC;
            mem_wdata <= 8'h00;
            mem_we    <= 1'b0;
            rf_we     <= 1'b0;
            rf_wdata  <= 8'h00;
        end else begin
            rf_we  <= 1'b0;
            mem_we <= 1'b0;
            case (state)
                S_FETCH_HI: begin
                    ir[15:8] <= mem_rdata;
                    pc       <= pc + 8'h01;
                    mem_addr <= pc + 8'h01;
                    state    <= S_FETCH_LO;
                end
                S_FETCH_LO: begin
                    ir[7:0]  <= mem_rdata;
                    pc       <= pc + 8'h01;
                    state    <= S_DECODE;
                end
                S_DECODE: begin
                    state <= S_FETCH_HI;
                    mem_addr <= pc;
                    case (opcode)
                        `OP_NOP: ;
                        `OP_LDI: begin rf_we <= 1'b1; rf_wdata <= imm; end
                        `OP_LD:  begin mem_addr <= imm; state <= S_MEM; end
                        `OP_ST:  begin
                                     mem_addr  <= imm;
                                     mem_wdata <= ra;
                                     mem_we    <= 1'b1;
                                     state     <= S_WB;
                                 end
                        `OP_MOV: begin rf_we <= 1'b1; rf_wdata <= rb; end
                        `OP_JMP: begin pc <= imm; mem_addr <= imm; end
                        `OP_JZ:  if (flag_z) begin pc <= imm; mem_addr <= imm; end
                        `OP_JC:  if (flag_c) begin pc <= imm; mem_addr <= imm; end
                        `OP_HLT: state <= S_HALT;
                        default: begin
                            rf_we    <= 1'b1;
                            rf_wdata <= alu_y;
                            flag_z   <= alu_z;
                            flag_c   <= alu_c;
                        end
                    endcase
                end
                S_MEM: begin
                    rf_we    <= 1'b1;
                    rf_wdata <= mem_rdata;
                    mem_addr <= pc;
                    state    <= S_FETCH_HI;
                end
                S_WB: begin
                    mem_addr <= pc;
                    state    <= S_FETCH_HI;
                end
                default: state <= S_HALT;
            endcase
        end
    end
endmodule
