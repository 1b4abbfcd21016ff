# Makes the Debian packages of the shared build below PLACE, and checks them.
file(REMOVE_RECURSE ${PLACE}/debs)
execute_process(COMMAND ${CPACK} -G DEB -B ${PLACE}/debs --config CPackConfig.cmake
    WORKING_DIRECTORY ${PLACE}/build-shared OUTPUT_QUIET COMMAND_ERROR_IS_FATAL ANY)
execute_process(COMMAND ${CMAKE_CURRENT_LIST_DIR}/check-debs ${PLACE}/debs ${SOURCES}
    COMMAND_ERROR_IS_FATAL ANY)
