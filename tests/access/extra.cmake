# A module with a copy of the library, to be loaded beside the one that the tests are linked with.
if(NOT WIN32)
    add_library(access_copy MODULE access/copy/AccessCopy.cpp)
    tessal_use_objects(access_copy)
    target_compile_definitions(${program} PRIVATE "ACCESS_COPY=\"$<TARGET_FILE:access_copy>\"")
    target_link_libraries(${program} PRIVATE ${CMAKE_DL_LIBS})
    add_dependencies(${program} access_copy)
endif()
