# Compares the defined dynamic symbols of LIBRARY with the global names of
# EXPORT_MAP; any symbol more or less fails.
execute_process(COMMAND nm -D --defined-only --format=just-symbols ${LIBRARY}
                OUTPUT_VARIABLE exported RESULT_VARIABLE status)
if(NOT status EQUAL 0)
  message(FATAL_ERROR "nm could not read ${LIBRARY}")
endif()
string(REGEX MATCHALL "[A-Za-z_][A-Za-z0-9_]*" exported "${exported}")
list(SORT exported)

file(READ ${EXPORT_MAP} map)
string(REGEX MATCH "global:([^}]*)local:" globals "${map}")
string(REGEX MATCHALL "[A-Za-z_][A-Za-z0-9_]*_Create_[A-Za-z]+MI" expected "${CMAKE_MATCH_1}")
list(SORT expected)

if(NOT exported STREQUAL expected)
  message(FATAL_ERROR "exported: ${exported}\nexpected: ${expected}")
endif()
message(STATUS "exports: ${exported}")
