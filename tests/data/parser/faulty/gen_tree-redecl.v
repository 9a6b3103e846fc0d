// Population count and sum reduction by a recursive tree of generate blocks:
// the module instantiates itself on both halves until one leaf remains.
module sum_tree #(
    parameter N = 8,          // number of operands
    parameter W = 4,          // operand width
    parameter PIPE = 0        // register every level when 1
) (
    input  wire              clk,
    input  wire [N*W-1:0]    in,
    output wire [W+LG-1:0]   sum
);
    // Levels of the tree: ceil(log2(N)).
    function integer clog2;
        input integer value;
        begin
            clog2 = 0;
            for (value = value - 1; value > 0; value = value >> 1)
                clog2 = clog2 + 1;
        end
    endfunction

    localparam LG = clog2(N);
    localparam NL = N / 2;            // operands in the left half
    localparam NR = N - NL;

    generate
        if (N == 1) begin : leaf
            assign sum = in;
        end else begin : node
            localparam LGL = clog2(NL);
            localparam LGR = clog2(NR);
            wire [W+LGL-1:0] left_sum;
            wire [W+LGR-1:0] left_sum;
            wire [W+LG-1:0]  total;

            sum_tree #(.N(NL), .W(W), .PIPE(PIPE)) left  (.clk(clk), .in(in[NL*W-1:0]),   .sum(left_sum));
            sum_tree #(.N(NR), .W(W), .PIPE(PIPE)) right (.clk(clk), .in(in[N*W-1:NL*W]), .sum(right_sum));

            assign total = left_sum + right_sum;

            if (PIPE) begin : stage
                reg [W+LG-1:0] total_q;
                always @(posedge clk)
                    total_q <= total;
                assign sum = total_q;
            end else begin : comb
                assign sum = total;
            end
        end
    endgenerate
endmodule

module popcount #(parameter W = 32) (
    input  wire                clk,
    input  wire [W-1:0]        bits,
    output wire [5:0]          count
);
    sum_tree #(.N(W), .W(1), .PIPE(0)) tree (.clk(clk), .in(bits), .sum(count));
endmodule

// Byte-wise checksum of a 16-byte block, pipelined.
module block_checksum (
    input  wire         clk,
    input  wire [127:0] block,
    output wire [11:0]  checksum
);
    sum_tree #(16, 8, 1) tree (clk, block, checksum);
endmodule

module tree_top (
    input  wire         clk,
    input  wire [31:0]  word,
    input  wire [127:0] block,
    output wire [5:0]   ones,
    output wire [11:0]  csum
);
    popcount #(32)  pc (.clk(clk), .bits(word), .count(ones));
    block_checksum  bc (.clk(clk), .block(block), .checksum(csum));
endmodule
