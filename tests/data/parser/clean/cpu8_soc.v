// cpu8 system: core plus a 256-byte memory preloaded with a small program
// that sums the numbers 1..10 into memory location 0x80.
`include "cpu8_defs.vh"
`timescale 1ns / 100ps

module cpu8_mem (
    input  wire       clk,
    input  wire [7:0] addr,
    input  wire [7:0] wdata,
    input  wire       we,
    output wire [7:0] rdata
);
    reg [7:0] bytes [0:255];
    integer k;

    // Assemble one two-byte instruction at a given address.
    task put;
        input [7:0] at;
        input [3:0] op;
        input [1:0] rd, rs;
        input [7:0] imm;
        begin
            bytes[at]        = {op, rd, rs};
            bytes[at + 8'h01] = imm;
        end
    endtask

    initial begin
        for (k = 0; k < 256; k = k + 1)
            bytes[k] = 8'h00;
        put(8'h00, `OP_LDI, 2'b00, 2'b00, 8'h00);   // r0 = 0  (sum)
        put(8'h02, `OP_LDI, 2'b01, 2'b00, 8'h0A);   // r1 = 10 (counter)
        put(8'h04, `OP_LDI, 2'b10, 2'b00, 8'h01);   // r2 = 1
        put(8'h06, `OP_ADD, 2'b00, 2'b01, 8'h00);   // r0 += r1
        put(8'h08, `OP_SUB, 2'b01, 2'b10, 8'h00);   // r1 -= 1
        put(8'h0A, `OP_JZ,  2'b00, 2'b00, 8'h0E);
        put(8'h0C, `OP_JMP, 2'b00, 2'b00, 8'h06);
        put(8'h0E, `OP_ST,  2'b00, 2'b00, 8'h80);
        put(8'h10, `OP_HLT, 2'b00, 2'b00, 8'h00);
    end

    always @(posedge clk)
        if (we)
            bytes[addr] <= wdata;

    assign rdata = bytes[addr];
endmodule

module cpu8_soc;
    reg clk, rst_n;
    wire [7:0] addr, wdata, rdata;
    wire       we, halted;

    cpu8_core #(.RESET_PC(8'h00)) core (
        .clk(clk), .rst_n(rst_n),
        .mem_addr(addr), .mem_wdata(wdata), .mem_we(we), .mem_rdata(rdata),
        .halted(halted)
    );

    cpu8_mem mem (.clk(clk), .addr(addr), .wdata(wdata), .we(we), .rdata(rdata));

    initial begin
        clk = 1'b0;
        forever #5 clk = ~clk;
    end

    initial begin
        rst_n = 1'b0;
        repeat (3) @(posedge clk);
        rst_n = 1'b1;
        wait (halted);
        $display("sum = %0d (expected 55)", mem.bytes[8'h80]);
        $finish;
    end
endmodule
