# Runs PROGRAM with ARGUMENTS and INPUT, and compares its exit status and its output with what is expected.

execute_process(COMMAND ${PROGRAM} ${ARGUMENTS} INPUT_FILE ${INPUT}
                OUTPUT_VARIABLE output ERROR_VARIABLE output RESULT_VARIABLE status)
string(REPLACE "\r\n" "\n" output "${output}")
if(DEFINED ENV{UPDATE_BATCH_CASES})
    file(WRITE ${EXPECTED} "${output}")
endif()
file(READ ${EXPECTED} expected)
string(REPLACE "\r\n" "\n" expected "${expected}")
if(NOT output STREQUAL expected)
    message(FATAL_ERROR "expected\n${expected}\nbut it printed\n${output}")
endif()
if(NOT status EQUAL STATUS)
    message(FATAL_ERROR "expected the exit status ${STATUS}, not ${status}")
endif()
