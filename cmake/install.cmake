# What `cmake --install` puts where. Three components, each a package: the programs with the module,
# the library, and what is needed to build modules.
#
# Programs and module find each other from where they lie, so an installation can be moved.
set(TZ_INSTALL_CMAKE ${CMAKE_INSTALL_LIBDIR}/cmake/tz)
set(TZ_INSTALL_PC ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
file(RELATIVE_PATH way ${CMAKE_INSTALL_FULL_BINDIR} ${CMAKE_INSTALL_FULL_LIBDIR})
set_target_properties(tzdraft PROPERTIES INSTALL_RPATH $ORIGIN/${way})
set_target_properties(tzmted PROPERTIES INSTALL_RPATH $ORIGIN/..)

# A Debian package holds manual pages and the like compressed: `out` is the file to install, made
# with `tz_products`.
function(tz_compressed file out)
    get_filename_component(file ${file} ABSOLUTE)
    if(TZ_DEBIAN)
        get_filename_component(name ${file} NAME)
        file(RELATIVE_PATH way ${CMAKE_BINARY_DIR} ${file})
        string(MAKE_C_IDENTIFIER ${way} folder)
        set(packed ${CMAKE_BINARY_DIR}/debian/${folder}/${name}.gz)
        add_custom_command(OUTPUT ${packed} DEPENDS ${file}
            COMMAND ${CMAKE_COMMAND} -E make_directory ${CMAKE_BINARY_DIR}/debian/${folder}
            COMMAND gzip -9nc ${file} > ${packed} VERBATIM)
        add_custom_target(packed_${folder} DEPENDS ${packed})
        add_dependencies(tz_products packed_${folder})
        set(file ${packed})
    endif()
    set(${out} ${file} PARENT_SCOPE)
endfunction()

install(TARGETS tzdraft tzconvert COMPONENT programs)
install(TARGETS tzmted LIBRARY DESTINATION ${TZ_INSTALL_BESIDE} COMPONENT programs)
install(FILES README.md DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT programs)
install(DIRECTORY docs DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT programs
    PATTERN man EXCLUDE)
install(DIRECTORY examples DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT programs
    FILES_MATCHING PATTERN *.scr PATTERN *.json
    PATTERN second_module EXCLUDE PATTERN other_host EXCLUDE)
install(FILES packaging/tzdraft.desktop
    DESTINATION ${CMAKE_INSTALL_DATADIR}/applications COMPONENT programs)
install(FILES packaging/tz-drawing.xml
    DESTINATION ${CMAKE_INSTALL_DATADIR}/mime/packages COMPONENT programs)
install(FILES packaging/tzdraft.svg
    DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps COMPONENT programs)
include(${CMAKE_CURRENT_LIST_DIR}/option_pages.cmake)

install(TARGETS tz EXPORT tzTargets
    LIBRARY COMPONENT library NAMELINK_COMPONENT development)
install(DIRECTORY sdk/tz DESTINATION ${CMAKE_INSTALL_INCLUDEDIR} COMPONENT development
    FILES_MATCHING PATTERN *.h)
install(DIRECTORY examples/second_module examples/other_host
    DESTINATION ${CMAKE_INSTALL_DOCDIR}/examples COMPONENT development)

# For find_package(tz).
include(CMakePackageConfigHelpers)
configure_package_config_file(cmake/tzConfig.cmake.in ${CMAKE_BINARY_DIR}/tzConfig.cmake
    INSTALL_DESTINATION ${TZ_INSTALL_CMAKE} PATH_VARS TZ_INSTALL_BESIDE)
write_basic_package_version_file(${CMAKE_BINARY_DIR}/tzConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(EXPORT tzTargets NAMESPACE tz:: DESTINATION ${TZ_INSTALL_CMAKE} COMPONENT development)
install(FILES ${CMAKE_BINARY_DIR}/tzConfig.cmake ${CMAKE_BINARY_DIR}/tzConfigVersion.cmake
    cmake/tz_module.cmake DESTINATION ${TZ_INSTALL_CMAKE} COMPONENT development)

# For pkg-config.
file(RELATIVE_PATH TZ_PC_TO_PREFIX
    ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig ${CMAKE_INSTALL_PREFIX})
foreach(name tz tzmted)
    configure_file(cmake/${name}.pc.in ${CMAKE_BINARY_DIR}/${name}.pc @ONLY)
    install(FILES ${CMAKE_BINARY_DIR}/${name}.pc DESTINATION ${TZ_INSTALL_PC}
        COMPONENT development)
endforeach()
