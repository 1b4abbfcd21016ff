# Makes the program with make and pkg-config, from what is installed in PLACE/KIND, and runs it.
set(folder ${PLACE}/made-${KIND})
file(MAKE_DIRECTORY ${folder})
set(static)
if(KIND STREQUAL static)
    set(static --static)
endif()
execute_process(COMMAND make -B -f ${SOURCES}/makefile/Makefile
        PREFIX=${PLACE}/${KIND} SOURCE=${SOURCES}/consumer/main.cpp STATIC=${static}
    WORKING_DIRECTORY ${folder} COMMAND_ERROR_IS_FATAL ANY)
execute_process(COMMAND ${folder}/program ${SAMPLE} COMMAND_ERROR_IS_FATAL ANY)
