include_guard(GLOBAL)
include(GoogleTest)

function(tvx_warnings target)
  target_compile_options(${target} PRIVATE
    -Wall -Wextra -Wpedantic -Wshadow
    $<$<COMPILE_LANGUAGE:CXX>:-Wnon-virtual-dtor>
    $<$<BOOL:${TVX_WERROR}>:-Werror>)
endfunction()

# Makes GTest::gtest, GTest::gtest_main and GTest::gmock available to every
# folder. The Debian libraries are 64-bit only, so a cross build compiles the
# Debian source package with the target's own flags.
function(tvx_provide_gtest)
  if(CMAKE_CROSSCOMPILING OR TVX_GTEST_FROM_SOURCE)
    set(TVX_GTEST_SOURCE_DIR "/usr/src/googletest" CACHE PATH "GoogleTest source tree")
    if(NOT EXISTS "${TVX_GTEST_SOURCE_DIR}/CMakeLists.txt")
      message(FATAL_ERROR "No GoogleTest sources in ${TVX_GTEST_SOURCE_DIR}: install the Debian package 'googletest'")
    endif()
    set(INSTALL_GTEST OFF CACHE BOOL "" FORCE)
    set(BUILD_GMOCK ON CACHE BOOL "" FORCE)
    # SYSTEM keeps its headers out of our -Werror warnings.
    add_subdirectory("${TVX_GTEST_SOURCE_DIR}" "${CMAKE_BINARY_DIR}/_deps/googletest"
                     EXCLUDE_FROM_ALL SYSTEM)
    foreach(lib IN ITEMS gtest gtest_main gmock gmock_main)
      if(NOT TARGET GTest::${lib})
        add_library(GTest::${lib} ALIAS ${lib})
      endif()
    endforeach()
  else()
    find_package(GTest REQUIRED)
    if(NOT TARGET GTest::gmock)
      message(FATAL_ERROR "GoogleTest was found without GMock: install the Debian package 'libgmock-dev'")
    endif()
  endif()
endfunction()

# tvx_add_gtest(<target> <source>... [LIBS <lib>...] [PROPERTIES <name> <value>...])
# Each test case becomes its own ctest test. Cases are listed when ctest runs,
# through the emulator in a cross build, which is slow: hence the long timeout.
function(tvx_add_gtest target)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "LIBS;PROPERTIES")
  if(NOT arg_UNPARSED_ARGUMENTS)
    message(FATAL_ERROR "tvx_add_gtest(${target}) needs at least one source file")
  endif()
  add_executable(${target} ${arg_UNPARSED_ARGUMENTS})
  target_link_libraries(${target} PRIVATE ${arg_LIBS} GTest::gmock GTest::gtest_main)
  tvx_warnings(${target})
  set(extra)
  if(arg_PROPERTIES)
    set(extra PROPERTIES ${arg_PROPERTIES})
  endif()
  gtest_discover_tests(${target}
    DISCOVERY_MODE PRE_TEST
    DISCOVERY_TIMEOUT 300
    ${extra})
endfunction()

# Sets <out> to the MOF files the product library's classes need, in the
# order a broker reads them: the CIM base classes, then every Talvex file.
function(tvx_product_mofs out)
  file(GLOB talvex_mofs CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/mof/talvex_*.mof)
  list(SORT talvex_mofs)
  set(${out} ${PROJECT_SOURCE_DIR}/mof/cim_base.mof ${talvex_mofs} PARENT_SCOPE)
endfunction()

# tvx_host_broker_definitions(<target> <PRIVATE|INTERFACE>)
# What a broker on a host loads, as C string literals for <target>: the
# product (TVX_PROVIDER_DIR, TVX_PROVIDER_REG, TVX_PRODUCT_MOFS: its
# folder, registration and MOF files in reading order) and the stand-in
# host providers (TVX_HOST_PROVIDER_DIR, TVX_HOST_PROVIDER_REG,
# TVX_HOST_PROVIDER_MOF). Both libraries are built first.
function(tvx_host_broker_definitions target scope)
  tvx_product_mofs(product_mofs)
  tvx_c_strings(product_mofs ${product_mofs})
  set(host_providers ${PROJECT_SOURCE_DIR}/hostsim/hostproviders)
  target_compile_definitions(${target} ${scope}
    "TVX_PROVIDER_DIR=\"$<TARGET_FILE_DIR:tvxprovider>\""
    "TVX_PROVIDER_REG=\"${PROJECT_SOURCE_DIR}/mof/tvxprovider.reg\""
    "TVX_PRODUCT_MOFS=${product_mofs}"
    "TVX_HOST_PROVIDER_DIR=\"$<TARGET_FILE_DIR:tvxhostproviders>\""
    "TVX_HOST_PROVIDER_REG=\"${host_providers}/hostproviders.reg\""
    "TVX_HOST_PROVIDER_MOF=\"${host_providers}/hostproviders.mof\"")
  add_dependencies(${target} tvxprovider tvxhostproviders)
endfunction()

# Sets <out> to the items as C string literals separated by commas: the
# inside of an initializer list.
function(tvx_c_strings out)
  set(literals)
  foreach(item IN LISTS ARGN)
    string(REPLACE "\\" "\\\\" item "${item}")
    string(REPLACE "\"" "\\\"" item "${item}")
    list(APPEND literals "\"${item}\"")
  endforeach()
  list(JOIN literals "," joined)
  set(${out} "${joined}" PARENT_SCOPE)
endfunction()
