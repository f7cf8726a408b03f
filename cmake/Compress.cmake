# tessal_compress(FILE COMPRESSED): writes a file as gzip does, always the same for the same content. Again at each
# configuration, which a changed file asks for.
function(tessal_compress file compressed)
    set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${file})
    get_filename_component(folder ${compressed} DIRECTORY)
    file(MAKE_DIRECTORY ${folder})
    file(ARCHIVE_CREATE OUTPUT ${compressed} PATHS ${file} FORMAT raw COMPRESSION GZip COMPRESSION_LEVEL 9)
endfunction()
