# Installs BUILD_DIR as the deployment instructions do (prefix /usr), staged
# under STAGE_DIR through DESTDIR so that nothing outside it is touched, once
# plainly and once the hostsim component alone, and checks each layout.

# Sets <out> to where DIR (relative to the prefix, or absolute) lands in
# the staging directory <stage>.
function(staged out stage dir)
  if(IS_ABSOLUTE "${dir}")
    set(${out} "${stage}${dir}" PARENT_SCOPE)
  else()
    set(${out} "${stage}/usr/${dir}" PARENT_SCOPE)
  endif()
endfunction()

function(install_into stage)
  file(REMOVE_RECURSE "${stage}")
  execute_process(COMMAND ${CMAKE_COMMAND} -E env DESTDIR=${stage}
                          ${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix /usr ${ARGN}
                  RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE output)
  if(NOT status EQUAL 0)
    message(FATAL_ERROR "cmake --install ${ARGN} failed:\n${output}")
  endif()
endfunction()

# Fails unless LIBRARY exists, carries no RUNPATH or RPATH, and names each
# library it needs by name alone, so that the loader searches for it.
function(check_loadable_as_deployed library)
  if(NOT EXISTS "${library}")
    message(FATAL_ERROR "${library} was not installed")
  endif()
  execute_process(COMMAND ${READELF} -d "${library}"
                  RESULT_VARIABLE status OUTPUT_VARIABLE dynamic ERROR_VARIABLE dynamic)
  if(NOT status EQUAL 0)
    message(FATAL_ERROR "${READELF} cannot read ${library}:\n${dynamic}")
  endif()
  if(dynamic MATCHES "\\((RUNPATH|RPATH)\\)[^\n]*")
    message(FATAL_ERROR "${library} keeps a search path: ${CMAKE_MATCH_0}")
  endif()
  if(dynamic MATCHES "\\(NEEDED\\)[^\n]*/[^\n]*")
    message(FATAL_ERROR "${library} needs a library by path: ${CMAKE_MATCH_0}")
  endif()
endfunction()

function(check_absent stage)
  foreach(pattern IN LISTS ARGN)
    file(GLOB_RECURSE found "${stage}/${pattern}")
    if(found)
      message(FATAL_ERROR "installed although it must not be: ${found}")
    endif()
  endforeach()
endfunction()

# The plain install: the product and what sfcb stages, nothing else.
set(stage "${STAGE_DIR}/plain")
install_into("${stage}")
staged(library "${stage}" "${PROVIDER_DIR}/libtvxprovider.so")
check_loadable_as_deployed("${library}")
execute_process(COMMAND ${READELF} -d "${library}" OUTPUT_VARIABLE dynamic)
foreach(needed IN ITEMS libosksysinfo.so liboskuser.so)
  if(NOT dynamic MATCHES "\\(NEEDED\\)[^\n]*\\[${needed}\\]")
    message(FATAL_ERROR "${library} does not name ${needed}:\n${dynamic}")
  endif()
endforeach()
set(LIBRARY "${library}")
include(${CMAKE_CURRENT_LIST_DIR}/../ethernet/check_exports.cmake)

staged(share "${stage}" "${DATA_DIR}/tvxprovider")
file(GLOB talvex_mofs RELATIVE "${MOF_DIR}" "${MOF_DIR}/talvex_*.mof")
foreach(file IN LISTS talvex_mofs ITEMS tvxprovider.reg)
  if(NOT EXISTS "${share}/${file}")
    message(FATAL_ERROR "${file} was not installed into ${share}")
  endif()
endforeach()
check_absent("${stage}" "*osksysinfo*" "*oskuser*" "*hostsim*" "*hostproviders*" "cim_base.mof" "*tvxcim*")

# The stand-ins, only when asked for.
set(stage "${STAGE_DIR}/hostsim")
install_into("${stage}" --component hostsim)
staged(lib "${stage}" "${LIB_DIR}")
foreach(name IN ITEMS osksysinfo oskuser)
  check_loadable_as_deployed("${lib}/lib${name}.so")
endforeach()
staged(profiles "${stage}" "${DATA_DIR}/tvxprovider/hostsim-profiles")
if(NOT EXISTS "${profiles}/default.json")
  message(FATAL_ERROR "the host profiles were not installed into ${profiles}")
endif()
# The stand-in host providers: loadable where sfcb looks, exporting only
# their factories, with the files sfcbstage takes.
staged(host_library "${stage}" "${PROVIDER_DIR}/libtvxhostproviders.so")
check_loadable_as_deployed("${host_library}")
set(LIBRARY "${host_library}")
set(EXPORT_MAP "${HOST_PROVIDERS_DIR}/hostproviders.map")
include(${CMAKE_CURRENT_LIST_DIR}/../ethernet/check_exports.cmake)
staged(host_share "${stage}" "${DATA_DIR}/tvxprovider/hostsim-providers")
foreach(file IN ITEMS hostproviders.mof hostproviders.reg)
  if(NOT EXISTS "${host_share}/${file}")
    message(FATAL_ERROR "${file} was not installed into ${host_share}")
  endif()
endforeach()
check_absent("${stage}" "*tvxprovider.so" "talvex_*.mof" "tvxprovider.reg")
message(STATUS "installed as deployed: ${library}, ${share}; stand-ins only with --component hostsim")
