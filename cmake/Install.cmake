# Install rules: library, headers, data, CMake package and pkg-config file.

include(CMakePackageConfigHelpers)

install(TARGETS TessalUtility EXPORT TessalUtilityTargets
        RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT library
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT library NAMELINK_COMPONENT development
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT development)
install(FILES ${TESSAL_HEADERS} DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/TessalUtility COMPONENT development)
install(DIRECTORY data/ DESTINATION ${CMAKE_INSTALL_DATADIR}/TessalUtility COMPONENT data
        FILES_MATCHING PATTERN "*.acd" PATTERN "*.dat")
install(DIRECTORY debug/ DESTINATION ${CMAKE_INSTALL_DATADIR}/TessalUtility/debug COMPONENT development)

set(TESSAL_CMAKE_DIR ${CMAKE_INSTALL_LIBDIR}/cmake/TessalUtility)
install(EXPORT TessalUtilityTargets NAMESPACE TessalUtility:: DESTINATION ${TESSAL_CMAKE_DIR} COMPONENT development)
configure_package_config_file(cmake/TessalUtilityConfig.cmake.in
                              ${PROJECT_BINARY_DIR}/TessalUtilityConfig.cmake
                              INSTALL_DESTINATION ${TESSAL_CMAKE_DIR})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/TessalUtilityConfigVersion.cmake
                                 COMPATIBILITY SameMinorVersion)
install(FILES ${PROJECT_BINARY_DIR}/TessalUtilityConfig.cmake ${PROJECT_BINARY_DIR}/TessalUtilityConfigVersion.cmake
        DESTINATION ${TESSAL_CMAKE_DIR} COMPONENT development)

# A static library's callers link what it calls, too.
set(TESSAL_PC_CFLAGS "")
set(TESSAL_PC_LIBS "")
if(NOT BUILD_SHARED_LIBS)
    set(TESSAL_PC_CFLAGS " -DTESSALUTILITY_STATIC")
    set(TESSAL_PC_LIBS " ${CMAKE_THREAD_LIBS_INIT}")
    foreach(library IN LISTS TESSAL_HOST_LIBRARIES)
        string(APPEND TESSAL_PC_LIBS " -l${library}")
    endforeach()
endif()
# The file finds its prefix from its own place, so an installation may be moved.
file(RELATIVE_PATH TESSAL_PC_PREFIX ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig ${CMAKE_INSTALL_PREFIX})
file(RELATIVE_PATH TESSAL_PC_LIBDIR ${CMAKE_INSTALL_PREFIX} ${CMAKE_INSTALL_FULL_LIBDIR})
file(RELATIVE_PATH TESSAL_PC_INCLUDEDIR ${CMAKE_INSTALL_PREFIX} ${CMAKE_INSTALL_FULL_INCLUDEDIR})
configure_file(cmake/tessalutility.pc.in ${PROJECT_BINARY_DIR}/tessalutility.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/tessalutility.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig
        COMPONENT development)
