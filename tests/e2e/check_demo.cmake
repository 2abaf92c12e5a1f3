# Runs `tvxcim demo` on the built-in host as a user would and checks that
# what it shows is the default host's ports, identities and associations,
# its two processor packages, and at the end this host's first heartbeat.
cmake_host_system_information(RESULT host QUERY HOSTNAME)
execute_process(COMMAND ${EMULATOR} ${TVXCIM} demo
                RESULT_VARIABLE status OUTPUT_VARIABLE shown ERROR_VARIABLE errors)
if(NOT status EQUAL 0)
  message(FATAL_ERROR "tvxcim demo exited with ${status}:\n${errors}")
endif()
set(expected
  "DeviceID = \"vmnic0\";"
  "DeviceID = \"vmnic1\";\n[^}]*EnabledState = 3;"
  "VersionString = \"ixgbe driver 3.7.13.7.14iov-NAPI\";"
  "VersionString = \"tg3 device firmware FFV7.10.18 bc 5720-v1.39\";"
  "instance of Talvex_EPDriverElementSoftwareIdentity"
  "instance of Talvex_EPFirmwareElementSoftwareIdentity"
  "instance of Talvex_Processor\n[^}]*DeviceID = \"cpu-0\";[^}]*Vendor = 2;"
  "instance of Talvex_Processor\n[^}]*DeviceID = \"cpu-1\";[^}]*Vendor = 3;"
  "== ain root/cimv2:Talvex_EthernetPort.DeviceID=\"vmnic0\"\nroot/cimv2:Talvex_EPDriverSoftwareIdentity[^\n]*\nroot/cimv2:Talvex_EPFirmwareSoftwareIdentity")
foreach(pattern IN LISTS expected)
  if(NOT shown MATCHES "${pattern}")
    message(FATAL_ERROR "tvxcim demo did not show '${pattern}':\n${shown}")
  endif()
endforeach()
# One pattern, whose semicolons a list would split.
set(heartbeat "== first indication of Talvex_CIMHeartbeat\n// root/cimv2:Talvex_CIMHeartbeat\ninstance of Talvex_CIMHeartbeat\n{\n    hostname = \"${host}\";\n    stamp = 0;\n    IndicationTime = \"[0-9]+\\.000000\\+000\";\n};\n\n$")
if(NOT shown MATCHES "${heartbeat}")
  message(FATAL_ERROR "tvxcim demo did not end with the first heartbeat of ${host}:\n${shown}")
endif()
