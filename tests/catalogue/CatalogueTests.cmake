# A row of the catalogue of pixel formats that contradicts itself does not compile, and the compiler says why.
add_test(NAME Catalogue.ContradictoryRowsDoNotCompile COMMAND ${CMAKE_COMMAND}
	-DCOMPILER=${CMAKE_CXX_COMPILER}
	-DSOURCE=${CMAKE_CURRENT_SOURCE_DIR}/catalogue/ContradictoryRows.cpp
	"-DINCLUDES=-I${zonmediatypes_SOURCE_DIR};-I${zonmediatypes_BINARY_DIR}/include"
	-P ${CMAKE_CURRENT_SOURCE_DIR}/catalogue/CheckRows.cmake)
