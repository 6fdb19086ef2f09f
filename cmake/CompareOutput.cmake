# Runs a program and fails unless it succeeds and writes exactly what a file holds.
#   cmake -DPROGRAM=... [-DARGUMENT=...] [-DEMULATOR=...] -DEXPECTED=FILE -P CompareOutput.cmake
# With -DUPDATE=ON the file is written instead. The emulator, if there is one, is a command line that the program is added to.

separate_arguments(EMULATOR)
execute_process(COMMAND ${EMULATOR} "${PROGRAM}" ${ARGUMENT} OUTPUT_VARIABLE output RESULT_VARIABLE status)
if(NOT status EQUAL 0)
	message(FATAL_ERROR "${PROGRAM} ${ARGUMENT} ended with ${status}")
endif()
string(REPLACE "\r\n" "\n" output "${output}")   # as Windows ends lines
if(UPDATE)
	file(WRITE "${EXPECTED}" "${output}")
	return()
endif()
file(READ "${EXPECTED}" expected)
if(NOT output STREQUAL expected)
	message(FATAL_ERROR "${PROGRAM} ${ARGUMENT} wrote\n${output}\nwhere ${EXPECTED} holds\n${expected}")
endif()
