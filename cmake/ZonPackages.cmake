# The Debian packages, made with the package preset: cmake --workflow --preset package
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME zonmediatypes)
set(CPACK_PACKAGE_VENDOR zonmediatypes)
set(CPACK_PACKAGE_CONTACT "zonmediatypes developers")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")   # each package says in a line of its own what it holds
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_STRIP_FILES ON)
set(CPACK_PRE_BUILD_SCRIPTS "${CMAKE_CURRENT_LIST_DIR}/ZonPackagePermissions.cmake")
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)

set(CPACK_COMPONENTS_ALL runtime development)
if(TARGET zonmedia)
	list(APPEND CPACK_COMPONENTS_ALL companion)
endif()
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS ON)
set(CPACK_COMPONENT_DEVELOPMENT_DEPENDS runtime)
set(CPACK_COMPONENT_COMPANION_DEPENDS runtime)

# What the programs and libraries are linked with becomes their dependencies.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")   # a later release with this SOVERSION serves, too
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS
	"${zonmediatypes_BINARY_DIR}/zoncore" "${zonmediatypes_BINARY_DIR}/zonmediatypes")

set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME libzonmediatypes${zonmediatypes_VERSION_MAJOR})
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
set(CPACK_COMPONENT_RUNTIME_DESCRIPTION "Media value types: the shared libraries")
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libzonmediatypes-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS libboost-dev)   # the public headers show boost::rational
set(CPACK_COMPONENT_DEVELOPMENT_DESCRIPTION "Media value types: headers, CMake package and pkg-config files")
set(CPACK_DEBIAN_COMPANION_PACKAGE_NAME zonmedia)
set(CPACK_DEBIAN_COMPANION_PACKAGE_SECTION video)
set(CPACK_COMPONENT_COMPANION_DESCRIPTION "Times, rates, channels and pixel formats of media files on the command line")
include(CPack)
