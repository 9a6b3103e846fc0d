// Tasks and functions: constant functions in parameter expressions,
// recursion through automatic functions, ANSI and old-style argument
// declarations, signed and real results, tasks with outputs and timing.
module math_lib #(
    parameter N     = 10,
    parameter DEPTH = 200
) (
    input  wire        clk,
    input  wire [7:0]  x,
    output reg  [15:0] y,
    output wire [ADDR_BITS-1:0] addr_max
);
    // Constant functions evaluated at elaboration time.
    function integer log2_ceil;
        input integer v;
        integer r;
        begin
            r = 0;
            while ((1 << r) < v)
                r = r + 1;
            log2_ceil = r;
        end
    endfunction

    function automatic integer fib (input integer k);
        if (k < 2)
            fib = k;
        else
            fib = fib(k - 1) + fib(k - 2);
    endfunction

    function automatic [63:0] factorial (input [5:0] k);
        factorial = (k <= 1) ? 64'd1 : k * factorial(k - 1);
    endfunction

    localparam ADDR_BITS = log2_ceil(DEPTH);
    localparam FIB_N     = fib(N);
    localparam [63:0] FACT_12 = factorial(12);

    assign addr_max = DEPTH - 1;

    // Plain functions used by the logic.
    function [7:0] swap_nibbles; input [7:0] b; swap_nibbles = {b[3:0], b[7:4]}; endfunction

    function [3:0] count_ones (input [7:0] v);
        integer i;
        begin : count
            count_ones = 4'h0;
            for (i = 0; i < 8; i = i + 1)
                count_ones = count_ones + v[i];
        end
    endfunction

    function signed [15:0] scale;
        input signed [7:0] v;
        input        [2:0] shift;
        reg   signed [15:0] wide;
        begin
            wide  = v;
            scale = wide <<< shift;
        end
    endfunction

    function real to_volts (input [7:0] code, input real vref);
        to_volts = vref * code / 255.0;
    endfunction

    reg [15:0] acc;

    always @(posedge clk) begin
        acc <= acc + count_ones(x);
        y   <= {swap_nibbles(x), x} ^ scale(x, 3'b010) ^ acc;
    end

    initial begin
        acc = 16'h0000;
        $display("%m: ADDR_BITS=%0d FIB(%0d)=%0d 12!=%0d", ADDR_BITS, N, FIB_N, FACT_12);
        $display("%m: code 128 at 3.3 V = %f V", to_volts(8'h80, 3.3));
    end
endmodule

module bus_master;
    reg        clk, req, we;
    reg  [7:0] addr, wdata;
    wire [7:0] rdata;
    wire       ack;
    reg  [7:0] shadow [0:255];
    integer    errors;

    bus_slave slave (.clk(clk), .req(req), .we(we), .addr(addr), .wdata(wdata),
                     .rdata(rdata), .ack(ack));

    initial clk = 1'b0;
    always #5 clk = ~clk;

    function [7:0] expected (input [7:0] a);
        begin
            log_value(a);
            expected = shadow[a];
        end
    endfunction

    task log_value (input [7:0] v);
        $display("%t value %h", $time, v);
    endtask

    // One bus transaction; waits for the slave's acknowledge.
    task automatic xfer (input write, input [7:0] a, input [7:0] d, output [7:0] q);
        begin
            @(negedge clk);
            req   = 1'b1;
            we    = write;
            addr  = a;
            wdata = d;
            @(posedge clk);
            while (!ack) @(posedge clk);
            q = rdata;
            #1 req = 1'b0;
        end
    endtask

    task write_block;
        input [7:0] base;
        input [7:0] count;
        reg   [7:0] k, dummy;
        begin
            for (k = 0; k < count; k = k + 1) begin
                xfer(1'b1, base + k, k ^ 8'h5A, dummy);
                shadow[base + k] = k ^ 8'h5A;
            end
        end
    endtask

    task check_block;
        input  [7:0] base;
        input  [7:0] count;
        output integer bad;
        reg    [7:0] k, got;
        begin
            bad = 0;
            for (k = 0; k < count; k = k + 1) begin
                xfer(1'b0, base + k, 8'h00, got);
                if (got !== expected(base + k)) begin
                    bad = bad + 1;
                    log_value(got);
                end
            end
        end
    endtask

    initial begin
        req = 1'b0;
        we  = 1'b0;
        write_block(8'h10, 8'h08);
        check_block(8'h10, 8'h08, errors);
        $display("errors: %0d", errors);
        $finish;
    end
endmodule

module bus_slave (
    input  wire       clk,
    input  wire       req,
    input  wire       we,
    input  wire [7:0] addr,
    input  wire [7:0] wdata,
    output reg  [7:0] rdata,
    output reg        ack
);
    reg [7:0] mem [0:255];

    // Combinational checksum of a word and its address, used to fill reads
    // of locations that were never written.
    function [7:0] fill;
        input [7:0] a;
        reg   [7:0] t;
        begin
            t    = a ^ 8'hFF;
            fill = t + (a >> 1);
        end
    endfunction

    always @(posedge clk) begin
        ack <= req & ~ack;
        if (req && !ack) begin
            if (we)
                mem[addr] <= wdata;
            rdata <= (mem[addr] === 8'hxx) ? fill(addr) : mem[addr];
        end
    end
endmodule
