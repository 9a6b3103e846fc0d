// UART transmitter: 8 data bits, optional even/odd parity, one or two stop bits.
module uart_tx #(
    parameter CLKS_PER_BIT = 16'd868
) (
    input  wire       clk,
    input  wire       rst,
    input  wire       parity_en,
    input  wire       parity_odd,
    input  wire       two_stop,
    input  wire [7:0] data,
    input  wire       start,
    output reg        txd,
    output wire       busy
);
    localparam [2:0] IDLE   = 3'b000,
                     START  = 3'b001,
                     DATA   = 3'b010,
                     PARITY = 3'b011,
                     STOP1  = 3'b100,
                     STOP2  = 3'b101;

    reg [2:0]  state;
    reg [15:0] tick;
    reg [2:0]  bitno;
    reg [7:0]  shifter;
    reg        par;

    wire bit_done = (tick == CLKS_PER_BIT - 1);

    assign busy = (state != IDLE);

    always @(posedge clk) begin
        if (rst) begin
            state <= IDLE;
            txd   <= 1'b1;
            tick  <= 16'h0000;
        end else begin
            tick <= bit_done || state == IDLE ? 16'h0000 : tick + 16'h0001;
            case (state)
                IDLE: begin
                    txd <= 1'b1;
                    if (start) begin
                        shifter <= data;
                        par     <= parity_odd;
                        bitno   <= 3'b000;
                        state   <= START;
                        txd     <= 1'b0;
                    end
                end
                START:
                    if (bit_done) begin
                        txd   <= shifter[0];
                        state <= DATA;
                    end
                DATA:
                    if (bit_done) begin
                        par     <= par ^ shifter[0];
                        shifter <= shifter >> 1;
                        bitno   <= bitno + 3'b001;
                        if (bitno == 3'b111) begin
                            state <= parity_en ? PARITY : STOP1;
                            txd   <= parity_en ? par ^ shifter[0] : 1'b1;
                        end else
                            txd <= shifter[1];
                    end
                PARITY:
                    if (bit_done) begin
                        txd   <= 1'b1;
                        state <= STOP1;
                    end
                STOP1:
                    if (bit_done)
                        state <= two_stop ? STOP2 : IDLE;
                STOP2:
                    if (bit_done)
                        state <= IDLE;
                default:
                    state <= IDLE;
            endcase
        end
    end
endmodule
