# How the project's own targets are compiled, in one place.

# What compilers and systems take. Everything else in the build asks the variables here.
if(MSVC)
	set(ZON_WARNINGS /W4)
	set(ZON_WARNING_IS_ERROR /WX)
	set(ZON_CODE_OPTIONS /utf-8 /permissive- /Zc:__cplusplus /fp:precise)
else()
	set(ZON_WARNINGS -Wall -Wextra -Wpedantic -Wconversion -Wsign-conversion -Wshadow -Wold-style-cast)
	set(ZON_WARNING_IS_ERROR -Werror)
	# Floating-point results are compared bit for bit: a contracted multiply-add rounds once where the formulas round twice.
	set(ZON_CODE_OPTIONS -ffp-contract=off)
	if(CMAKE_EXECUTABLE_FORMAT STREQUAL "ELF")
		list(APPEND ZON_CODE_OPTIONS -fno-semantic-interposition)
	endif()
endif()
if(ZON_WARNINGS_AS_ERRORS)
	list(APPEND ZON_WARNINGS ${ZON_WARNING_IS_ERROR})
endif()

# What a program that includes the headers must be compiled with, too. The old floating-point unit of 32-bit x86 keeps
# more digits than a double has.
set(ZON_PUBLIC_OPTIONS)
if(NOT MSVC AND CMAKE_SIZEOF_VOID_P EQUAL 4 AND CMAKE_SYSTEM_PROCESSOR MATCHES "^(i[3-6]86|x86|x86_64|AMD64)$")
	set(ZON_PUBLIC_OPTIONS -msse2 -mfpmath=sse)
endif()

# How a linker is told to take zonmediatypes::Initialize() from a static library, and where a library finds its neighbours.
set(ZON_TAKE_ENTRY_POINT "LINKER:--undefined=_ZN13zonmediatypes10InitializeEv")
set(ZON_ORIGIN "$ORIGIN")
if(MSVC)
	set(ZON_TAKE_ENTRY_POINT "LINKER:/INCLUDE:?Initialize@zonmediatypes@@YAXXZ")
elseif(APPLE)
	set(ZON_TAKE_ENTRY_POINT "LINKER:-u,__ZN13zonmediatypes10InitializeEv")
	set(ZON_ORIGIN "@loader_path")
endif()
string(REPLACE "LINKER:" "-Wl," ZON_TAKE_ENTRY_POINT_OPTION "${ZON_TAKE_ENTRY_POINT}")   # for pkg-config's file

# What runs a program of the target's system here, as one text: lists do not survive every command line.
list(JOIN CMAKE_CROSSCOMPILING_EMULATOR " " ZON_EMULATOR)

# The big headers of others are compiled once; ccache, where it is used, does better without.
set(ZON_PRECOMPILE ON)
if(CMAKE_CXX_COMPILER_LAUNCHER MATCHES ccache)
	set(ZON_PRECOMPILE OFF)
endif()

# Options that every target of the project shares, libraries and programs alike.
function(zon_target_defaults inTarget)
	target_compile_features(${inTarget} PUBLIC cxx_std_20)
	target_compile_options(${inTarget} PRIVATE ${ZON_WARNINGS} ${ZON_CODE_OPTIONS})
	set_target_properties(${inTarget} PROPERTIES
		CXX_EXTENSIONS OFF
		CXX_VISIBILITY_PRESET hidden
		VISIBILITY_INLINES_HIDDEN ON)
endfunction()

# A library of the project: its sources are all of its src/ folder and of the folders in it, an area each; its headers are
# found from the repository root. inMacro is the prefix of its export macro (see Export.h of the library).
function(zon_add_library inTarget inMacro)
	file(GLOB sources CONFIGURE_DEPENDS
		"${CMAKE_CURRENT_SOURCE_DIR}/src/*.cpp" "${CMAKE_CURRENT_SOURCE_DIR}/src/*/*.cpp")
	add_library(${inTarget} ${sources})
	add_library(${inTarget}::${inTarget} ALIAS ${inTarget})
	zon_target_defaults(${inTarget})
	target_include_directories(${inTarget} PUBLIC
		"$<BUILD_INTERFACE:${zonmediatypes_SOURCE_DIR}>"
		"$<BUILD_INTERFACE:${zonmediatypes_BINARY_DIR}/include>"
		"$<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>")
	target_compile_options(${inTarget} PUBLIC ${ZON_PUBLIC_OPTIONS})
	target_compile_definitions(${inTarget} PRIVATE ${inMacro}_BUILDING)
	get_target_property(type ${inTarget} TYPE)
	if(type STREQUAL "STATIC_LIBRARY")
		target_compile_definitions(${inTarget} PUBLIC ${inMacro}_STATIC)
	endif()
	if(type STREQUAL "SHARED_LIBRARY" AND CMAKE_SYSTEM_NAME STREQUAL "Linux")
		set(exports "${CMAKE_CURRENT_SOURCE_DIR}/exports.map")
		target_link_options(${inTarget} PRIVATE "LINKER:--version-script=${exports}")
		set_target_properties(${inTarget} PROPERTIES LINK_DEPENDS "${exports}")
	endif()
	set_target_properties(${inTarget} PROPERTIES
		VERSION ${zonmediatypes_VERSION}
		SOVERSION ${zonmediatypes_VERSION_MAJOR}
		POSITION_INDEPENDENT_CODE ON
		INSTALL_RPATH "${ZON_ORIGIN}")
endfunction()
