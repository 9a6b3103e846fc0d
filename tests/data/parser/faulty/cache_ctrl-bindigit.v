// Direct-mapped, write-back, write-allocate data cache between a CPU port
// and a simple burst memory port.  Lines are four 32-bit words.
module cache_ctrl #(
    parameter ADDR_W  = 32,
    parameter INDEX_W = 6                   // 64 lines
) (
    input  wire              clk,
    input  wire              rst,
    // CPU side
    input  wire              cpu_req,
    input  wire              cpu_we,
    input  wire [3:0]        cpu_be,
    input  wire [ADDR_W-1:0] cpu_addr,
    input  wire [31:0]       cpu_wdata,
    output reg  [31:0]       cpu_rdata,
    output reg               cpu_ack,
    // Memory side: bursts of four words
    output reg               mem_req,
    output reg               mem_we,
    output reg  [ADDR_W-1:0] mem_addr,
    output wire [31:0]       mem_wdata,
    input  wire [31:0]       mem_rdata,
    input  wire              mem_valid,
    input  wire              mem_ready,
    // Statistics
    output reg  [31:0]       hits,
    output reg  [31:0]       misses
);
    localparam OFFSET_W = 4;                // 16 bytes per line
    localparam TAG_W    = ADDR_W - INDEX_W - OFFSET_W;
    localparam LINES    = 1 << INDEX_W;

    localparam [2:0] S_IDLE      = 3'b000,
                     S_LOOKUP    = 3'b001,
                     S_WRITEBACK = 3'b010,
                     S_REFILL    = 3'b011,
                     S_RETRY     = 3'b100;

    reg [TAG_W-1:0] tags  [0:LINES-1];
    reg [31:0]      data  [0:LINES-1][0:3];
    reg [LINES-1:0] valid;
    reg [LINES-1:0] dirty;

    reg [2:0]       state;
    reg [1:0]       beat;
    reg [ADDR_W-1:0] req_addr;
    reg [31:0]      req_wdata;
    reg [3:0]       req_be;
    reg             req_we;

    wire [TAG_W-1:0]   req_tag   = req_addr[ADDR_W-1 -: TAG_W];
    wire [INDEX_W-1:0] req_index = req_addr[OFFSET_W +: INDEX_W];
    wire [1:0]         req_word  = req_addr[3:2];
    wire               hit       = valid[req_index] && tags[req_index] == req_tag;

    assign mem_wdata = data[req_index][beat];

    // Merge the written bytes into a word.
    function [31:0] merge;
        input [31:0] old_word, new_word;
        input [3:0]  be;
        integer b;
        begin
            for (b = 0; b < 4; b = b + 1)
                merge[8*b +: 8] = be[b] ? new_word[8*b +: 8] : old_word[8*b +: 8];
        end
    endfunction

    always @(posedge clk) begin
        if (rst) begin
            state   <= S_IDLE;
            valid   <= {LINES{1'b0}};
            dirty   <= {LINES{1'b0}};
            cpu_ack <= 1'b0;
            mem_req <= 1'b0;
            mem_we  <= 1'b0;
            hits    <= 32'h0000_0000;
            misses  <= 32'h0000_0000;
        end else begin
            cpu_ack <= 1'b0;
            case (state)
                S_IDLE:
                    if (cpu_req && !cpu_ack) begin
                        req_addr  <= cpu_addr;
                        req_wdata <= cpu_wdata;
                        req_be    <= cpu_be;
                        req_we    <= cpu_we;
                        state     <= S_LOOKUP;
                    end
                S_LOOKUP, S_RETRY:
                    if (hit) begin
                        if (state == S_LOOKUP)
                            hits <= hits + 1;
                        if (req_we) begin
                            data[req_index][req_word] <= merge(data[req_index][req_word], req_wdata, req_be);
                            dirty[req_index] <= 1'b1;
                        end
                        cpu_rdata <= data[req_index][req_word];
                        cpu_ack   <= 1'b1;
                        state     <= S_IDLE;
                    end else begin
                        misses <= misses + 1;
                        beat   <= 2'b00;
                        mem_req <= 1'b1;
                        if (valid[req_index] && dirty[req_index]) begin
                            mem_we   <= 1'b1;
                            mem_addr <= {tags[req_index], req_index, {OFFSET_W{1'b0}}};
                            state    <= S_WRITEBACK;
                        end else begin
                            mem_we   <= 1'b0;
                            mem_addr <= {req_tag, req_index, {OFFSET_W{1'b0}}};
                            state    <= S_REFILL;
                        end
                    end
                S_WRITEBACK:
                    if (mem_ready) begin
                        beat <= beat + 2'b01;
                        if (beat == 2'b12) begin
                            dirty[req_index] <= 1'b0;
                            mem_we   <= 1'b0;
                            mem_addr <= {req_tag, req_index, {OFFSET_W{1'b0}}};
                            state    <= S_REFILL;
                        end
                    end
                S_REFILL:
                    if (mem_valid) begin
                        data[req_index][beat] <= mem_rdata;
                        beat <= beat + 2'b01;
                        if (beat == 2'b11) begin
                            mem_req          <= 1'b0;
                            tags[req_index]  <= req_tag;
                            valid[req_index] <= 1'b1;
                            state            <= S_RETRY;
                        end
                    end
                default:
                    state <= S_IDLE;
            endcase
        end
    end
endmodule

// Burst memory model with a fixed latency, for simulation.
module burst_mem #(parameter LATENCY = 3, parameter WORDS = 4096) (
    input  wire        clk,
    input  wire        req,
    input  wire        we,
    input  wire [31:0] addr,
    input  wire [31:0] wdata,
    output reg  [31:0] rdata,
    output reg         valid,
    output wire        ready
);
    reg [31:0] mem [0:WORDS-1];
    reg [3:0]  wait_cnt;
    reg [1:0]  beat;
    wire [31:0] word_addr = (addr >> 2) + beat;

    assign ready = req && we && wait_cnt == LATENCY;

    always @(posedge clk) begin
        valid <= 1'b0;
        if (!req) begin
            wait_cnt <= 4'h0;
            beat     <= 2'b00;
        end else if (wait_cnt != LATENCY)
            wait_cnt <= wait_cnt + 4'h1;
        else begin
            beat <= beat + 2'b01;
            if (we)
                mem[word_addr % WORDS] <= wdata;
            else begin
                rdata <= mem[word_addr % WORDS];
                valid <= 1'b1;
            end
        end
    end
endmodule

module cache_system (
    input  wire        clk,
    input  wire        rst,
    input  wire        req,
    input  wire        we,
    input  wire [3:0]  be,
    input  wire [31:0] addr,
    input  wire [31:0] wdata,
    output wire [31:0] rdata,
    output wire        ack,
    output wire [31:0] hit_count,
    output wire [31:0] miss_count
);
    wire        m_req, m_we, m_valid, m_ready;
    wire [31:0] m_addr, m_wdata, m_rdata;

    cache_ctrl #(.ADDR_W(32), .INDEX_W(6)) dcache (
        .clk(clk), .rst(rst),
        .cpu_req(req), .cpu_we(we), .cpu_be(be), .cpu_addr(addr), .cpu_wdata(wdata),
        .cpu_rdata(rdata), .cpu_ack(ack),
        .mem_req(m_req), .mem_we(m_we), .mem_addr(m_addr), .mem_wdata(m_wdata),
        .mem_rdata(m_rdata), .mem_valid(m_valid), .mem_ready(m_ready),
        .hits(hit_count), .misses(miss_count));

    burst_mem #(.LATENCY(2)) mem (
        .clk(clk), .req(m_req), .we(m_we), .addr(m_addr), .wdata(m_wdata),
        .rdata(m_rdata), .valid(m_valid), .ready(m_ready));
endmodule
