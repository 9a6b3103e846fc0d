// Option file for the example: paths are relative to the repository root.
+incdir+examples/blinky
-top blinky
-GWIDTH=4
examples/blinky/blinky.v
