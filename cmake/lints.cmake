# Lints are tests like any other; the scripts need nothing but Python's standard library.
set(lint ${PROJECT_SOURCE_DIR}/scripts/lint)
add_lint(layers Python3::Interpreter ${lint}/layers.py)
# The build draws the picture of the folders that docs/overview.md shows.
add_custom_command(OUTPUT ${CMAKE_BINARY_DIR}/layers.svg
    COMMAND Python3::Interpreter ${lint}/picture.py ${CMAKE_BINARY_DIR}/layers.svg
    DEPENDS ${PROJECT_SOURCE_DIR}/cmake/layers.cmake ${lint}/picture.py VERBATIM)
add_custom_target(tz_picture ALL DEPENDS ${CMAKE_BINARY_DIR}/layers.svg)
add_lint(picture Python3::Interpreter ${lint}/picture.py ${CMAKE_BINARY_DIR}/layers.svg
    ${PROJECT_SOURCE_DIR}/docs/pictures/layers.svg)
add_lint(sources Python3::Interpreter ${lint}/sources.py)
add_lint(words Python3::Interpreter ${lint}/words.py)
add_lint(format Python3::Interpreter ${lint}/format.py)
add_lint(exports Python3::Interpreter ${lint}/exports.py
    --list ${PROJECT_SOURCE_DIR}/module/shell/exports.txt
    --module ${CMAKE_BINARY_DIR}/lib/tzmted.tzx --archives ${CMAKE_BINARY_DIR}/archives)
add_lint(needed Python3::Interpreter ${lint}/needed.py --build ${CMAKE_BINARY_DIR})
# Compiles each header alone. One preset is enough for that.
if(NOT TZ_SANITIZE)
    add_lint(headers ${CMAKE_COMMAND} --build ${CMAKE_BINARY_DIR}
        --target all_verify_interface_header_sets -- -k 0)
    set_tests_properties(lint.headers PROPERTIES RUN_SERIAL ON)
endif()
# Only optimised code shows which initialisers are left to run time.
if(CMAKE_BUILD_TYPE STREQUAL "Release")
    add_lint(statics Python3::Interpreter ${lint}/statics.py --archives ${CMAKE_BINARY_DIR}/archives
        --list ${PROJECT_SOURCE_DIR}/module/shell/initialisers.txt)
endif()
