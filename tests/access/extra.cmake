# A module with a copy of the library, to be loaded beside the one that the tests are linked with.
if(NOT WIN32)
    add_library(access_copy MODULE access/copy/AccessCopy.cpp)
    tessal_use_objects(access_copy)
    target_compile_definitions(${program} PRIVATE "ACCESS_COPY=\"$<TARGET_FILE:access_copy>\"")
    target_link_libraries(${program} PRIVATE ${CMAKE_DL_LIBS})
    add_dependencies(${program} access_copy)
endif()

# cmake --build --preset dev --target sharing: the table of docs/sharing.md with what its tests say now.
if(NOT WIN32)
    find_program(TESSAL_SPIN spin)
    set(model_check "")
    if(TESSAL_SPIN)
        set(model_check ${CMAKE_CURRENT_SOURCE_DIR}/models/check.sh ${CMAKE_CURRENT_SOURCE_DIR}/models/semaphore.pml
                        ${CMAKE_CURRENT_BINARY_DIR})
    endif()
    add_custom_target(sharing
                      COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/access/promise.sh ${PROJECT_SOURCE_DIR}/docs/sharing.md
                              $<TARGET_FILE:${program}> ${model_check}
                      DEPENDS ${program} USES_TERMINAL VERBATIM)
endif()
