// mc4: a 4-bit accumulator microcontroller with a 16-word program ROM,
// 16 nibbles of RAM, one input and one output port.  Verilog-1995 only.
`default_nettype none

module mc4_rom (addr, data);
    input  [3:0] addr;
    output [7:0] data;

    // Program: count the input value down to zero on the output port.
    function [7:0] word;
        input [3:0] a;
        begin
            case (a)
                4'h0: word = {`MC4_IN,   4'h0};
                4'h1: word = {`MC4_STA,  4'h3};     // ram[3] = in
                4'h2: word = {`MC4_LDI,  4'h1};
                4'h3: word = {`MC4_STA,  4'h4};     // ram[4] = 1
                4'h4: word = {`MC4_LDA,  4'h3};
                4'h5: word = {`MC4_OUT,  4'h0};
                4'h6: word = {`MC4_JZ,   4'hA};
                4'h7: word = {`MC4_SUB,  4'h4};
                4'h8: word = {`MC4_STA,  4'h3};
                4'h9: word = {`MC4_JMP,  4'h4};
                4'hA: word = {`MC4_HALT, 4'h0};
                default: word = {`MC4_HALT, 4'h0};
            endcase
        end
    endfunction

    assign data = word(addr);
endmodule

module mc4_alu (op, acc, operand, result, carry);
    input  [3:0] op, acc, operand;
    output [3:0] result;
    output       carry;
    reg    [3:0] result;
    reg          carry;

    always @(op or acc or operand)
    begin
        carry = 1'b0;
        case (op)
            `MC4_ADD:  {carry, result} = acc + operand;
            `MC4_SUB:  {carry, result} = {1'b0, acc} - {1'b0, operand};
            `MC4_NAND: result = ~(acc & operand);
            default:   result = operand;
        endcase
    end
endmodule

module mc4 (clk, reset, in_port, out_port, out_strobe, halted);
    input        clk, reset;
    input  [3:0] in_port;
    output [3:0] out_port;
    output       out_strobe, halted;

    reg    [3:0] pc, acc, out_port;
    reg          zf, cf, out_strobe, halted;
    reg    [3:0] ram [0:15];
    wire   [7:0] instr;
    wire   [3:0] op, arg, alu_y;
    wire         alu_c;
    integer      i;

    assign op  = instr[7:4];
    assign arg = instr[3:0];

    mc4_rom rom (pc, instr);
    mc4_alu alu (op, acc, ram[arg], alu_y, alu_c);

    task clear_ram;
        begin
            for (i = 0; i < 16; i = i + 1)
                ram[i] = 4'h0;
        end
    endtask

    always @(posedge clk)
        if (reset)
        begin
            pc         <= 4'h0;
            acc        <= 4'h0;
            zf         <= 1'b0;
            cf         <= 1'b0;
            out_port   <= 4'h0;
            out_strobe <= 1'b0;
            halted     <= 1'b0;
            clear_ram;
        end
        else if (!halted)
        begin
            pc         <= pc + 1;
            out_strobe <= 1'b0;
            case (op)
                `MC4_LDI: acc <= arg;
                `MC4_LDA: begin acc <= ram[arg]; zf <= (ram[arg] == 4'h0); end
                `MC4_STA: ram[arg] <= acc;
                `MC4_ADD, `MC4_SUB, `MC4_NAND:
                    begin
                        acc <= alu_y;
                        zf  <= (alu_y == 4'h0);
                        cf  <= alu_c;
                    end
                `MC4_OUT: begin out_port <= acc; out_strobe <= 1'b1; end
                `MC4_IN:  acc <= in_port;
                `MC4_JMP: pc <= arg;
                `MC4_JZ:  if (zf) pc <= arg;
                `MC4_JC:  if (cf) pc <= arg;
                `MC4_HALT: begin halted <= 1'b1; pc <= pc; end
                default:  ;
            endcase
        end
endmodule
