# Runs `tvxcim demo` on the built-in host as a user would, both streams to
# one file (`tvxcim demo > log 2>&1`), and checks that each line the instance
# factories write to standard error stands on its own line, and that what
# the demo shows is the default host's ports, identities and associations,
# its kernel IP endpoints, its two processor packages, both hypervisor
# images (the alternate one from the simulated boot bank) and their
# association with the computer system the stand-in host providers serve
# under this host's name, a watched element at its first poll, and at the
# end this host's first heartbeat.
# OPTIONS, when given, go before the command (--stock-sfcb).
cmake_host_system_information(RESULT host QUERY HOSTNAME)
string(REPLACE "-" "" run "tvxcim${OPTIONS}_demo")
set(log "${CMAKE_CURRENT_BINARY_DIR}/${run}.log")
execute_process(COMMAND ${EMULATOR} ${TVXCIM} ${OPTIONS} demo
                RESULT_VARIABLE status OUTPUT_FILE "${log}" ERROR_FILE "${log}")
file(READ "${log}" shown)
if(NOT status EQUAL 0)
  message(FATAL_ERROR "tvxcim demo exited with ${status}:\n${shown}")
endif()
set(announcement "--- _Create_InstanceMI() P10CmpiBaseMI")
string(REGEX MATCHALL "[^\n]*--- _Create_InstanceMI[^\n]*" announcements "${shown}")
if(announcements STREQUAL "")
  message(FATAL_ERROR "no instance factory announced itself:\n${shown}")
endif()
foreach(line IN LISTS announcements)
  if(NOT line STREQUAL announcement)
    message(FATAL_ERROR "a factory's line shares a line with tvxcim's output: '${line}'")
  endif()
endforeach()
string(REPLACE "${announcement}\n" "" shown "${shown}")
set(expected
  "DeviceID = \"vmnic0\";"
  "DeviceID = \"vmnic1\";\n[^}]*EnabledState = 3;"
  "VersionString = \"ixgbe driver 3.7.13.7.14iov-NAPI\";"
  "VersionString = \"tg3 device firmware FFV7.10.18 bc 5720-v1.39\";"
  "instance of Talvex_EPDriverElementSoftwareIdentity"
  "instance of Talvex_EPFirmwareElementSoftwareIdentity"
  "instance of Talvex_KernelIPv4ProtocolEndpoint\n[^}]*Name = \"vmk0\";[^}]*IPv4Address = \"192.168.10.21\";"
  "instance of Talvex_KernelIPv4ProtocolEndpoint\n[^}]*EnabledState = 6;[^}]*Name = \"vmk3\";"
  "instance of Talvex_KernelIPv6ProtocolEndpoint\n[^}]*Name = \"vmk1\";[^}]*IPv6Address = \"2001:db8:10::21\";\n    PrefixLength = 48;"
  "instance of Talvex_Processor\n[^}]*DeviceID = \"cpu-0\";[^}]*Vendor = 2;"
  "instance of Talvex_Processor\n[^}]*DeviceID = \"cpu-1\";[^}]*Vendor = 3;"
  "instance of Talvex_HypervisorSoftwareIdentity\n[^}]*InstanceID = \"Talvex Corlai 5.1.0 build-1483097\";[^}]*LastStartTime = "
  "instance of Talvex_HypervisorSoftwareIdentity\n[^}]*InstanceID = \"Alt Boot Bank: Talvex Corlai 5.1.0 build-799733\";"
  "instance of OMC_UnitaryComputerSystem\n[^}]*\n    Name = \"${host}\";[^}]*ElementName = \"${host}\";"
  "instance of CIM_PhysicalMemory\n[^}]*Tag = \"DIMM_A1\";\n    HealthState = 15;"
  "== ain root/cimv2:Talvex_EthernetPort[^\n]*DeviceID=\"vmnic0\"\nroot/cimv2:Talvex_EPDriverSoftwareIdentity[^\n]*\nroot/cimv2:Talvex_EPFirmwareSoftwareIdentity"
  "== ain root/cimv2:Talvex_EPDriverSoftwareIdentity[^\n]*\nroot/cimv2:Talvex_EthernetPort[^\n]*DeviceID=\"vmnic0\""
  "instance of Talvex_LatchedHealthState\n[^}]*LatchedClassName = \"Talvex_DiskDrive\";[^}]*HealthState = 20;"
  "instance of Talvex_RollupHealthState\n[^}]*HealthState = 20;"
  "== ain root/cimv2:Talvex_LatchedHealthState.EventId=\"0\"\nroot/cimv2:CIM_Sensor[^\n]*DeviceID=\"fan1\""
  "== ain root/cimv2:OMC_UnitaryComputerSystem[^\n]*\nroot/cimv2:Talvex_HypervisorSoftwareIdentity.InstanceID=\"Talvex Corlai 5.1.0 build-1483097\"\n\n")
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
