# What all toolchain files of other systems share: programs are this machine's, everything else is the target's, except
# Boost's headers, which are the same everywhere. ZON_BOOST_INCLUDE_DIR names a folder with them and nothing else, since
# this machine's own headers do not fit.
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES ZON_BOOST_INCLUDE_DIR)
if(ZON_BOOST_INCLUDE_DIR)
	set(Boost_NO_BOOST_CMAKE ON)
	set(Boost_INCLUDE_DIR "${ZON_BOOST_INCLUDE_DIR}" CACHE PATH "")
endif()
