`ifndef BLINKY_DEFS_VH
`define BLINKY_DEFS_VH
`define BLINKY_WIDTH 24
`endif
