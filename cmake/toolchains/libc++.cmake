# clang with libc++, of the version ZON_LIBCXX_VERSION, both of this machine. The library lies under ZON_LIBCXX_ROOT as its
# Debian packages have it; see scripts/test-platform.
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES ZON_LIBCXX_VERSION ZON_LIBCXX_ROOT)
set(CMAKE_C_COMPILER clang-${ZON_LIBCXX_VERSION})
set(CMAKE_CXX_COMPILER clang++-${ZON_LIBCXX_VERSION})
include("${CMAKE_CURRENT_LIST_DIR}/OlderBoost.cmake")
set(libcxx "${ZON_LIBCXX_ROOT}/usr/lib/llvm-${ZON_LIBCXX_VERSION}")
set(CMAKE_CXX_FLAGS_INIT "-nostdinc++ -isystem ${libcxx}/include/c++/v1 ${ZON_LIBCXX_FOR_OLDER_BOOST}")
# An rpath of the old kind is looked at for what libc++ itself needs, too.
foreach(kind IN ITEMS EXE SHARED)
	set(CMAKE_${kind}_LINKER_FLAGS_INIT "-stdlib=libc++ -L${libcxx}/lib -Wl,-rpath,${libcxx}/lib,--disable-new-dtags")
endforeach()
