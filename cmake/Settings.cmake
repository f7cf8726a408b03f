# What every target of the project is compiled with, the library and what stands around it alike.

set(CMAKE_EXPORT_COMPILE_COMMANDS ON)

if(TESSAL_TOP_LEVEL AND NOT CMAKE_BUILD_TYPE AND NOT CMAKE_CONFIGURATION_TYPES)
    set(CMAKE_BUILD_TYPE Release CACHE STRING "Build type" FORCE)
endif()

find_program(TESSAL_CCACHE ccache)
if(TESSAL_TOP_LEVEL AND TESSAL_CCACHE AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
    set(CMAKE_CXX_COMPILER_LAUNCHER ${TESSAL_CCACHE})
endif()

if(WIN32)
    set(TESSAL_HOST_LIBRARIES ws2_32 setupapi cfgmgr32)
endif()

# g++ for 64-bit Windows aligns the stack to 16 bytes and yet moves 32-byte vectors on it with aligned moves; the
# assembler turns those into unaligned ones. Without that the vectors stay out.
if(MINGW AND CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    include(CheckCXXCompilerFlag)
    check_cxx_compiler_flag(-Wa,-muse-unaligned-vector-move TESSAL_UNALIGNED_VECTOR_MOVES)
    if(TESSAL_UNALIGNED_VECTOR_MOVES)
        add_compile_options(-Wa,-muse-unaligned-vector-move)
    else()
        add_compile_definitions(TESSAL_NO_WIDE_VECTORS)
    endif()
endif()

function(tessal_settings target)
    target_compile_features(${target} PUBLIC cxx_std_17)
    set_target_properties(${target} PROPERTIES
                          CXX_EXTENSIONS OFF
                          CXX_VISIBILITY_PRESET hidden
                          VISIBILITY_INLINES_HIDDEN ON)
    if(MSVC)
        target_compile_options(${target} PRIVATE /W4 $<$<BOOL:${TESSAL_WERROR}>:/WX>)
    else()
        target_compile_options(${target} PRIVATE -Wall -Wextra -Wpedantic -Wconversion -Wshadow
                               $<$<BOOL:${TESSAL_WERROR}>:-Werror>)
    endif()
    if(WIN32)
        target_compile_definitions(${target} PRIVATE WIN32_LEAN_AND_MEAN NOMINMAX)
    endif()
    if(TESSAL_SANITIZE)
        target_compile_options(${target} PRIVATE -fsanitize=${TESSAL_SANITIZE} -fno-sanitize-recover=all
                               -fno-omit-frame-pointer)
        target_link_options(${target} PUBLIC -fsanitize=${TESSAL_SANITIZE})
    endif()
endfunction()

# For programs inside the tree that use the library's objects, exported or not.
function(tessal_use_objects target)
    tessal_settings(${target})
    target_include_directories(${target} PRIVATE ${PROJECT_SOURCE_DIR}/include ${PROJECT_SOURCE_DIR})
    target_compile_definitions(${target} PRIVATE TESSALUTILITY_STATIC)
    target_link_libraries(${target} PRIVATE tessal_internal)
endfunction()
