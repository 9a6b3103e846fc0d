# Script mode (cmake -P) helpers for the token vocabulary.
#
#   -DMODE=write -DDEF=<tn_verilogtokens.def> -DOUT=<Tn_VerilogTokenTypes.txt>
#       writes the ANTLR 2 import vocabulary "Tn_Verilog" from the token list:
#       NAME="text"=N for fixed tokens, NAME("display name")=N for literal kinds.
#
#   -DMODE=check -DEXPECTED=<Tn_VerilogTokenTypes.txt> -DDIR=<dir> -DCLASSES=<A;B>
#       after the parser generator ran over a grammar importing that vocabulary:
#       fails when the vocabulary a class exports (DIR/<class>TokenTypes.txt)
#       differs from the imported one (a literal or token the scanner does not
#       know), and replaces DIR/<class>TokenTypes.hpp with an alias of
#       Tn_VerilogTokenTypes, so the parser and the scanner share one enumeration.
cmake_minimum_required(VERSION 3.18)

# Tokens such as ";" and "[" mean something to CMake lists, so lines are kept
# encoded until written out: "@", ";", "[" and "]" (by ASCII code, as they
# cannot stand in a list themselves) become "@" and a letter.
set(TARN_ENCODED 64 59 91 93)
set(TARN_CODES "@A" "@S" "@L" "@R")

# The lines of a file as a list of encoded lines.
function(tarn_read_lines file out)
  file(READ "${file}" text)
  foreach(i RANGE 3)
    list(GET TARN_ENCODED ${i} ascii)
    string(ASCII ${ascii} char)
    list(GET TARN_CODES ${i} code)
    string(REPLACE "${char}" "${code}" text "${text}")
  endforeach()
  string(REPLACE "\n" ";" text "${text}")
  set(${out} "${text}" PARENT_SCOPE)
endfunction()

function(tarn_decode text out)
  foreach(i RANGE 3 0 -1)
    list(GET TARN_ENCODED ${i} ascii)
    string(ASCII ${ascii} char)
    list(GET TARN_CODES ${i} code)
    string(REPLACE "${code}" "${char}" text "${text}")
  endforeach()
  set(${out} "${text}" PARENT_SCOPE)
endfunction()

# Token lines of a vocabulary file, without its header lines.
function(tarn_vocabulary_entries file out)
  tarn_read_lines("${file}" lines)
  set(entries)
  foreach(line IN LISTS lines)
    if(line MATCHES "^[A-Za-z_\"]" AND line MATCHES "=[0-9]+$")
      list(APPEND entries "${line}")
    endif()
  endforeach()
  set(${out} "${entries}" PARENT_SCOPE)
endfunction()

if(MODE STREQUAL "write")
  tarn_read_lines("${DEF}" lines)
  list(FILTER lines INCLUDE REGEX "^TN_TOKEN\\(")
  set(text "// Generated from verilog/tn_verilogtokens.def; do not edit.\nTn_Verilog    // output token vocab name\n")
  set(type 4)
  foreach(line IN LISTS lines)
    if(NOT line MATCHES "^TN_TOKEN\\(([A-Z0-9_]+), *\"([^\"\\\\]*)\", *([A-Z0-9_]+)\\)$")
      message(FATAL_ERROR "${DEF}: malformed token line: ${line}")
    endif()
    if(CMAKE_MATCH_3 STREQUAL "LITERAL")
      string(APPEND text "${CMAKE_MATCH_1}(\"${CMAKE_MATCH_2}\")=${type}\n")
    else()
      string(APPEND text "${CMAKE_MATCH_1}=\"${CMAKE_MATCH_2}\"=${type}\n")
    endif()
    math(EXPR type "${type} + 1")
  endforeach()
  tarn_decode("${text}" text)
  # Rewrite only on change, so grammars are not regenerated needlessly.
  if(EXISTS "${OUT}")
    file(READ "${OUT}" old)
    if(old STREQUAL text)
      return()
    endif()
  endif()
  file(WRITE "${OUT}" "${text}")
elseif(MODE STREQUAL "check")
  tarn_vocabulary_entries("${EXPECTED}" expected)
  foreach(class IN LISTS CLASSES)
    tarn_vocabulary_entries("${DIR}/${class}TokenTypes.txt" actual)
    if(NOT actual STREQUAL expected)
      set(extra "${actual}")
      list(REMOVE_ITEM extra ${expected})
      tarn_decode("${extra}" extra)
      message(FATAL_ERROR "${class}: the grammar's token vocabulary differs from "
        "verilog/tn_verilogtokens.def (tokens the scanner does not know: ${extra}). "
        "Add them to the token list or use the listed names and literals.")
    endif()
    file(WRITE "${DIR}/${class}TokenTypes.hpp"
      "// Generated: ${class} uses the scanner's token types (checked at build time).\n"
      "#ifndef INC_${class}TokenTypes_hpp_\n#define INC_${class}TokenTypes_hpp_\n"
      "#ifndef CUSTOM_API\n#define CUSTOM_API\n#endif\n"
      "#include \"verilog/tn_verilogtokentypes.h\"\n"
      "typedef Tn_VerilogTokenTypes ${class}TokenTypes;\n#endif\n")
  endforeach()
else()
  message(FATAL_ERROR "TarnVocabulary.cmake: MODE must be write or check")
endif()
