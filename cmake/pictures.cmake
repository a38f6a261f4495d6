# The pictures of the documents that show what a script draws; `--target pictures` makes them anew,
# with the fonts of the tests, so that they look alike whoever makes them.
add_custom_target(pictures)

#   tz_picture(NAME arguments of tzdraft...)
function(tz_picture name)
    set(environment LC_ALL=C.UTF-8 FONTCONFIG_FILE=${TZ_TEST_FONTS_CONF})
    add_custom_command(TARGET pictures POST_BUILD
        COMMAND ${CMAKE_COMMAND} -E env ${environment} $<TARGET_FILE:tzdraft> ${ARGN}
            --png docs/pictures/${name}.png > ${CMAKE_BINARY_DIR}/pictures.log
        WORKING_DIRECTORY ${PROJECT_SOURCE_DIR} VERBATIM)
endfunction()

add_dependencies(pictures tz_products)
tz_picture(markup --script docs/pictures/markup.scr)
foreach(aligned symbol-labels wall-rooms spaced-notes two-planes title-line)
    tz_picture(${aligned}-before examples/${aligned}.json --script /dev/null)
    tz_picture(${aligned}-after examples/${aligned}.json --script examples/${aligned}.scr)
endforeach()
