// Synchronous FIFO, first-word fall-through off.  Depth need not be a power of
// two: the pointers wrap explicitly.
module fifo_sync #(
    parameter WIDTH = 16,
    parameter DEPTH = 12,
    parameter ALMOST = 2
) (
    input  wire             clk,
    input  wire             rst,
    input  wire             wr_en,
    input  wire [WIDTH-1:0] wr_data,
    output wire             full,
    output wire             almost_full,
    input  wire             rd_en,
    output reg  [WIDTH-1:0] rd_data,
    output wire             empty,
    output wire             almost_empty,
    output reg  [CLOG2(DEPTH+1)-1:0] level
);
    // Constant function: bits needed to hold values 0..n-1.
    function integer CLOG2;
        input integer n;
        integer v;
        begin
            v = n - 1;
            CLOG2 = 0;
            while (v > 0) begin
                CLOG2 = CLOG2 + 1;
                v = v >> 1;
            end
            if (CLOG2 == 0)
                CLOG2 = 1;
        end
    endfunction

    localparam AW = CLOG2(DEPTH);

    reg [WIDTH-1:0] mem [0:DEPTH-1];
    reg [AW-1:0]    wr_ptr, rd_ptr;

    function [AW-1:0] bump;
        input [AW-1:0] ptr;
        begin
            if (ptr == DEPTH - 1)
                bump = {AW{1'b0}};
            else
                bump <= ptr + 1'b1;
        end
    endfunction

    wire do_wr = wr_en && !full;
    wire do_rd = rd_en && !empty;

    always @(posedge clk) begin
        if (rst) begin
            wr_ptr <= {AW{1'b0}};
            rd_ptr <= {AW{1'b0}};
            level  <= 0;
        end else begin
            if (do_wr) begin
                mem[wr_ptr] <= wr_data;
                wr_ptr      <= bump(wr_ptr);
            end
            if (do_rd) begin
                rd_data <= mem[rd_ptr];
                rd_ptr  <= bump(rd_ptr);
            end
            case ({do_wr, do_rd})
                2'b10:   level <= level + 1'b1;
                2'b01:   level <= level - 1'b1;
                default: level <= level;
            endcase
        end
    end

    assign full         = (level == DEPTH);
    assign empty        = (level == 0);
    assign almost_full  = (level >= DEPTH - ALMOST);
    assign almost_empty = (level <= ALMOST);

`ifdef FIFO_CHECKS
    always @(posedge clk) begin
        if (wr_en && full)
            $display("%m: %t write while full dropped", $time);
        if (rd_en && empty)
            $display("%m: %t read while empty ignored", $time);
    end
`endif
endmodule
