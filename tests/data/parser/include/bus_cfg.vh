// Peripheral bus configuration: widths, protocol flavour and helper macros.
`ifndef BUS_CFG_VH
`define BUS_CFG_VH

`ifndef BUS_WIDTH
    `define BUS_WIDTH 32
`endif
`define BUS_BYTES (`BUS_WIDTH / 8)

// Protocol flavour: APB4 adds byte strobes and protection, APB3 adds
// wait states and error responses, plain APB has neither.
`ifdef BUS_APB4
    `define BUS_HAS_STRB
    `define BUS_HAS_WAIT
    `define BUS_FLAVOUR "apb4"
`elsif BUS_APB3
    `define BUS_HAS_WAIT
    `define BUS_FLAVOUR "apb3"
`else
    `define BUS_FLAVOUR "apb2"
`endif

`define MAX(a, b)          ((a) > (b) ? (a) : (b))
`define MIN(a, b)          ((a) < (b) ? (a) : (b))
`define FIELD(r, hi, lo)   r[hi:lo]
`define REG_ADDR(idx)      (12'h000 + ((idx) << 2))
`define SET_BITS(v, m)     ((v) | (m))
`define CLR_BITS(v, m)     ((v) & ~(m))

// Byte-lane write with strobes: lane i of old value v takes lane i of w
// when s[i] is set.
`define STRB_LANE(v, w, s, i) \
    ((s[i]) ? w[(i)*8 +: 8] /* new byte */ : v[(i)*8 +: 8])

`include "bus_regs.vh"

`endif
