# titler_add_artwork(TARGET COLLECTION) paints the pictures of a resource collection and compiles them into the static
# library TARGET. Programs that use it call Q_INIT_RESOURCE(COLLECTION).
function(titler_add_artwork target collection)
    set(folder ${CMAKE_CURRENT_BINARY_DIR}/artwork)
    set(compiled ${folder}/qrc_${collection}.cpp)
    add_custom_command(
        OUTPUT ${compiled}
        COMMAND ${CMAKE_COMMAND} -E make_directory ${folder}
        COMMAND ${CMAKE_COMMAND} -E env QT_QPA_PLATFORM=offscreen ASAN_OPTIONS=detect_leaks=0
                $<TARGET_FILE:titler_artwork> ${collection} ${folder}
        COMMAND Qt6::rcc --name ${collection} --output ${compiled} ${folder}/${collection}.qrc
        DEPENDS titler_artwork
        COMMENT "Painting ${collection}"
        VERBATIM)
    add_library(${target} STATIC ${compiled})
    set_source_files_properties(${compiled} PROPERTIES SKIP_AUTOGEN ON)
    target_link_libraries(${target} PUBLIC Qt6::Core)
endfunction()
