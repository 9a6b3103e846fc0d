// Verilog-1995 bus-functional model of an asynchronous SRAM interface and
// a directed test that uses it.  Define VERBOSE to trace every access.
`timescale 1ns / 100ps

module sram_async (addr, data, ce_n, oe_n, we_n);
    parameter AW = 10, DW = 8, T_ACC = 12;
    input  [AW-1:0] addr;
    inout  [DW-1:0] data;
    input           ce_n, oe_n, we_n;

    reg    [DW-1:0] mem [0:(1<<AW)-1];
    reg    [DW-1:0] dout;
    wire            reading;

    assign reading = !ce_n && !oe_n && we_n;
    assign data    = reading ? dout : {DW{1'bz}};

    always @(addr or reading)
        if (reading)
            dout = #T_ACC mem[addr];

    always @(posedge we_n)
        if (!ce_n)
            mem[addr] = data;
endmodule

module sram_bfm (addr, data, ce_n, oe_n, we_n);
    parameter AW = 10, DW = 8;
    output [AW-1:0] addr;
    inout  [DW-1:0] data;
    output          ce_n, oe_n, we_n;

    reg    [AW-1:0] addr;
    reg    [DW-1:0] drive;
    reg             ce_n, oe_n, we_n, driving;
    integer         n_reads, n_writes;
    event           access_done;

    assign data = driving ? drive : {DW{1'bz}};

    initial
    begin
        ce_n     = 1;
        oe_n     = 1;
        we_n     = 1;
        driving  = 0;
        n_reads  = 0;
        n_writes = 0;
    end

    task write;
        input [AW-1:0] a;
        input [DW-1:0] d;
        begin
            addr    = a;
            drive   = d;
            driving = 1;
            #2 ce_n = 0;
            #1 we_n = 0;
            #10 we_n = 1;
            #1 ce_n = 1;
            driving = 0;
            n_writes = n_writes + 1;
`ifdef VERBOSE
            $display("%t BFM write [%h] = %h", $time, a, d);
`endif
            -> access_done;
        end
    endtask

    task read;
        input  [AW-1:0] a;
        output [DW-1:0] d;
        begin
            addr = a;
            #2 ce_n = 0;
            oe_n = 0;
            #15 d = data;
            oe_n = 1;
            ce_n = 1;
            n_reads = n_reads + 1;
`ifdef VERBOSE
            $display("%t BFM read  [%h] = %h", $time, a, d);
`else
            if (^d === 1'bx)
                $display("%t BFM read of [%h] returned unknown bits", $time, a);
`else
`endif
            -> access_done;
        end
    endtask
endmodule

module sram_test;
    wire [9:0] addr;
    wire [7:0] data;
    wire       ce_n, oe_n, we_n;
    reg  [7:0] got;
    integer    i, errors;

    sram_bfm   bfm (addr, data, ce_n, oe_n, we_n);
    sram_async ram (addr, data, ce_n, oe_n, we_n);

    initial
    begin : run
        errors = 0;
        #5;
        for (i = 0; i < 32; i = i + 1)
            bfm.write(i * 3, i ^ 8'h3C);
        for (i = 0; i < 32; i = i + 1)
        begin
            bfm.read(i * 3, got);
            if (got !== (i ^ 8'h3C))
            begin
                errors = errors + 1;
                $display("mismatch at %0d: %h", i * 3, got);
            end
        end
        fork : watchdog
            begin
                @(bfm.access_done);
                disable watchdog;
            end
            begin
                bfm.read(10'h3FF, got);
            end
            #100 disable watchdog;
        join
        $display("%0d writes, %0d reads, %0d errors",
                 bfm.n_writes, bfm.n_reads, errors);
        $finish;
    end
endmodule
