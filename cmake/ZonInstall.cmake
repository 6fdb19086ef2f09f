# What is installed, as three components that become the three Debian packages: runtime (the libraries and the message
# catalogues), development (headers and everything that finds the libraries) and companion (zonmedia).
#
# A shared and a static build may be installed into the same prefix; the CMake package chooses, see its file.
include(CMakePackageConfigHelpers)

set(package "${CMAKE_INSTALL_LIBDIR}/cmake/zonmediatypes")
set(generated "${zonmediatypes_BINARY_DIR}/package")
set(linkage static)
if(BUILD_SHARED_LIBS)
	set(linkage shared)
endif()

foreach(library IN ITEMS zoncore zonmediatypes)
	install(TARGETS ${library} EXPORT ${library}Targets
		LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}" COMPONENT runtime NAMELINK_COMPONENT development
		ARCHIVE DESTINATION "${CMAKE_INSTALL_LIBDIR}" COMPONENT development
		RUNTIME DESTINATION "${CMAKE_INSTALL_BINDIR}" COMPONENT runtime)   # a DLL
	install(EXPORT ${library}Targets NAMESPACE ${library}:: FILE ${library}-${linkage}-targets.cmake
		DESTINATION "${package}" COMPONENT development)
	install(DIRECTORY "${zonmediatypes_SOURCE_DIR}/${library}/" DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/${library}"
		COMPONENT development FILES_MATCHING PATTERN "*.h" PATTERN src EXCLUDE)
endforeach()
install(FILES "${zonmediatypes_BINARY_DIR}/include/zonmediatypes/Version.h"
	DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/zonmediatypes" COMPONENT development)

configure_package_config_file("${CMAKE_CURRENT_LIST_DIR}/zonmediatypesConfig.cmake.in"
	"${generated}/zonmediatypesConfig.cmake" INSTALL_DESTINATION "${package}"
	PATH_VARS ZON_INSTALL_LOCALEDIR NO_SET_AND_CHECK_MACRO)
write_basic_package_version_file("${generated}/zonmediatypesConfigVersion.cmake"
	VERSION ${zonmediatypes_VERSION} COMPATIBILITY SameMajorVersion)
install(FILES "${generated}/zonmediatypesConfig.cmake" "${generated}/zonmediatypesConfigVersion.cmake"
	DESTINATION "${package}" COMPONENT development)

# The .pc files find the prefix from where they lie, so that an installation can be moved.
file(RELATIVE_PATH prefixFromPkgConfig "/prefix/${CMAKE_INSTALL_LIBDIR}/pkgconfig" /prefix)
string(REGEX REPLACE "/$" "" prefixFromPkgConfig "${prefixFromPkgConfig}")
list(JOIN ZON_PUBLIC_OPTIONS " " ZON_PUBLIC_OPTIONS_TEXT)
foreach(library IN ITEMS zoncore zonmediatypes)
	configure_file("${CMAKE_CURRENT_LIST_DIR}/${library}.pc.in" "${generated}/${library}.pc" @ONLY)
	install(FILES "${generated}/${library}.pc" DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig" COMPONENT development)
endforeach()

# gdb loads what lies here under the path of a library when it meets the library.
install(FILES "${zonmediatypes_SOURCE_DIR}/tools/gdb/zonmediatypes.py"
	DESTINATION "${CMAKE_INSTALL_DATADIR}/gdb/auto-load${CMAKE_INSTALL_FULL_LIBDIR}"
	RENAME "libzonmediatypes.so.${zonmediatypes_VERSION}-gdb.py" COMPONENT development)

if(TARGET zonmedia)
	file(RELATIVE_PATH librariesFromPrograms "/prefix/${CMAKE_INSTALL_BINDIR}" "/prefix/${CMAKE_INSTALL_LIBDIR}")
	set_target_properties(zonmedia PROPERTIES INSTALL_RPATH "${ZON_ORIGIN}/${librariesFromPrograms}")
	install(TARGETS zonmedia RUNTIME DESTINATION "${CMAKE_INSTALL_BINDIR}" COMPONENT companion)
	install(FILES "${zonmediatypes_SOURCE_DIR}/zonmedia/completion.bash"
		DESTINATION "${CMAKE_INSTALL_DATADIR}/bash-completion/completions" RENAME zonmedia COMPONENT companion)
endif()

if(PROJECT_IS_TOP_LEVEL)
	include(ZonPackages)
endif()
