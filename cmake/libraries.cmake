# Third-party libraries of the embedded host and the programs, under the names that the layer table
# uses. All are Debian packages; the module itself uses none of them.
find_package(PkgConfig REQUIRED)
find_package(Threads REQUIRED)
pkg_check_modules(FONTCONFIG REQUIRED IMPORTED_TARGET fontconfig)
pkg_check_modules(PANGO REQUIRED IMPORTED_TARGET pango pangocairo pangoft2)
pkg_check_modules(CAIRO REQUIRED IMPORTED_TARGET cairo cairo-svg cairo-png cairo-pdf)
pkg_check_modules(EDITLINE REQUIRED IMPORTED_TARGET libedit)

foreach(library json fastjson ini fontconfig pango cairo boxes cli editline)
    add_library(tz_library_${library} INTERFACE)
endforeach()
target_link_libraries(tz_library_ini INTERFACE simpleini)
# Boost tells of headers of its own that it includes.
target_compile_definitions(tz_library_boxes INTERFACE BOOST_ALLOW_DEPRECATED_HEADERS)
target_link_libraries(tz_library_fontconfig INTERFACE PkgConfig::FONTCONFIG)
target_link_libraries(tz_library_pango INTERFACE PkgConfig::PANGO)
target_link_libraries(tz_library_cairo INTERFACE PkgConfig::CAIRO)
target_link_libraries(tz_library_editline INTERFACE PkgConfig::EDITLINE)
