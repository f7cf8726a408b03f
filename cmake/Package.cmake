# Packages by CPack: for Debian one each of library, data files, headers and tools; for Windows one archive.
#
#     cpack --config build/package/CPackConfig.cmake -B build/package
#
# tests/suites/package-deb.sh and package-windows.sh make them from shared builds and use what is inside.

set(CPACK_PACKAGE_NAME TessalUtility)
set(CPACK_PACKAGE_VENDOR "The libTessalUtility authors")
set(CPACK_PACKAGE_CONTACT "The libTessalUtility authors <authors@tessalutility.invalid>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "${PROJECT_DESCRIPTION}")
set(CPACK_RESOURCE_FILE_LICENSE ${PROJECT_SOURCE_DIR}/LICENSE)
set(CPACK_COMPONENTS_ALL library data development tools)
if(NOT TESSAL_EXAMPLES)
    list(REMOVE_ITEM CPACK_COMPONENTS_ALL tools)
endif()
set(CPACK_STRIP_FILES ON)
set(CPACK_VERBATIM_VARIABLES ON)

if(WIN32)
    set(CPACK_GENERATOR ZIP)
    set(CPACK_PACKAGE_FILE_NAME "TessalUtility-${PROJECT_VERSION}-windows-x86_64")
    install(FILES README.md CHANGELOG.md LICENSE DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT library)
else()
    set(CPACK_GENERATOR DEB)
    set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
    set(CPACK_DEB_COMPONENT_INSTALL ON)
    set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
    set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS ON)

    # What the programs of a package are linked with, this library among it, becomes its dependencies.
    set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
    set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${PROJECT_BINARY_DIR}/lib)
    set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
    set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")

    function(tessal_debian_package component name section)
        cmake_parse_arguments(PARSE_ARGV 3 package "" "DEPENDS;CONTENT" "")
        string(TOUPPER ${component} upper)
        set(CPACK_DEBIAN_${upper}_PACKAGE_NAME ${name} PARENT_SCOPE)
        set(CPACK_DEBIAN_${upper}_PACKAGE_SECTION ${section} PARENT_SCOPE)
        set(CPACK_DEBIAN_${upper}_DESCRIPTION "${package_CONTENT}" PARENT_SCOPE)
        set(CPACK_COMPONENT_${upper}_DEPENDS ${package_DEPENDS} PARENT_SCOPE)
        set(documents ${CMAKE_INSTALL_DATADIR}/doc/${name})
        install(FILES LICENSE DESTINATION ${documents} COMPONENT ${component} RENAME copyright)
        install(FILES ${PROJECT_BINARY_DIR}/packaging/changelog.gz DESTINATION ${documents} COMPONENT ${component})
    endfunction()

    string(TIMESTAMP changelog_date "%a, %d %b %Y %H:%M:%S +0000" UTC)
    configure_file(cmake/debian-changelog.in packaging/changelog @ONLY)
    tessal_compress(${PROJECT_BINARY_DIR}/packaging/changelog ${PROJECT_BINARY_DIR}/packaging/changelog.gz)

    # The host's cache of libraries is renewed by dpkg's trigger.
    file(CONFIGURE OUTPUT packaging/triggers CONTENT "activate-noawait ldconfig\n")
    set(CPACK_DEBIAN_LIBRARY_PACKAGE_CONTROL_EXTRA ${PROJECT_BINARY_DIR}/packaging/triggers)

    # The name of the library's package ends in the number of its SONAME, so that two of them can stand side by side.
    # The data files, which both would read, are a package for itself.
    tessal_debian_package(library libtessalutility${PROJECT_VERSION_MAJOR} libs CONTENT "The shared library.")
    set(CPACK_DEBIAN_LIBRARY_PACKAGE_DEPENDS "tessalutility-data (>= ${PROJECT_VERSION})")
    tessal_debian_package(data tessalutility-data electronics
                          CONTENT "Data files: batch commands, preferences, parts and devices.")
    set(CPACK_DEBIAN_DATA_PACKAGE_ARCHITECTURE all)
    tessal_debian_package(development libtessalutility-dev libdevel DEPENDS library
                          CONTENT "Headers, and what CMake, pkg-config and debuggers need.")
    tessal_debian_package(tools tessal-tools electronics DEPENDS library
                          CONTENT "Batch prompt, simulated device and PROM file generator.")
endif()

include(CPack)
