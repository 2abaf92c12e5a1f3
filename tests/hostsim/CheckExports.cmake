# cmake -DNM=nm -DLIBRARY=lib.so -P CheckExports.cmake header...
# Fails unless the library's defined dynamic symbols are exactly the functions
# the headers declare.

# The headers are the arguments after the script's own path.
set(headers)
set(first_header ${CMAKE_ARGC})
math(EXPR last "${CMAKE_ARGC} - 1")
foreach(i RANGE ${last})
  if(CMAKE_ARGV${i} STREQUAL "-P")
    math(EXPR first_header "${i} + 2")
  elseif(i GREATER_EQUAL first_header)
    list(APPEND headers "${CMAKE_ARGV${i}}")
  endif()
endforeach()

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

execute_process(COMMAND "${NM}" -D --defined-only "${LIBRARY}"
  OUTPUT_VARIABLE table RESULT_VARIABLE failed)
if(failed)
  message(FATAL_ERROR "${NM} cannot read ${LIBRARY}")
endif()
string(REGEX MATCHALL "[^\n]+" rows "${table}")
set(exported)
foreach(row IN LISTS rows)
  string(REGEX REPLACE "^[0-9a-fA-F]* *[A-Za-z] +" "" name "${row}")
  list(APPEND exported "${name}")
endforeach()

list(SORT declared)
list(SORT exported)
if(NOT declared STREQUAL exported OR declared STREQUAL "")
  message(FATAL_ERROR "${LIBRARY}\n  declared: ${declared}\n  exported: ${exported}")
endif()
list(LENGTH declared count)
message(STATUS "${LIBRARY} exports exactly the ${count} declared functions")
