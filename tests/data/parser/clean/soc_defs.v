// Global definitions of the small SoC.  This file is given first on the
// command line; SOC_CLK_MHZ and SIMULATION normally come from there too.
`timescale 1ns / 1ps

`ifndef SOC_CLK_MHZ
`define SOC_CLK_MHZ 100
`endif

`define SOC_NAME    "tinysoc"
`define UART_BAUD   115200
`define DIVISOR(clk_mhz, baud)  (((clk_mhz) * 1000000 + (baud) / 2) / (baud))

`define GPIO_WIDTH  8
`define IRQ_LINES   4
`define TIMER_BITS  24

// Address decode on paddr[15:12]
`define ADDR_UART   4'h1
`define ADDR_GPIO   4'h2
`define ADDR_TIMER  4'h3
`define ADDR_SRAM   4'h8

`ifdef SIMULATION
`define SOC_ASSERT(cond, msg) if (!(cond)) $display("%m ASSERTION FAILED at %0t: %s", $time, msg)
`else
`define SOC_ASSERT(cond, msg)
`endif

`define SOC_DEFS_LOADED
