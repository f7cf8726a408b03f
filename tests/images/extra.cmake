# The generator as a program.
if(TARGET tessal_prom)
    add_test(NAME prom_example
             COMMAND tessal_prom -generic -output prom_example -data ${PROJECT_SOURCE_DIR}/LICENSE)
    set_tests_properties(prom_example PROPERTIES PASS_REGULAR_EXPRESSION "PROM 1 of 1 .generic.: prom_example.mcs"
                         FIXTURES_REQUIRED "$<$<BOOL:${WIN32}>:wine>")
endif()
