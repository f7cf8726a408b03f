# Runs PROGRAM and compares its output with the block behind "`guide_NAME` prints" in PAGE.

file(READ ${PAGE} page)
if(NOT page MATCHES "`guide_${NAME}` prints[^`]*```text\n([^`]*)```")
    message(FATAL_ERROR "${PAGE} does not show what guide_${NAME} prints")
endif()
set(expected "${CMAKE_MATCH_1}")
execute_process(COMMAND ${PROGRAM} OUTPUT_VARIABLE printed RESULT_VARIABLE status)
string(REPLACE "\r\n" "\n" printed "${printed}")
if(NOT status EQUAL 0 OR NOT printed STREQUAL expected)
    message(FATAL_ERROR "status ${status}, printed:\n${printed}but the page shows:\n${expected}")
endif()
