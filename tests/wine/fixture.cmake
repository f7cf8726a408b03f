# Starts Wine before the first test and ends it behind the last one.

add_executable(wine_stay wine/stay.cpp)
add_executable(wine_nop wine/nop.cpp)
string(REPLACE ";" " " TESSAL_WINE "${CMAKE_CROSSCOMPILING_EMULATOR}")
add_test(NAME wine_up COMMAND sh -c "mkdir -p ${TESSAL_WINE_PREFIX}
setsid ${TESSAL_WINE} $<TARGET_FILE:wine_stay> >/dev/null 2>&1 &
${TESSAL_WINE} $<TARGET_FILE:wine_nop> >/dev/null 2>&1; exit 0")
add_test(NAME wine_down COMMAND env WINEPREFIX=${TESSAL_WINE_PREFIX} /usr/lib/wine/wineserver64 -k)
set_tests_properties(wine_up PROPERTIES FIXTURES_SETUP wine)
set_tests_properties(wine_down PROPERTIES FIXTURES_CLEANUP wine)
