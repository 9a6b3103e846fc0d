# Third-party pieces Tarn is built on (installed by scripts/install-deps).
find_package(Boost 1.67 REQUIRED COMPONENTS regex)

find_program(RUNANTLR runantlr)
find_path(ANTLR_INCLUDE_DIR antlr/LLkParser.hpp)
find_library(ANTLR_PIC_LIBRARY NAMES libantlr-pic.a antlr-pic)
if(NOT RUNANTLR OR NOT ANTLR_INCLUDE_DIR OR NOT ANTLR_PIC_LIBRARY)
  message(FATAL_ERROR "ANTLR 2 not found: run scripts/install-deps (packages antlr, libantlr-dev)")
endif()

find_package(FLEX 2.6 REQUIRED)
find_path(FLEXLEXER_INCLUDE_DIR FlexLexer.h)
if(NOT FLEXLEXER_INCLUDE_DIR)
  message(FATAL_ERROR "FlexLexer.h not found: run scripts/install-deps (packages flex, libfl-dev)")
endif()
