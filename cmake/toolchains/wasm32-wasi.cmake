# WebAssembly with the system interface WASI: clang 19 with Debian's wasi-libc and libc++-19-dev-wasm32; node runs the
# programs. There are no threads there, no shared libraries, and an exception that is thrown ends the program.
set(CMAKE_SYSTEM_NAME WASI)
set(CMAKE_SYSTEM_PROCESSOR wasm32)
set(CMAKE_C_COMPILER clang-19)
set(CMAKE_CXX_COMPILER clang++-19)
set(CMAKE_CXX_COMPILER_TARGET wasm32-wasi)
set(CMAKE_FIND_ROOT_PATH /usr/lib/wasm32-wasi)
set(CMAKE_AR llvm-ar-19)
set(CMAKE_RANLIB llvm-ranlib-19)
list(APPEND CMAKE_MODULE_PATH "${CMAKE_CURRENT_LIST_DIR}")   # Platform/WASI.cmake
include("${CMAKE_CURRENT_LIST_DIR}/OlderBoost.cmake")
# Debian's runtime library lacks what its own division of 128-bit integers calls: there are none, then.
set(CMAKE_CXX_FLAGS_INIT "${ZON_LIBCXX_FOR_OLDER_BOOST} -U__SIZEOF_INT128__")
# What throws an exception comes from the host: run-wasi.mjs.
set(CMAKE_EXE_LINKER_FLAGS_INIT "-Wl,--allow-undefined-file=${CMAKE_CURRENT_LIST_DIR}/wasi-imports.txt")
set(CMAKE_CROSSCOMPILING_EMULATOR node;--no-warnings;${CMAKE_CURRENT_LIST_DIR}/run-wasi.mjs)
set(ZONCORE_SMALL_BLOCK_POOL OFF CACHE BOOL "")
set(BUILD_SHARED_LIBS OFF CACHE BOOL "")
include("${CMAKE_CURRENT_LIST_DIR}/CrossCompiling.cmake")
