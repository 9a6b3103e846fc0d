#!/bin/sh
# Re-runs Icarus Verilog over the parser corpus: every clean compilation of
# MANIFEST.tsv must be accepted (-g2001, and -g1995 as well for the
# Verilog-1995 ones).  With --faulty it also compiles each faulty variant and
# compares acceptance with the iverilog_on_fault column.  A developer aid; CI
# does not run it.  Exit status 1 when a clean compilation is rejected.
cd "$(dirname "$0")" || exit 2
command -v iverilog >/dev/null 2>&1 || { echo "iverilog not found (apt-get install iverilog)" >&2; exit 2; }

faulty=0
[ "${1:-}" = --faulty ] && faulty=1
pass=0; fail=0; agree=0; differ=0

# Each faulty variant is stored as a unified diff against its clean file;
# they are made into files in a scratch tree (with clean/ and include/
# linked in) and compiled there.
if [ $faulty = 1 ]; then
    command -v patch >/dev/null 2>&1 || { echo "patch not found (apt-get install patch)" >&2; exit 2; }
    scratch=$(mktemp -d); trap 'rm -rf "$scratch"' EXIT
    mkdir "$scratch/faulty"
    ln -s "$PWD/clean" "$scratch/clean"; ln -s "$PWD/include" "$scratch/include"
    for d in faulty/*.diff; do
        base=$(basename "$d" .diff)
        patch -s -o "$scratch/faulty/$base.v" "clean/${base%-*}.v" < "$d" || exit 2
    done
fi

clean() {  # label, command...
    label=$1; shift
    if "$@" >/dev/null 2>&1; then
        pass=$((pass + 1)); echo "ok      $label"
    else
        fail=$((fail + 1)); echo "FAILED  $label: $*"
    fi
}

fault() {  # label, expected (accepts|rejects), command...
    [ $faulty = 1 ] || return 0
    label=$1; want=$2; shift 2
    if (cd "$scratch" && "$@" >/dev/null 2>&1); then got=accepts; else got=rejects; fi
    if [ $got = "$want" ]; then
        agree=$((agree + 1)); echo "ok      $label ($got)"
    else
        differ=$((differ + 1)); echo "DIFFERS $label: iverilog $got, manifest says $want: $*"
    fi
}

clean 'cpu8 -g2001' iverilog -g2001 -o /dev/null -Iinclude clean/cpu8_alu.v clean/cpu8_regfile.v clean/cpu8_core.v clean/cpu8_soc.v
clean 'fifo_sync -g2001' iverilog -g2001 -o /dev/null -DFIFO_CHECKS clean/fifo_sync.v
clean 'fifo_async -g2001' iverilog -g2001 -o /dev/null clean/fifo_async.v
clean 'uart -g2001' iverilog -g2001 -o /dev/null clean/uart_tx.v clean/uart_rx.v clean/uart_top.v
clean 'alu32 -g2001' iverilog -g2001 -o /dev/null clean/alu32.v
clean 'ram_models -g2001' iverilog -g2001 -o /dev/null clean/ram_models.v
clean 'adder_gates -g2001' iverilog -g2001 -o /dev/null clean/adder_gates.v
clean 'adder_gates -g1995' iverilog -g1995 -o /dev/null clean/adder_gates.v
clean 'cmos_cells -g2001' iverilog -g2001 -o /dev/null clean/cmos_cells.v
clean 'cmos_cells -g1995' iverilog -g1995 -o /dev/null clean/cmos_cells.v
clean 'bus_drivers -g2001' iverilog -g2001 -o /dev/null clean/bus_drivers.v
clean 'pass_switches -g2001' iverilog -g2001 -o /dev/null clean/pass_switches.v
clean 'udp_comb -g2001' iverilog -g2001 -o /dev/null clean/udp_comb.v
clean 'udp_comb -g1995' iverilog -g1995 -o /dev/null clean/udp_comb.v
clean 'udp_seq -g2001' iverilog -g2001 -o /dev/null clean/udp_seq.v
clean 'udp_seq -g1995' iverilog -g1995 -o /dev/null clean/udp_seq.v
clean 'udp_ansi -g2001' iverilog -g2001 -o /dev/null clean/udp_ansi.v
clean 'udp_jk -g2001' iverilog -g2001 -o /dev/null clean/udp_jk.v clean/jk_counter.v
clean 'udp_lib95 -g2001' iverilog -g2001 -o /dev/null clean/udp_lib95.v
clean 'udp_lib95 -g1995' iverilog -g1995 -o /dev/null clean/udp_lib95.v
clean 'gen_pipeline -g2001' iverilog -g2001 -o /dev/null clean/gen_pipeline.v
clean 'gen_crc -g2001' iverilog -g2001 -o /dev/null clean/gen_crc.v
clean 'gen_tree -g2001' iverilog -g2001 -o /dev/null clean/gen_tree.v
clean 'cells_specify -g2001' iverilog -g2001 -o /dev/null clean/cells_specify.v
clean 'cells_tchk -g2001' iverilog -g2001 -o /dev/null clean/cells_tchk.v
clean 'macro_bus -g2001' iverilog -g2001 -o /dev/null -Iinclude -DBUS_WIDTH=32 -DBUS_APB4 clean/macro_bus.v
clean 'macro_soc -g2001' iverilog -g2001 -o /dev/null -DSOC_CLK_MHZ=50 -DSIMULATION clean/soc_defs.v clean/soc_periph.v clean/soc_top.v
clean 'directives -g2001' iverilog -g2001 -o /dev/null clean/directives.v
clean 'v95_counter -g2001' iverilog -g2001 -o /dev/null clean/v95_counter.v
clean 'v95_counter -g1995' iverilog -g1995 -o /dev/null clean/v95_counter.v
clean 'v95_mult -g2001' iverilog -g2001 -o /dev/null clean/v95_mult.v
clean 'v95_mult -g1995' iverilog -g1995 -o /dev/null clean/v95_mult.v
clean 'v95_cpu -g2001' iverilog -g2001 -o /dev/null clean/v95_cpu_defs.v clean/v95_cpu.v clean/v95_cpu_tb.v
clean 'v95_cpu -g1995' iverilog -g1995 -o /dev/null clean/v95_cpu_defs.v clean/v95_cpu.v clean/v95_cpu_tb.v
clean 'tasks_funcs -g2001' iverilog -g2001 -o /dev/null clean/tasks_funcs.v
clean 'tb_events -g2001' iverilog -g2001 -o /dev/null clean/tb_events.v
clean 'attrs -g2001' iverilog -g2001 -o /dev/null clean/attr_lib.v clean/attr_top.v
clean 'numbers -g2001' iverilog -g2001 -o /dev/null clean/numbers.v
clean 'cache_ctrl -g2001' iverilog -g2001 -o /dev/null clean/cache_ctrl.v
clean 'i2c_master -g2001' iverilog -g2001 -o /dev/null clean/i2c_master.v
clean 'fir_filter -g2001' iverilog -g2001 -o /dev/null clean/fir_filter.v
clean 'v95_bfm -g2001' iverilog -g2001 -o /dev/null clean/v95_bfm.v
clean 'v95_bfm -g1995' iverilog -g1995 -o /dev/null clean/v95_bfm.v
clean 'stack_cpu -g2001' iverilog -g2001 -o /dev/null clean/stack_cpu.v
clean 'synth_netlist -g2001' iverilog -g2001 -o /dev/null clean/synth_netlist.v
clean 'spi_master -g2001' iverilog -g2001 -o /dev/null -DSPI_MULTI_SS clean/spi_master.v

fault cpu8/semicolon rejects iverilog -g2001 -o /dev/null -Iinclude clean/cpu8_alu.v clean/cpu8_regfile.v faulty/cpu8_core-semicolon.v clean/cpu8_soc.v
fault cpu8/macro rejects iverilog -g2001 -o /dev/null -Iinclude clean/cpu8_alu.v clean/cpu8_regfile.v faulty/cpu8_core-macro.v clean/cpu8_soc.v
fault cache_ctrl/apostrophe rejects iverilog -g2001 -o /dev/null faulty/cache_ctrl-apostrophe.v
fault i2c_master/end rejects iverilog -g2001 -o /dev/null faulty/i2c_master-end.v
fault fir_filter/keyword rejects iverilog -g2001 -o /dev/null faulty/fir_filter-keyword.v
fault spi_master/comma rejects iverilog -g2001 -o /dev/null -DSPI_MULTI_SS faulty/spi_master-comma.v
fault attrs/param rejects iverilog -g2001 -o /dev/null clean/attr_lib.v faulty/attr_top-param.v
fault directives/linemark rejects iverilog -g2001 -o /dev/null faulty/directives-linemark.v
fault macro_bus/args rejects iverilog -g2001 -o /dev/null -Iinclude -DBUS_WIDTH=32 -DBUS_APB4 faulty/macro_bus-args.v
fault macro_bus/include rejects iverilog -g2001 -o /dev/null -Iinclude -DBUS_WIDTH=32 -DBUS_APB4 faulty/macro_bus-include.v
fault macro_bus/unquoted rejects iverilog -g2001 -o /dev/null -Iinclude -DBUS_WIDTH=32 -DBUS_APB4 faulty/macro_bus-unquoted.v
fault macro_bus/elsif accepts iverilog -g2001 -o /dev/null -Iinclude -DBUS_WIDTH=32 -DBUS_APB4 faulty/macro_bus-elsif.v
fault v95_bfm/else accepts iverilog -g1995 -o /dev/null faulty/v95_bfm-else.v
fault stack_cpu/endif accepts iverilog -g2001 -o /dev/null faulty/stack_cpu-endif.v
fault macro_soc/cmdline accepts iverilog -g2001 -o /dev/null -DSOC_CLK_MHZ=50 -DSIMULATION faulty/soc_defs-cmdline.v clean/soc_periph.v clean/soc_top.v
fault macro_soc/redefined accepts iverilog -g2001 -o /dev/null -DSOC_CLK_MHZ=50 -DSIMULATION faulty/soc_defs-redefined.v clean/soc_periph.v clean/soc_top.v
fault macro_soc/directive accepts iverilog -g2001 -o /dev/null -DSOC_CLK_MHZ=50 -DSIMULATION faulty/soc_defs-directive.v clean/soc_periph.v clean/soc_top.v
fault macro_soc/undef rejects iverilog -g2001 -o /dev/null -DSOC_CLK_MHZ=50 -DSIMULATION faulty/soc_defs-undef.v clean/soc_periph.v clean/soc_top.v
fault macro_soc/hexdigit rejects iverilog -g2001 -o /dev/null -DSOC_CLK_MHZ=50 -DSIMULATION clean/soc_defs.v clean/soc_periph.v faulty/soc_top-hexdigit.v
fault directives/timescale rejects iverilog -g2001 -o /dev/null faulty/directives-timescale.v
fault directives/drive rejects iverilog -g2001 -o /dev/null faulty/directives-drive.v
fault directives/xl accepts iverilog -g2001 -o /dev/null faulty/directives-xl.v
fault directives/uselib accepts iverilog -g2001 -o /dev/null faulty/directives-uselib.v
fault directives/ifdef accepts iverilog -g2001 -o /dev/null faulty/directives-ifdef.v
fault directives/comment accepts iverilog -g2001 -o /dev/null faulty/directives-comment.v
fault tb_events/quote rejects iverilog -g2001 -o /dev/null faulty/tb_events-quote.v
fault v95_cpu/line accepts iverilog -g1995 -o /dev/null faulty/v95_cpu_defs-line.v clean/v95_cpu.v clean/v95_cpu_tb.v
fault v95_cpu/reserved accepts iverilog -g1995 -o /dev/null clean/v95_cpu_defs.v clean/v95_cpu.v faulty/v95_cpu_tb-reserved.v
fault v95_cpu/nettype accepts iverilog -g1995 -o /dev/null clean/v95_cpu_defs.v faulty/v95_cpu-nettype.v clean/v95_cpu_tb.v
fault numbers/intbig accepts iverilog -g2001 -o /dev/null faulty/numbers-intbig.v
fault numbers/widthmax accepts iverilog -g2001 -o /dev/null faulty/numbers-widthmax.v
fault numbers/decdigit rejects iverilog -g2001 -o /dev/null faulty/numbers-decdigit.v
fault numbers/decwide accepts iverilog -g2001 -o /dev/null faulty/numbers-decwide.v
fault numbers/octwide accepts iverilog -g2001 -o /dev/null faulty/numbers-octwide.v
fault v95_counter/binwide accepts iverilog -g1995 -o /dev/null faulty/v95_counter-binwide.v
fault cache_ctrl/bindigit rejects iverilog -g2001 -o /dev/null faulty/cache_ctrl-bindigit.v
fault alu32/hexwide accepts iverilog -g2001 -o /dev/null faulty/alu32-hexwide.v
fault ram_models/zerowidth rejects iverilog -g2001 -o /dev/null faulty/ram_models-zerowidth.v
fault v95_counter/portdir rejects iverilog -g1995 -o /dev/null faulty/v95_counter-portdir.v
fault v95_counter/paramrange accepts iverilog -g1995 -o /dev/null faulty/v95_counter-paramrange.v
fault v95_mult/portname rejects iverilog -g1995 -o /dev/null faulty/v95_mult-portname.v
fault attrs/module rejects iverilog -g2001 -o /dev/null clean/attr_lib.v faulty/attr_top-module.v
fault gen_tree/redecl rejects iverilog -g2001 -o /dev/null faulty/gen_tree-redecl.v
fault cache_ctrl/redecl rejects iverilog -g2001 -o /dev/null faulty/cache_ctrl-redecl.v
fault synth_netlist/escaped rejects iverilog -g2001 -o /dev/null faulty/synth_netlist-escaped.v
fault adder_gates/and rejects iverilog -g1995 -o /dev/null faulty/adder_gates-and.v
fault cmos_cells/cmos rejects iverilog -g1995 -o /dev/null faulty/cmos_cells-cmos.v
fault bus_drivers/bufif0 rejects iverilog -g2001 -o /dev/null faulty/bus_drivers-bufif0.v
fault pass_switches/tran rejects iverilog -g2001 -o /dev/null faulty/pass_switches-tran.v
fault pass_switches/pullup accepts iverilog -g2001 -o /dev/null faulty/pass_switches-pullup.v
fault udp_comb/columns rejects iverilog -g1995 -o /dev/null faulty/udp_comb-columns.v
fault udp_seq/edges accepts iverilog -g1995 -o /dev/null faulty/udp_seq-edges.v
fault udp_seq/initvalue accepts iverilog -g1995 -o /dev/null faulty/udp_seq-initvalue.v
fault udp_ansi/init2 rejects iverilog -g2001 -o /dev/null faulty/udp_ansi-init2.v
fault udp_jk/conflict accepts iverilog -g2001 -o /dev/null faulty/udp_jk-conflict.v clean/jk_counter.v
fault udp_lib95/first rejects iverilog -g1995 -o /dev/null faulty/udp_lib95-first.v
fault udp_lib95/input rejects iverilog -g1995 -o /dev/null faulty/udp_lib95-input.v
fault udp_lib95/mode rejects iverilog -g1995 -o /dev/null faulty/udp_lib95-mode.v
fault udp_lib95/notport accepts iverilog -g1995 -o /dev/null faulty/udp_lib95-notport.v
fault fifo_async/unnamed accepts iverilog -g2001 -o /dev/null faulty/fifo_async-unnamed.v
fault gen_pipeline/condbody accepts iverilog -g2001 -o /dev/null faulty/gen_pipeline-condbody.v
fault gen_crc/increment accepts iverilog -g2001 -o /dev/null faulty/gen_crc-increment.v
fault uart/sensitivity rejects iverilog -g2001 -o /dev/null clean/uart_tx.v faulty/uart_rx-sensitivity.v clean/uart_top.v
fault fifo_sync/nba rejects iverilog -g2001 -o /dev/null -DFIFO_CHECKS faulty/fifo_sync-nba.v
fault tasks_funcs/noinput rejects iverilog -g2001 -o /dev/null faulty/tasks_funcs-noinput.v
fault tasks_funcs/taskcall rejects iverilog -g2001 -o /dev/null faulty/tasks_funcs-taskcall.v
fault tasks_funcs/eventctl accepts iverilog -g2001 -o /dev/null faulty/tasks_funcs-eventctl.v
fault tasks_funcs/wait rejects iverilog -g2001 -o /dev/null faulty/tasks_funcs-wait.v
fault tasks_funcs/delay rejects iverilog -g2001 -o /dev/null faulty/tasks_funcs-delay.v
fault tb_events/trigger accepts iverilog -g2001 -o /dev/null faulty/tb_events-trigger.v
fault cells_specify/delays accepts iverilog -g2001 -o /dev/null faulty/cells_specify-delays.v
fault cells_tchk/systask rejects iverilog -g2001 -o /dev/null faulty/cells_tchk-systask.v

echo "clean compilations: $pass accepted, $fail rejected"
[ $faulty = 1 ] && echo "faulty variants: $agree as recorded, $differ different"
[ $fail = 0 ]
