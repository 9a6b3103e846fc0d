// Behavioural memory models: single-port RAM with byte enables, simple
// dual-port RAM, a banked RAM held in a two-dimensional array, a ROM
// loaded from a hex file and a small lookup table written as a case.
module spram_be #(
    parameter AW = 10,
    parameter NB = 4              // byte lanes
) (
    input  wire            clk,
    input  wire            en,
    input  wire [NB-1:0]   we,
    input  wire [AW-1:0]   addr,
    input  wire [8*NB-1:0] din,
    output reg  [8*NB-1:0] dout
);
    reg [8*NB-1:0] mem [0:(1<<AW)-1];
    integer lane;

    always @(posedge clk)
        if (en) begin
            for (lane = 0; lane < NB; lane = lane + 1)
                if (we[lane])
                    mem[addr][lane*8 +: 8] <= din[lane*8 +: 8];
            dout <= mem[addr];
        end
endmodule

module dpram #(
    parameter DW = 18,
    parameter AW = 9,
    parameter INIT_FILE = ""
) (
    input  wire          wclk,
    input  wire          we,
    input  wire [AW-1:0] waddr,
    input  wire [DW-1:0] wdata,
    input  wire          rclk,
    input  wire [AW-1:0] raddr,
    output reg  [DW-1:0] rdata
);
    reg [DW-1:0] ram [(1<<AW)-1:0];

    initial
        if (INIT_FILE != "")
            $readmemh(INIT_FILE, ram);

    always @(posedge wclk)
        if (we)
            ram[waddr] <= wdata;

    always @(posedge rclk)
        rdata <= ram[raddr];
endmodule

module banked_ram (
    input  wire        clk,
    input  wire [1:0]  bank,
    input  wire [5:0]  row,
    input  wire [2:0]  col,
    input  wire        we,
    input  wire [15:0] wdata,
    output reg  [15:0] rdata,
    output wire [3:0]  parity
);
    // Four banks of 64 rows of 8 columns of 16-bit words.
    reg [15:0] cells [0:3][0:63][0:7];
    reg [3:0]  last_parity [0:3];

    always @(posedge clk) begin
        if (we) begin
            cells[bank][row][col] <= wdata;
            last_parity[bank]     <= {^wdata[15:12], ^wdata[11:8], ^wdata[7:4], ^wdata[3:0]};
        end
        rdata <= cells[bank][row][col];
    end

    assign parity = last_parity[bank];
endmodule

module rom_sine (
    input  wire       clk,
    input  wire [5:0] phase,
    output reg  [7:0] sample
);
    // Quarter-wave table, mirrored for the other three quarters.
    reg  [7:0] quarter;
    wire [3:0] idx = phase[4] ? ~phase[3:0] : phase[3:0];

    always @(idx)
        case (idx)
            4'h0: quarter = 8'h00;  4'h1: quarter = 8'h0C;
            4'h2: quarter = 8'h19;  4'h3: quarter = 8'h25;
            4'h4: quarter = 8'h31;  4'h5: quarter = 8'h3C;
            4'h6: quarter = 8'h47;  4'h7: quarter = 8'h51;
            4'h8: quarter = 8'h5A;  4'h9: quarter = 8'h62;
            4'hA: quarter = 8'h6A;  4'hB: quarter = 8'h70;
            4'hC: quarter = 8'h75;  4'hD: quarter = 8'h79;
            4'hE: quarter = 8'h7C;  4'hF: quarter = 8'h7E;
        endcase

    always @(posedge clk)
        sample <= phase[5] ? 0'h80 - quarter : 8'h80 + quarter;
endmodule

module mem_system (
    input  wire        clk,
    input  wire [9:0]  addr,
    input  wire [31:0] wdata,
    input  wire [3:0]  be,
    output wire [31:0] rdata,
    output wire [17:0] trace,
    output wire [15:0] bank_data,
    output wire [3:0]  bank_par,
    output wire [7:0]  wave
);
    spram_be #(.AW(10), .NB(4)) main_ram (
        .clk(clk), .en(1'b1), .we(be), .addr(addr), .din(wdata), .dout(rdata));

    dpram #(18, 9, "trace_init.hex") trace_ram (
        .wclk(clk), .we(|be), .waddr(addr[8:0]), .wdata(wdata[17:0]),
        .rclk(clk), .raddr(~addr[8:0]), .rdata(trace));

    banked_ram banks (
        .clk(clk), .bank(addr[9:8]), .row(addr[7:2]), .col({addr[1:0], be[0]}),
        .we(be[1]), .wdata(wdata[31:16]), .rdata(bank_data), .parity(bank_par));

    rom_sine sine (.clk(clk), .phase(addr[5:0]), .sample(wave));
endmodule
