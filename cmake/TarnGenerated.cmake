# Sources generated at build time into ${CMAKE_BINARY_DIR}/generated (on the
# include path of every target). Generated code is compiled without -Werror.
set(TARN_GENERATED_DIR ${CMAKE_BINARY_DIR}/generated)
file(MAKE_DIRECTORY ${TARN_GENERATED_DIR}/verilog)
set(TARN_GENERATED_FLAGS -Wno-error -Wno-unused-parameter -Wno-unused-function -Wno-sign-compare)

# Token vocabulary: the C++ enumeration includes verilog/tn_verilogtokens.def
# directly; the ANTLR import vocabulary "Tn_Verilog" is written from it here.
set(TARN_VOCABULARY ${TARN_GENERATED_DIR}/Tn_VerilogTokenTypes.txt)
add_custom_command(
  OUTPUT ${TARN_VOCABULARY}
  COMMAND ${CMAKE_COMMAND} -DMODE=write -DDEF=${CMAKE_SOURCE_DIR}/verilog/tn_verilogtokens.def
          -DOUT=${TARN_VOCABULARY} -P ${CMAKE_SOURCE_DIR}/cmake/TarnVocabulary.cmake
  DEPENDS ${CMAKE_SOURCE_DIR}/verilog/tn_verilogtokens.def ${CMAKE_SOURCE_DIR}/cmake/TarnVocabulary.cmake
  COMMENT "Writing the ANTLR token vocabulary")
add_custom_target(tarn_vocabulary DEPENDS ${TARN_VOCABULARY})
add_dependencies(tarn tarn_vocabulary)

# Scanner: flex C++ scanner (engine class Tn_VerilogBaseFlexLexer).
set(TARN_SCANNER_SOURCE ${TARN_GENERATED_DIR}/verilog/tn_verilogflexlexer_rules.cpp)
add_custom_command(
  OUTPUT ${TARN_SCANNER_SOURCE}
  COMMAND ${FLEX_EXECUTABLE} -o ${TARN_SCANNER_SOURCE} ${CMAKE_SOURCE_DIR}/verilog/tn_verilogflexlexer.l
  DEPENDS ${CMAKE_SOURCE_DIR}/verilog/tn_verilogflexlexer.l
  COMMENT "Generating the Verilog scanner")
target_sources(tarn PRIVATE ${TARN_SCANNER_SOURCE})
set_source_files_properties(${TARN_SCANNER_SOURCE} PROPERTIES COMPILE_OPTIONS "${TARN_GENERATED_FLAGS}")

# Grammars: tarn_antlr_grammar(GRAMMAR verilog/x.g CLASSES Tn_VerilogGrammar ...)
# runs runantlr over a grammar that imports the vocabulary
# (options { importVocab = Tn_Verilog; }) and adds the generated parser
# classes to libtarn. CLASSES names every class of the grammar file; each
# must export exactly the imported vocabulary (checked here), and its
# <class>TokenTypes.hpp becomes an alias of Tn_VerilogTokenTypes.
function(tarn_antlr_grammar)
  cmake_parse_arguments(G "" "GRAMMAR" "CLASSES" ${ARGN})
  set(grammar ${CMAKE_SOURCE_DIR}/${G_GRAMMAR})
  set(dir ${TARN_GENERATED_DIR}/verilog)
  set(outputs)
  set(sources)
  foreach(class IN LISTS G_CLASSES)
    list(APPEND sources ${dir}/${class}.cpp)
    list(APPEND outputs ${dir}/${class}.cpp ${dir}/${class}.hpp ${dir}/${class}TokenTypes.hpp ${dir}/${class}TokenTypes.txt)
  endforeach()
  add_custom_command(
    OUTPUT ${outputs}
    COMMAND ${RUNANTLR} -o ${dir} ${grammar}
    COMMAND ${CMAKE_COMMAND} -DMODE=check -DEXPECTED=${TARN_VOCABULARY} -DDIR=${dir}
            "-DCLASSES=${G_CLASSES}" -P ${CMAKE_SOURCE_DIR}/cmake/TarnVocabulary.cmake
    # runantlr looks for the imported vocabulary in its working directory.
    WORKING_DIRECTORY ${TARN_GENERATED_DIR}
    DEPENDS ${grammar} ${TARN_VOCABULARY} ${CMAKE_SOURCE_DIR}/cmake/TarnVocabulary.cmake
    COMMENT "Generating the parser of ${G_GRAMMAR}")
  target_sources(tarn PRIVATE ${sources})
  set_source_files_properties(${sources} PROPERTIES COMPILE_OPTIONS "${TARN_GENERATED_FLAGS}")
endfunction()

# The grammars (tarn_antlr_grammar calls) go here.
tarn_antlr_grammar(GRAMMAR verilog/tn_veriloggrammar.g CLASSES Tn_VerilogGrammar)
