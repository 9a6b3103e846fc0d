// Shared definitions of the cpu8 core: opcodes, ALU functions, field helpers.
`ifndef CPU8_DEFS_VH
`define CPU8_DEFS_VH

`define CPU8_DATA_W   8
`define CPU8_ADDR_W   8

// Instruction word: [15:12] opcode, [11:10] rd, [9:8] rs, [7:0] imm/address
`define OP_FIELD(i)   i[15:12]
`define RD_FIELD(i)   i[11:10]
`define RS_FIELD(i)   i[9:8]
`define IMM_FIELD(i)  i[7:0]

`define OP_NOP   4'h0
`define OP_LDI   4'h1
`define OP_LD    4'h2
`define OP_ST    4'h3
`define OP_MOV   4'h4
`define OP_ADD   4'h5
`define OP_SUB   4'h6
`define OP_AND   4'h7
`define OP_OR    4'h8
`define OP_XOR   4'h9
`define OP_SHL   4'hA
`define OP_SHR   4'hB
`define OP_JMP   4'hC
`define OP_JZ    4'hD
`define OP_JC    4'hE
`define OP_HLT   4'hF

`define ALU_ADD  3'b000
`define ALU_SUB  3'b001
`define ALU_AND  3'b010
`define ALU_OR   3'b011
`define ALU_XOR  3'b100
`define ALU_SHL  3'b101
`define ALU_SHR  3'b110
`define ALU_PASS 3'b111

`endif
