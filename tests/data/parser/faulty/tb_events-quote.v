// Self-checking testbench for a small request/grant arbiter: named events,
// fork/join with disable, intra-assignment timing controls, force/release,
// procedural assign/deassign, real and time arithmetic and file output.
`timescale 1ns / 100ps

module rr_arbiter (
    input  wire       clk,
    input  wire       rst,
    input  wire [3:0] req,
    output reg  [3:0] grant
);
    reg [1:0] last;
    integer   k;
    reg       found;

    always @(posedge clk)
        if (rst) begin
            grant <= 4'b0000;
            last  <= 2'b11;
        end else begin
            grant <= 4'b0000;
            found  = 1'b0;
            for (k = 1; k <= 4; k = k + 1)
                if (!found && req[(last + k) % 4]) begin
                    grant[(last + k) % 4] <= 1'b1;
                    last  <= (last + k) % 4;
                    found  = 1'b1;
                end
        end
endmodule

module tb_events;
    reg        clk, rst;
    reg  [3:0] req;
    wire [3:0] grant;
    integer    seed, cycles, fd, n_grants [0:3];
    time       t_start, t_end;
    realtime   period;
    real       share, jitter;
    reg  [8*12:1] test_name;
    event      reset_done, test_done, \grant-seen ;

    rr_arbiter dut (.clk(clk), .rst(rst), .req(req), .grant(grant));

    initial begin
        clk    = 1'b0;
        period = 10.0;
        forever #(period / 2.0) clk = ~clk;
    end

    // Count grants per requester and check that at most one is given.
    always @(posedge clk) begin : monitor
        integer i;
        if (!rst)
            for (i = 0; i < 4; i = i + 1)
                if (grant[i]) begin
                    n_grants[i] = n_grants[i] + 1;
                    -> \grant-seen ;
                end
        casex (grant)
            4'b0000, 4'b0001, 4'b0010, 4'b0100, 4'b1000: ;
            4'b1xxx, 4'bx1xx, 4'bxx1x, 4'bxxx1:
                $display("ERROR %t: multiple or unknown grants %b", $time, grant);
        endcase
    end

    task apply_reset;
        begin
            rst = 1'b1;
            req = 4'b0000;
            repeat (3) @(posedge clk);
            rst <= #1 1'b0;
            req = @(posedge clk) 4'b0000;
            @(negedge clk) -> reset_done;
        end
    endtask

    task random_traffic (input integer n);
        integer c;
        begin
            for (c = 0; c < n; c = c + 1) begin
                req = $random(seed);
                @(posedge clk);
            end
            cycles = cycles + n;
        end
    endtask

    function real ratio (input integer part, input integer whole);
        begin
            ratio = 0.0;
            if (whole != 0)
                ratio = $itor(part) / $itor(whole);
        end
    endfunction

    initial begin : main
        integer r;
        seed      = 42;
        cycles    = 0;
        test_name = "arbiter_rr";
        for (r = 0; r < 4; r = r + 1)
            n_grants[r] = 0;
        fd = $fopen("tb_events.log");

        fork
            apply_reset;
            @(reset_done) $display("%t reset released, $time);
        join

        t_start = $time;
        fork : traffic
            begin
                random_traffic(200);
                disable traffic;
            end
            begin
                // watchdog: a grant must appear within 8 cycles of a request
                forever begin
                    wait (req != 4'b0000);
                    fork : watch
                        @(\grant-seen ) disable watch;
                        begin
                            repeat (8) @(posedge clk);
                            $display("ERROR %t: request starved", $time);
                            disable watch;
                        end
                    join
                    @(posedge clk);
                end
            end
            #(period * 400) begin
                $display("ERROR: traffic phase timed out");
                disable traffic;
            end
        join
        t_end = $time;

        // Force one request line high and check that it keeps being served.
        force req[2] = 1'b1;
        repeat (10) @(posedge clk);
        release req[2];
        req = repeat (2) @(posedge clk) 4'b0000;
        $display;

        // Hold the arbiter in reset through a procedural continuous assignment.
        assign rst = 1'b1;
        #(period * 2);
        deassign rst;
        rst = 1'b0;

        -> test_done;
    end

    initial begin
        @(test_done);
        jitter = 0.0;
        share  = ratio(n_grants[0], n_grants[0] + n_grants[1] + n_grants[2] + n_grants[3]);
        $fdisplay(fd, "%0s: %0d cycles in %0t, share of requester 0 = %f",
                  test_name, cycles, t_end - t_start, share);
        $strobe("%t grants: %0d %0d %0d %0d", $realtime,
                n_grants[0], n_grants[1], n_grants[2], n_grants[3]);
        $fclose(fd);
        #1 $finish;
    end
endmodule
