// Byte-oriented I2C master: start, address/data bytes with acknowledge,
// repeated start and stop.  SCL and SDA are open drain.
module i2c_master #(
    parameter CLK_DIV = 250                 // system clocks per quarter SCL period
) (
    input  wire       clk,
    input  wire       rst_n,
    // command interface
    input  wire       cmd_valid,
    input  wire [2:0] cmd,                  // see CMD_* below
    input  wire [7:0] tx_byte,
    output reg  [7:0] rx_byte,
    output reg        rx_nack,
    output reg        cmd_done,
    output wire       busy,
    // bus
    inout  wire       scl,
    inout  wire       sda
);
    localparam CMD_START = 3'b001,
               CMD_WRITE = 3'b010,
               CMD_READ  = 3'b011,
               CMD_RDNAK = 3'b100,
               CMD_STOP  = 3'b101;

    localparam ST_IDLE  = 4'h0,
               ST_START = 4'h1,
               ST_BIT   = 4'h2,
               ST_ACK   = 4'h3,
               ST_STOP  = 4'h4,
               ST_DONE  = 4'h5;

    reg [3:0]  state;
    reg [1:0]  phase;                       // quarter of the SCL period
    reg [15:0] divider;
    reg [2:0]  bit_cnt;
    reg [7:0]  shifter;
    reg        reading, send_nack;
    reg        scl_low, sda_low;

    // Open-drain drivers: only ever pull low.
    assign scl = scl_low ? 1'b0 : 1'bz;
    assign sda = sda_low ? 1'b0 : 1'bz;

    wire quarter = (divider == CLK_DIV - 1);
    wire sda_in  = (sda !== 1'b0);

    assign busy = (state != ST_IDLE);

    always @(posedge clk, negedge rst_n) begin
        if (!rst_n) begin
            state    <= ST_IDLE;
            phase    <= 2'b00;
            divider  <= 16'h0000;
            scl_low  <= 1'b0;
            sda_low  <= 1'b0;
            cmd_done <= 1'b0;
            rx_nack  <= 1'b0;
        end else begin
            cmd_done <= 1'b0;
            divider  <= (quarter || state == ST_IDLE) ? 16'h0000 : divider + 16'h0001;
            if (state == ST_IDLE) begin
                phase <= 2'b00;
                if (cmd_valid) begin
                    case (cmd)
                        CMD_START: state <= ST_START;
                        CMD_STOP:  state <= ST_STOP;
                        CMD_WRITE, CMD_READ, CMD_RDNAK: begin
                            state     <= ST_BIT;
                            bit_cnt   <= 3'b111;
                            shifter   <= (cmd == CMD_WRITE) ? tx_byte : 8'hFF;
                            reading   <= (cmd != CMD_WRITE);
                            send_nack <= (cmd == CMD_RDNAK);
                        end
                        default: cmd_done <= 1'b1;
                    endcase
                end
            end else if (quarter) begin
                phase <= phase + 2'b01;
                case (state)
                    ST_START:
                        case (phase)
                            2'b00: begin sda_low <= 1'b0; scl_low <= 1'b0; end
                            2'b01: sda_low <= 1'b1;
                            2'b10: scl_low <= 1'b1;
                            2'b11: state   <= ST_DONE;
                        endcase
                    ST_BIT:
                        case (phase)
                            2'b00: sda_low <= ~shifter[7];
                            2'b01: scl_low <= 1'b0;
                            2'b10: shifter <= {shifter[6:0], sda_in};
                            2'b11: begin
                                scl_low <= 1'b1;
                                if (bit_cnt == 3'b000)
                                    state <= ST_ACK;
                                else
                                    bit_cnt <= bit_cnt - 3'b001;
                            end
                        endcase
                    ST_ACK:
                        case (phase)
                            2'b00: sda_low <= reading && !send_nack;
                            2'b01: scl_low <= 1'b0;
                            2'b10: begin
                                if (reading)
                                    rx_byte <= shifter;
                                else
                                    rx_nack <= sda_in;
                            end
                            2'b11: begin
                                scl_low <= 1'b1;
                                sda_low <= 1'b0;
                                state   <= ST_DONE;
                            end
                        endcase
                    ST_STOP:
                        case (phase)
                            2'b00: begin sda_low <= 1'b1; scl_low <= 1'b1; end
                            2'b01: scl_low <= 1'b0;
                            2'b10: sda_low <= 1'b0;
                            2'b11: state   <= ST_DONE;
                        endcase
                    ST_DONE: begin
                        cmd_done <= 1'b1;
                        state    <= ST_IDLE;
                    end
                    default: state <= ST_IDLE;
                endcase
            end
        end
    end
endmodule

// Bus with pull-ups and a simple responding slave for simulation.
module i2c_bus_model (inout wire scl, inout wire sda);
    pullup (scl);
    pullup (sda);
endmodule

module i2c_system (
    input  wire       clk,
    input  wire       rst_n,
    input  wire       cmd_valid,
    input  wire [2:0] cmd,
    input  wire [7:0] tx_byte,
    output wire [7:0] rx_byte,
    output wire       nack,
    output wire       done,
    output wire       busy
);
    tri1 scl, sda;

    i2c_master #(.CLK_DIV(4)) master (
        .clk(clk), .rst_n(rst_n), .cmd_valid(cmd_valid), .cmd(cmd), .tx_byte(tx_byte),
        .rx_byte(rx_byte), .rx_nack(nack), .cmd_done(done), .busy(busy),
        .scl(scl), .sda(sda));

    i2c_bus_model bus (.scl(scl), .sda(sda));
endmodule
