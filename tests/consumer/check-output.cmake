# Runs ${program} and compares what it prints with the file ${expected}.

execute_process(COMMAND ${emulator} ${program} OUTPUT_VARIABLE printed RESULT_VARIABLE status)
string(REPLACE "\r\n" "\n" printed "${printed}")
file(READ ${expected} wanted)
if(NOT status EQUAL 0 OR NOT printed STREQUAL wanted)
    message(FATAL_ERROR "status ${status}, printed:\n${printed}wanted:\n${wanted}")
endif()
