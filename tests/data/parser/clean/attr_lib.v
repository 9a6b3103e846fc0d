// Parameterised building blocks annotated with attributes for the tools
// downstream (synthesis directives, source tracking, clocking hints).
(* library_cell = 0, author = "tarn" *)
module cfg_reg #(
    parameter WIDTH = 8,
    parameter [WIDTH-1:0] RESET = {WIDTH{1'b0}}
) (
    (* clock *)  input  wire             clk,
    (* reset *)  input  wire             rst_n,
                 input  wire             we,
                 input  wire [WIDTH-1:0] d,
    (* keep *)   output reg  [WIDTH-1:0] q
);
    always @(posedge clk or negedge rst_n)
        if (!rst_n)
            q <= RESET;
        else if (we)
            q <= d;
endmodule

module sync_bits #(parameter N = 1, parameter STAGES = 2) (
    input  wire         clk,
    input  wire [N-1:0] async_in,
    output wire [N-1:0] sync_out
);
    (* async_reg = "true", shreg_extract = "no" *)
    reg [N-1:0] chain [0:STAGES-1];
    integer s;

    always @(posedge clk) begin
        chain[0] <= async_in;
        for (s = 1; s < STAGES; s = s + 1)
            chain[s] <= chain[s-1];
    end

    assign sync_out = chain[STAGES-1];
endmodule

module pulse_gen #(parameter LENGTH = 4) (
    input  wire clk,
    input  wire trigger,
    output wire pulse
);
    (* fsm_encoding = "one_hot" *) reg [1:0] state;
    reg [7:0] count;

    localparam IDLE = 2'b01, BUSY = 2'b10;

    function [7:0] dec (input [7:0] v);
        dec = v - 8'h01;
    endfunction

    always @(posedge clk)
        (* parallel_case, full_case *)
        case (state)
            IDLE: if (trigger) begin
                      state <= BUSY;
                      count <= LENGTH;
                  end
            BUSY: begin
                      count <= dec (* inline *) (count);
                      if (count == 8'h01)
                          state <= IDLE;
                  end
            default: state <= IDLE;
        endcase

    initial state = IDLE;

    assign pulse = (state == BUSY);
endmodule

module mac_slice #(parameter AW = 8, parameter BW = 8) (
    input  wire                  clk,
    input  wire [AW-1:0]         a,
    input  wire [BW-1:0]         b,
    input  wire [AW+BW+1:0]      cin,
    output reg  [AW+BW+1:0]      cout
);
    (* use_dsp = "yes" *)
    wire [AW+BW-1:0] prod = a * (* mult_style = "pipe" *) b;

    always @(posedge clk)
        cout <= cin + (* carry_chain *) prod;
endmodule
