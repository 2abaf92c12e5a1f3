# cmake -DNM=nm -DLIBRARY=lib.so "-DHEADERS=a.h|b.h" -P CheckExports.cmake
# Fails unless the library's defined dynamic symbols are exactly the functions
# the headers declare.
string(REPLACE "|" ";" headers "${HEADERS}")
set(declared)
foreach(header IN LISTS headers)
  file(STRINGS "${header}" lines)
  foreach(line IN LISTS lines)
    string(REGEX REPLACE "/\\*.*\\*/|//.*" "" line "${line}")
    if(line MATCHES "^[ \t]*[A-Za-z_]" AND line MATCHES "([A-Za-z_][A-Za-z0-9_]*)\\(")
      list(APPEND declared "${CMAKE_MATCH_1}")
    endif()
  endforeach()
endforeach()

execute_process(COMMAND "${NM}" -D --defined-only --format=just-symbols "${LIBRARY}"
  OUTPUT_VARIABLE exported RESULT_VARIABLE failed)
if(failed)
  message(FATAL_ERROR "${NM} cannot read ${LIBRARY}")
endif()
string(REGEX MATCHALL "[^\n]+" exported "${exported}")

list(SORT declared)
list(SORT exported)
if(NOT declared STREQUAL exported OR declared STREQUAL "")
  message(FATAL_ERROR "${LIBRARY}\n  declared: ${declared}\n  exported: ${exported}")
endif()
list(LENGTH declared count)
message(STATUS "${LIBRARY} exports exactly the ${count} declared functions")
