# 32-bit x86 build on an x86_64 Debian host with g++-multilib. The kernel
# cannot run i386 binaries itself, so tests go through qemu-i386.
set(CMAKE_SYSTEM_NAME Linux)
set(CMAKE_SYSTEM_PROCESSOR i686)
set(CMAKE_LIBRARY_ARCHITECTURE i386-linux-gnu)

set(CMAKE_C_COMPILER gcc)
set(CMAKE_CXX_COMPILER g++)
set(CMAKE_C_FLAGS_INIT "-m32")
set(CMAKE_CXX_FLAGS_INIT "-m32")
set(CMAKE_EXE_LINKER_FLAGS_INIT "-m32")
set(CMAKE_SHARED_LINKER_FLAGS_INIT "-m32")
set(CMAKE_MODULE_LINKER_FLAGS_INIT "-m32")

# The sysroot is the host itself: keep host tools, and never let a 64-bit
# library satisfy a search.
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY BOTH)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE BOTH)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE BOTH)
list(APPEND CMAKE_IGNORE_PATH
  /lib/x86_64-linux-gnu
  /usr/lib/x86_64-linux-gnu
  /usr/lib/x86_64-linux-gnu/cmake
  /usr/local/lib/x86_64-linux-gnu
  /lib64
  /usr/lib64)
list(REMOVE_DUPLICATES CMAKE_IGNORE_PATH)

find_program(TVX_QEMU_I386 qemu-i386)
if(NOT TVX_QEMU_I386)
  message(FATAL_ERROR "qemu-i386 not found: install the Debian package 'qemu-user' (scripts/setup.sh does)")
endif()
set(CMAKE_CROSSCOMPILING_EMULATOR "${TVX_QEMU_I386}")
