# Runs a program and fails unless it succeeds and writes exactly what a file holds.
#   cmake -DPROGRAM=... [-DARGUMENT=...] -DEXPECTED=FILE -P CompareOutput.cmake
# With -DUPDATE=ON the file is written instead.

execute_process(COMMAND "${PROGRAM}" ${ARGUMENT} OUTPUT_VARIABLE output RESULT_VARIABLE status)
if(NOT status EQUAL 0)
	message(FATAL_ERROR "${PROGRAM} ${ARGUMENT} ended with ${status}")
endif()
if(UPDATE)
	file(WRITE "${EXPECTED}" "${output}")
	return()
endif()
file(READ "${EXPECTED}" expected)
if(NOT output STREQUAL expected)
	message(FATAL_ERROR "${PROGRAM} ${ARGUMENT} wrote\n${output}\nwhere ${EXPECTED} holds\n${expected}")
endif()
