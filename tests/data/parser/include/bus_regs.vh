// Register map of the timer/GPIO peripheral.
`define REG_CTRL      `REG_ADDR(0)
`define REG_STATUS    `REG_ADDR(1)
`define REG_IRQ_EN    `REG_ADDR(2)
`define REG_IRQ_STAT  `REG_ADDR(3)
`define REG_SCRATCH   `REG_ADDR(4)
`define REG_ID        `REG_ADDR(5)

`define CTRL_ENABLE   0
`define CTRL_MODE     2:1
`define CTRL_RESET_VALUE 32'h0000_0001

`define BLOCK_ID      32'h4D42_0103
