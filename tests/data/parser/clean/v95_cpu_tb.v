// Testbench for mc4: loads an input value, records every value written to
// the output port and stops at the halt or after a time-out.
module mc4_tb;
    reg        clk, reset;
    reg  [3:0] in_port;
    wire [3:0] out_port;
    wire       out_strobe, halted;
    integer    writes;
    time       t_halt;
    event      finished;

    mc4 dut (clk, reset, in_port, out_port, out_strobe, halted);

    always #10 clk = ~clk;

    always @(posedge clk)
        if (out_strobe)
        begin
            writes = writes + 1;
            $display("%t out = %d", $time, out_port);
        end

    initial
    begin
        clk     = 0;
        reset   = 1;
        in_port = 4'h5;
        writes  = 0;
        #25 reset = 0;
        fork : run
            begin
                wait (halted);
                t_halt = $time;
                -> finished;
                disable run;
            end
            begin
                #5000 $display("time-out");
                disable run;
            end
        join
        $display("%0d writes, halted at %0t", writes, t_halt);
        $finish;
    end
endmodule
