# The fonts that programs of the build tree and all tests see: links to Debian's fonts under the appliance's family names.
set(TITLER_FONTS_CONF ${CMAKE_BINARY_DIR}/fonts/fonts.conf)
add_custom_command(
    OUTPUT ${TITLER_FONTS_CONF}
    COMMAND ${CMAKE_SOURCE_DIR}/scripts/make-fonts ${CMAKE_BINARY_DIR}/fonts
    DEPENDS ${CMAKE_SOURCE_DIR}/scripts/make-fonts
    COMMENT "Linking the font families"
    VERBATIM)
add_custom_target(titler_fonts ALL DEPENDS ${TITLER_FONTS_CONF})
