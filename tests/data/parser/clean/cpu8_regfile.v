// Four general registers, two read ports, one write port; r0 reads as written.
`include "cpu8_defs.vh"

module cpu8_regfile (clk, rst_n, we, waddr, wdata, raddr_a, rdata_a, raddr_b, rdata_b);
    input                         clk;
    input                         rst_n;
    input                         we;
    input  [1:0]                  waddr;
    input  [`CPU8_DATA_W-1:0]     wdata;
    input  [1:0]                  raddr_a;
    output [`CPU8_DATA_W-1:0]     rdata_a;
    input  [1:0]                  raddr_b;
    output [`CPU8_DATA_W-1:0]     rdata_b;

    reg [`CPU8_DATA_W-1:0] regs [0:3];
    integer i;

    always @(posedge clk or negedge rst_n)
        if (!rst_n)
            for (i = 0; i < 4; i = i + 1)
                regs[i] <= {`CPU8_DATA_W{1'b0}};
        else if (we)
            regs[waddr] <= wdata;

    assign rdata_a = regs[raddr_a];
    assign rdata_b = regs[raddr_b];
endmodule
