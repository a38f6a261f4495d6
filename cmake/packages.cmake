# Debian packages of the installation's components, as `./run --package` makes them with the preset
# "package": tzmted (programs), libtz1 (library), libtz-dev (development).
if(TZ_DEBIAN)
    # Everything lies where the system looks, so nothing needs to be found from a program.
    set(CMAKE_SKIP_INSTALL_RPATH ON)
    # `tz_products` is all that is installed; the rest need not be built.
    set(CMAKE_SKIP_INSTALL_ALL_DEPENDENCY ON)
    set(debian_files ${CMAKE_BINARY_DIR}/debian)
    tz_compressed(packaging/changelog changelog)
    foreach(pair programs:tzmted library:libtz1 development:libtz-dev)
        string(REGEX MATCH "(.*):(.*)" pair ${pair})
        install(FILES packaging/copyright ${changelog}
            DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${CMAKE_MATCH_2} COMPONENT ${CMAKE_MATCH_1})
        string(TOUPPER ${CMAKE_MATCH_1} COMPONENT)
        set(CPACK_DEBIAN_${COMPONENT}_PACKAGE_NAME ${CMAKE_MATCH_2})
    endforeach()
    # What other packages depend on that use the library, and that the loader learns of it.
    file(WRITE ${debian_files}/shlibs "libtz 1 libtz1 (>= ${PROJECT_VERSION})\n")
    file(WRITE ${debian_files}/triggers "activate-noawait ldconfig\n")
    set(CPACK_DEBIAN_LIBRARY_PACKAGE_CONTROL_EXTRA
        ${debian_files}/shlibs ${debian_files}/triggers)
endif()

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_CONTACT "tzmted developers <tzmted@users.invalid>")
set(CPACK_PACKAGE_VENDOR "tzmted developers")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_COMPONENTS_ALL programs library development)
set(CPACK_STRIP_FILES ON)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_BINARY_DIR}/lib)
# Components of one build belong together.
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS ON)
set(CPACK_COMPONENT_PROGRAMS_DEPENDS library)
set(CPACK_COMPONENT_DEVELOPMENT_DEPENDS library programs)

set(CPACK_DEBIAN_PROGRAMS_PACKAGE_SECTION graphics)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SECTION libs)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_PROGRAMS_DESCRIPTION
    "drafting at a command line, and conversion of drawing texts
tzdraft opens drawings, runs commands that a person types or a script
gives, and plots to SVG, PNG and PDF. Its text commands write and edit
multi-line texts, change their properties and align them. tzconvert turns
the markup of such texts into RTF and back.")
set(CPACK_DEBIAN_LIBRARY_DESCRIPTION
    "headless drafting host (shared library)
The library holds a whole drafting host without a screen: drawings, command
line, selection, text layout and plots. Modules with commands are loaded
into it.")
set(CPACK_DEBIAN_DEVELOPMENT_DESCRIPTION
    "headless drafting host (development files)
Headers, CMake and pkg-config packages to build modules with commands for
the host, and modules that call the text commands of tzmted.")
include(CPack)
