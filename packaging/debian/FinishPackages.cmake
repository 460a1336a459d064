# CPack runs this on its packages: it brings them into the form that Debian's policy requires.

set(finish "${CMAKE_CURRENT_LIST_DIR}/finish-package")
foreach(package IN LISTS CPACK_PACKAGE_FILES)
  execute_process(COMMAND "${finish}" "${package}" COMMAND_ERROR_IS_FATAL ANY)
endforeach()
