# Included by the tests' CMakeLists.txt: the library as others get it.

# Each public header compiles alone.
file(GLOB_RECURSE publicHeaders CONFIGURE_DEPENDS RELATIVE "${zonmediatypes_SOURCE_DIR}"
	"${zonmediatypes_SOURCE_DIR}/zoncore/*.h" "${zonmediatypes_SOURCE_DIR}/zonmediatypes/*.h")
list(FILTER publicHeaders EXCLUDE REGEX "/src/")
set(loneHeaders)
foreach(header IN LISTS publicHeaders)
	string(REGEX REPLACE "[/.]" "_" name "${header}")
	set(lone "${CMAKE_CURRENT_BINARY_DIR}/headers/${name}.cpp")
	file(CONFIGURE OUTPUT "${lone}" CONTENT "#include \"@header@\"\n#include \"@header@\"\n" @ONLY)
	list(APPEND loneHeaders "${lone}")
endforeach()
add_library(PublicHeaders OBJECT ${loneHeaders})
zon_target_defaults(PublicHeaders)
target_compile_options(PublicHeaders PRIVATE -O0)
target_link_libraries(PublicHeaders PRIVATE zonmediatypes::zonmediatypes)

# As C++17 each says in one message what it needs. The compilers that are asked are of the kind that knows these options.
if(NOT MSVC)
	set(testedHeaders ${publicHeaders})
	list(FILTER testedHeaders EXCLUDE REGEX "/interop/|/SourcePlace\\.h$")
	add_test(NAME Adoption.OneMessageForCxx17 COMMAND ${CMAKE_COMMAND} "-DCOMPILER=${CMAKE_CXX_COMPILER}"
		"-DINCLUDES=-I${zonmediatypes_SOURCE_DIR};-I${zonmediatypes_BINARY_DIR}/include" "-DHEADERS=${testedHeaders}"
		"-DSCRATCH=${CMAKE_CURRENT_BINARY_DIR}/headers/Cxx17.cpp" -P "${CMAKE_CURRENT_SOURCE_DIR}/adoption/CheckStandard.cmake")
endif()

# Installed or fetched, shared or static, found in three ways.
if(BUILD_SHARED_LIBS AND ZON_INSTALL)
	function(zon_add_adoption_test inWay)
		add_test(NAME Adoption.${inWay} COMMAND "${CMAKE_CURRENT_SOURCE_DIR}/adoption/adopt.sh" ${inWay}
			"${zonmediatypes_SOURCE_DIR}" "${zonmediatypes_BINARY_DIR}" "${CMAKE_CURRENT_BINARY_DIR}/adoption")
		set_tests_properties(Adoption.${inWay} PROPERTIES ENVIRONMENT "CXX=${CMAKE_CXX_COMPILER}" TIMEOUT 600 ${ARGN})
	endfunction()
	zon_add_adoption_test(install FIXTURES_SETUP SharedInstallation)
	zon_add_adoption_test(find_package-shared FIXTURES_REQUIRED SharedInstallation)
	zon_add_adoption_test(pkg-config-shared FIXTURES_REQUIRED SharedInstallation)
	zon_add_adoption_test(readme FIXTURES_REQUIRED SharedInstallation)
	if(TARGET zonmedia)
		zon_add_adoption_test(companion FIXTURES_REQUIRED SharedInstallation)
	endif()
	if(TARGET zonmedia AND TARGET translations)
		zon_add_adoption_test(translations FIXTURES_REQUIRED SharedInstallation)
	endif()
	find_program(ZON_DPKG_SHLIBDEPS dpkg-shlibdeps)
	if(ZON_DPKG_SHLIBDEPS)
		zon_add_adoption_test(packages FIXTURES_REQUIRED SharedInstallation)
	endif()
	zon_add_adoption_test(FetchContent-static FIXTURES_SETUP StaticInstallation PROCESSORS 2)
	zon_add_adoption_test(find_package-static FIXTURES_REQUIRED StaticInstallation)
	zon_add_adoption_test(pkg-config-static FIXTURES_REQUIRED StaticInstallation)
endif()
