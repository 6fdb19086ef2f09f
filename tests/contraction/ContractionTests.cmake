# The project's options keep multiply-adds apart even where the processor could contract them; and it matters: the same
# sources with contraction give another result.
include(CheckCXXCompilerFlag)
check_cxx_compiler_flag(-mfma ZON_HAS_FMA_OPTION)
set(contracting)
if(ZON_HAS_FMA_OPTION)
	set(contracting -mfma)
elseif(NOT CMAKE_SYSTEM_PROCESSOR MATCHES "^(aarch64|arm64|s390x)$")   # these contract without being asked
	return()
endif()

foreach(name ContractionOff ContractionOn)
	add_executable(${name} contraction/ContractionCase.cpp
		"${zonmediatypes_SOURCE_DIR}/zonmediatypes/src/sampleclock/BarsAndBeats.cpp"
		"${zonmediatypes_SOURCE_DIR}/zonmediatypes/src/sampleclock/Misuse.cpp")
	zon_target_defaults(${name})
	target_link_libraries(${name} PRIVATE zoncore::zoncore)
	target_compile_definitions(${name} PRIVATE ZONMEDIATYPES_STATIC)   # its sources are linked in as they are
	target_compile_options(${name} PRIVATE -O2 ${contracting})
	add_test(NAME FloatingPoint.${name} COMMAND ${name})
	set_tests_properties(FloatingPoint.${name} PROPERTIES SKIP_RETURN_CODE 77)
endforeach()
target_compile_options(ContractionOn PRIVATE -ffp-contract=fast)
set_tests_properties(FloatingPoint.ContractionOn PROPERTIES PASS_REGULAR_EXPRESSION "^-31 samples")
