# Compiles HEADER as C++17, which must fail with one message that names what is needed, and not with what follows from it.
#   cmake -DCOMPILER=... -DINCLUDES=-I...;-I... -DHEADERS=... -DSCRATCH=FILE -P CheckStandard.cmake
foreach(header IN LISTS HEADERS)
	file(WRITE "${SCRATCH}" "#include \"${header}\"\n")
	execute_process(COMMAND ${COMPILER} -std=c++17 -fsyntax-only ${INCLUDES} "${SCRATCH}"
		RESULT_VARIABLE result ERROR_VARIABLE messages OUTPUT_QUIET)
	string(REGEX MATCHALL ": error: " errors "${messages}")
	if(result EQUAL 0 OR NOT messages MATCHES "needs C\\+\\+20: compile with" OR NOT errors STREQUAL ": error: ")
		message(SEND_ERROR "${header} as C++17: ${messages}")
	endif()
endforeach()
