# Ends of a conversation in processes of their own: with a peer in another language here, and with the other host's
# library in the suite interwork.

add_executable(transport_peer transport/peer/main.cpp)
tessal_settings(transport_peer)
target_link_libraries(transport_peer PRIVATE TessalUtility::TessalUtility)

if(CMAKE_HOST_UNIX)
    string(REPLACE ";" " " emulator "${CMAKE_CROSSCOMPILING_EMULATOR}")
    add_test(NAME transport.python
             COMMAND sh -c "command -v python3 >/dev/null || { echo 'skipped: there is no python3'; exit 77; }
exec python3 ${CMAKE_CURRENT_SOURCE_DIR}/transport/peer.py ${emulator} $<TARGET_FILE:transport_peer>")
    set_tests_properties(transport.python PROPERTIES TIMEOUT 120 SKIP_RETURN_CODE 77)
    if(WIN32)
        set_tests_properties(transport.python PROPERTIES FIXTURES_REQUIRED wine)
    endif()
endif()
