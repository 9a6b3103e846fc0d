// UART receiver with 16x oversampling and majority vote on the middle samples.
module uart_rx #(
    parameter CLKS_PER_SAMPLE = 54
) (
    input  wire       clk,
    input  wire       rst,
    input  wire       rxd,
    input  wire       parity_en,
    input  wire       parity_odd,
    output reg  [7:0] data,
    output reg        valid,
    output reg        parity_err,
    output reg        frame_err
);
    reg [1:0] rxd_sync;
    reg [7:0] div;
    reg [3:0] sample;
    reg [3:0] bitno;
    reg [2:0] votes;
    reg       active;
    reg [8:0] shifter;
    reg       bit_value;

    wire tick = (div == CLKS_PER_SAMPLE - 1);
    wire rx   = rxd_sync[1];

    // Majority of the three samples around the bit centre.
    always @(votes)
        case (votes)
            3'b011, 3'b101, 3'b110, 3'b111: bit_value = 1'b1;
            default:                        bit_value = 1'b0;
        endcase

    always @(posedge clk) begin
        rxd_sync <= {rxd_sync[0], rxd};
        valid    <= 1'b0;
        if (rst) begin
            div        <= 8'h00;
            active     <= 1'b0;
            parity_err <= 1'b0;
            frame_err  <= 1'b0;
        end else begin
            div <= tick ? 8'h00 : div + 8'h01;
            if (!active) begin
                if (!rx) begin
                    active <= 1'b1;
                    sample <= 4'h0;
                    bitno  <= 4'h0;
                    div    <= 8'h00;
                end
            end else if (tick) begin
                sample <= sample + 4'h1;
                if (sample >= 4'h7 && sample <= 4'h9)
                    votes <= {votes[1:0], rx};
                if (sample == 4'hF) begin
                    bitno <= bitno + 4'h1;
                    if (bitno == 4'h0) begin
                        if (bit_value) active <= 1'b0;      // false start
                    end else if (bitno <= (parity_en ? 4'h9 : 4'h8)) begin
                        shifter <= {bit_value, shifter[8:1]};
                    end else begin
                        active    <= 1'b0;
                        valid     <= 1'b1;
                        frame_err <= ~bit_value;
                        if (parity_en) begin
                            data       <= shifter[8:1];
                            parity_err <= ^shifter ^ parity_odd;
                        end else begin
                            data       <= shifter[8:1];
                            parity_err <= 1'b0;
                        end
                    end
                end
            end
        end
    end
endmodule
