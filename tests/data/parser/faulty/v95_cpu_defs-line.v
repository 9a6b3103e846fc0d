// Instruction set of the mc4 microcontroller (Verilog-1995 code base).
`timescale 1ns / 1ns

`define MC4_LDI  4'h0
`define MC4_LDA  4'h1
`define MC4_STA  4'h2
`define MC4_ADD  4'h3
`define MC4_SUB  4'h4
`define MC4_NAND 4'h5
`define MC4_OUT  4'h6
`define MC4_IN   4'h7
`define MC4_JMP  4'h8
`define MC4_JZ   4'h9
`define MC4_JC   4'hA
`define MC4_HALT 4'hF

`define MC4_PROG_LEN 16
`define line 16