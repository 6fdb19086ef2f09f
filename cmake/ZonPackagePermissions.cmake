# cpack runs this before it packs: folders are open to everybody, whatever the umask of who packs.
file(GLOB_RECURSE paths LIST_DIRECTORIES ON "${CPACK_TEMPORARY_INSTALL_DIRECTORY}/*")
foreach(path IN LISTS paths)
	if(IS_DIRECTORY "${path}")
		file(CHMOD "${path}" DIRECTORY_PERMISSIONS
			OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
	endif()
endforeach()
