# Fails unless the file WHOLE holds the text of the file PART as it stands.
#   cmake -DPART=FILE -DWHOLE=FILE -P CheckContains.cmake

file(READ "${PART}" part)
file(READ "${WHOLE}" whole)
string(FIND "${whole}" "${part}" place)
if(place EQUAL -1)
	message(FATAL_ERROR "${WHOLE} no longer shows ${PART}")
endif()
