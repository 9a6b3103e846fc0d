// Gate-level netlist as written by a synthesis tool: library cells, escaped
// identifiers carrying the original hierarchy and bus bits, constant nets,
// source attributes and positional and named cell connections.

// ---- minimal cell library ----
module sky_inv (input A, output Y);
    assign Y = ~A;
endmodule

module sky_nand2 (input A, input B, output Y);
    assign Y = ~(A & B);
endmodule

module sky_xor2 (input A, input B, output Y);
    assign Y = A ^ B;
endmodule

module sky_mux2 (input A0, input A1, input S, output X);
    assign X = S ? A1 : A0;
endmodule

module sky_dfrtp (input CLK, input D, input RESET_B, output reg Q);
    always @(posedge CLK or negedge RESET_B)
        if (!RESET_B) Q <= 1'b0;
        else          Q <= D;
endmodule

module sky_conb (output HI, output LO);
    assign HI = 1'b1;
    assign LO = 1'b0;
endmodule

// ---- synthesised design: 3-bit counter with load and parity ----
(* top = 1, src = "rtl/cnt3.v:3.1-24.10" *)
module cnt3 (clk, rst_n, load, din, q, parity);
    (* src = "rtl/cnt3.v:4.11-4.14" *)
    input clk;
    wire clk;
    input rst_n;
    wire rst_n;
    input load;
    wire load;
    input [2:0] din;
    wire [2:0] din;
    output [2:0] q;
    wire [2:0] q;
    output parity;
    wire parity;

    wire \u_cnt/cnt_reg[0] ;
    wire \u_cnt/cnt_reg[1] ;
    wire \u_cnt/cnt_reg[2] ;
    wire \u_cnt/next[0] ;
    wire \u_cnt/next[1] ;
    wire \u_cnt/next[1] ;
    wire \$abc$112$new_n9_ ;
    wire \$abc$112$new_n10_ ;
    wire \$abc$112$new_n12_ ;
    wire \$abc$112$new_n13_ ;
    wire \$abc$112$new_n15_ ;
    (* keep *) wire \const_hi ;
    wire const_lo;
    wire \u_par/t0 ;

    sky_conb ties (.HI(\const_hi ), .LO(const_lo));

    // bit 0: toggles
    sky_inv \$abc$112$auto_1 (.A(\u_cnt/cnt_reg[0] ), .Y(\$abc$112$new_n9_ ));
    // bit 1: q1 ^ q0
    sky_xor2 \$abc$112$auto_2 (.A(\u_cnt/cnt_reg[1] ), .B(\u_cnt/cnt_reg[0] ), .Y(\$abc$112$new_n10_ ));
    // bit 2: q2 ^ (q1 & q0)
    sky_nand2 \$abc$112$auto_3 (.A(\u_cnt/cnt_reg[1] ), .B(\u_cnt/cnt_reg[0] ), .Y(\$abc$112$new_n12_ ));
    sky_inv \$abc$112$auto_4 (\$abc$112$new_n12_ , \$abc$112$new_n13_ );
    sky_xor2 \$abc$112$auto_5 (\u_cnt/cnt_reg[2] , \$abc$112$new_n13_ , \$abc$112$new_n15_ );

    // load multiplexers
    sky_mux2 \u_cnt/mux0 (.A0(\$abc$112$new_n9_ ), .A1(din[0]), .S(load), .X(\u_cnt/next[0] ));
    sky_mux2 \u_cnt/mux1 (.A0(\$abc$112$new_n10_ ), .A1(din[1]), .S(load), .X(\u_cnt/next[1] ));
    sky_mux2 \u_cnt/mux2 (.A0(\$abc$112$new_n15_ ), .A1(din[2]), .S(load), .X(\u_cnt/next[2] ));

    (* src = "rtl/cnt3.v:12.5-16.8" *)
    sky_dfrtp \u_cnt/cnt_reg[0]$_DFF_PN0_ (.CLK(clk), .D(\u_cnt/next[0] ), .RESET_B(rst_n), .Q(\u_cnt/cnt_reg[0] ));
    (* src = "rtl/cnt3.v:12.5-16.8" *)
    sky_dfrtp \u_cnt/cnt_reg[1]$_DFF_PN0_ (.CLK(clk), .D(\u_cnt/next[1] ), .RESET_B(rst_n), .Q(\u_cnt/cnt_reg[1] ));
    (* src = "rtl/cnt3.v:12.5-16.8" *)
    sky_dfrtp \u_cnt/cnt_reg[2]$_DFF_PN0_ (.CLK(clk), .D(\u_cnt/next[2] ), .RESET_B(rst_n), .Q(\u_cnt/cnt_reg[2] ));

    // parity of the count
    sky_xor2 \u_par/x0 (.A(\u_cnt/cnt_reg[0] ), .B(\u_cnt/cnt_reg[1] ), .Y(\u_par/t0 ));
    sky_xor2 \u_par/x1 (.A(\u_par/t0 ), .B(\u_cnt/cnt_reg[2] ), .Y(parity));

    assign q = { \u_cnt/cnt_reg[2] , \u_cnt/cnt_reg[1] , \u_cnt/cnt_reg[0]  };
endmodule
