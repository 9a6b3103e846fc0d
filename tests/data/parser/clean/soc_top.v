// SoC top: a simple register bus from an external master to the GPIO and
// timer, with an interrupt combiner and a tick output derived from the
// UART divisor computed at elaboration.
module soc_top (
    input  wire                   clk,
    input  wire                   rst_n,
    input  wire                   bus_we,
    input  wire [15:0]            bus_addr,
    input  wire [31:0]            bus_wdata,
    output reg  [31:0]            bus_rdata,
    input  wire [`GPIO_WIDTH-1:0] gpio_in,
    output wire [`GPIO_WIDTH-1:0] gpio_out,
    output wire [`GPIO_WIDTH-1:0] gpio_oe,
    output wire [`IRQ_LINES-1:0]  irq,
    output reg                    baud_tick
);
    localparam integer BAUD_DIV = `DIVISOR(`SOC_CLK_MHZ, `UART_BAUD);

    wire [3:0]  sel = bus_addr[15:12];
    wire [31:0] gpio_rdata, timer_rdata;
    wire        gpio_irq, timer_irq;
    reg  [15:0] baud_cnt;

    soc_gpio gpio (
        .clk(clk), .rst_n(rst_n),
        .we(bus_we && sel == `ADDR_GPIO), .addr(bus_addr[3:2]),
        .wdata(bus_wdata), .rdata(gpio_rdata),
        .pins_in(gpio_in), .pins_out(gpio_out), .pins_oe(gpio_oe),
        .irq(gpio_irq));

    soc_timer #(.BITS(`TIMER_BITS)) timer (
        .clk(clk), .rst_n(rst_n),
        .we(bus_we && sel == `ADDR_TIMER), .addr(bus_addr[2]),
        .wdata(bus_wdata), .rdata(timer_rdata), .irq(timer_irq));

    always @*
        case (sel)
            `ADDR_GPIO:  bus_rdata = gpio_rdata;
            `ADDR_TIMER: bus_rdata = timer_rdata;
            default:     bus_rdata = 32'hDEAD_BEEF;
        endcase

    assign irq = {2'b00, timer_irq, gpio_irq};

    always @(posedge clk or negedge rst_n)
        if (!rst_n) begin
            baud_cnt  <= 16'h0000;
            baud_tick <= 1'b0;
        end else begin
            baud_tick <= (baud_cnt == BAUD_DIV - 1);
            baud_cnt  <= (baud_cnt == BAUD_DIV - 1) ? 16'h0000 : baud_cnt + 16'h0001;
        end

    always @(posedge clk)
        if (rst_n) begin
            `SOC_ASSERT(!(bus_we && sel == `ADDR_UART), "UART is not fitted");
        end

    initial
        $display("%s: %0d MHz, baud divisor %0d", `SOC_NAME, `SOC_CLK_MHZ, BAUD_DIV);
endmodule
