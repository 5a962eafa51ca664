# Debian's clang and libc++ for WebAssembly, without exceptions and RTTI.
set(CMAKE_SYSTEM_NAME Generic)
set(CMAKE_SYSTEM_PROCESSOR wasm32)

foreach(language C CXX ASM)
  set(CMAKE_${language}_COMPILER_TARGET wasm32-wasi)
endforeach()
set(CMAKE_C_COMPILER clang-19)
set(CMAKE_CXX_COMPILER clang++-19)
set(CMAKE_ASM_COMPILER clang-19)

# The compiler would look for headers among those of the machine that builds, too.
set(headers /usr/include/wasm32-wasi)
set(CMAKE_CXX_FLAGS_INIT "-nostdlibinc -isystem ${headers}/c++/v1 -idirafter ${headers} -fno-exceptions -fno-rtti -ffunction-sections -fdata-sections")

# The stack is as large as Windows gives one, and what grows beyond it ends the program instead of writing over its data.
set(CMAKE_EXE_LINKER_FLAGS_INIT "-Wl,-z,stack-size=1048576,--stack-first")

# Nothing of that machine is to be found, but for its programs.
set(CMAKE_FIND_ROOT_PATH /usr/lib/wasm32-wasi)
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)

# Node 18 wants to be told that WASI is meant.
set(CMAKE_CROSSCOMPILING_EMULATOR
  node --no-warnings --experimental-wasi-unstable-preview1 ${CMAKE_CURRENT_LIST_DIR}/run_wasi.mjs)
