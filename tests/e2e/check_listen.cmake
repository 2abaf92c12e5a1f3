# Runs `tvxcim listen` on the built-in host as a user would, once stopping
# by itself after a few seconds and once stopped by SIGINT as by Ctrl-C:
# either way it shows this host's first heartbeat, sent at once, and
# nothing more, since the next one is a period (at least 30 s) away.
cmake_host_system_information(RESULT host QUERY HOSTNAME)
foreach(run IN ITEMS seconds interrupt)
  string(TIMESTAMP before "%Y%m%d%H%M%S" UTC)
  if(run STREQUAL "seconds")
    execute_process(COMMAND ${EMULATOR} ${TVXCIM} listen --seconds 3
                    RESULT_VARIABLE status OUTPUT_VARIABLE shown ERROR_VARIABLE errors)
  else()
    # --foreground: one SIGINT to tvxcim alone, as Ctrl-C sends; otherwise
    # timeout signals its process group too, and a second SIGINT arriving
    # after the first was handled ends tvxcim with status 130.
    execute_process(COMMAND timeout --foreground --preserve-status -s INT 5 ${EMULATOR} ${TVXCIM} listen
                    RESULT_VARIABLE status OUTPUT_VARIABLE shown ERROR_VARIABLE errors)
  endif()
  string(TIMESTAMP after "%Y%m%d%H%M%S" UTC)
  if(NOT status EQUAL 0)
    message(FATAL_ERROR "tvxcim listen (${run}) exited with ${status}:\n${errors}")
  endif()
  set(heartbeat "^// root/cimv2:Talvex_CIMHeartbeat\ninstance of Talvex_CIMHeartbeat\n{\n    hostname = \"${host}\";\n    stamp = 0;\n    IndicationTime = \"([0-9]+)\\.000000\\+000\";\n};\n\n$")
  if(NOT shown MATCHES "${heartbeat}")
    message(FATAL_ERROR "tvxcim listen (${run}) did not show exactly the first heartbeat of ${host}:\n${shown}")
  endif()
  if(CMAKE_MATCH_1 STRLESS before OR CMAKE_MATCH_1 STRGREATER after)
    message(FATAL_ERROR "the first heartbeat was sent at ${CMAKE_MATCH_1}, not between ${before} and ${after}")
  endif()
endforeach()
