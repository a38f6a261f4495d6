# The products, made of the layers.

# The ground of the host for programs without libtz: archives that call each other through the
# operations of sdk/, so the linker reads them until nothing is missing.
add_library(tz_ground INTERFACE)
target_link_libraries(tz_ground INTERFACE $<LINK_GROUP:RESCAN,host_base,host_geometry,host_text,host_files,host_settings,host_code_pages,host_fonts,host_rtf,host_resources,host_platform>)

# The embedded host: every host layer whole, so that what only the module calls is in it too.
tz_layers_in("^host/" layers)
add_library(tz SHARED ${CMAKE_CURRENT_LIST_DIR}/empty.cpp)
foreach(layer IN LISTS layers)
    target_link_libraries(tz PRIVATE $<LINK_LIBRARY:WHOLE_ARCHIVE,${layer}>)
endforeach()
target_link_libraries(tz PRIVATE Threads::Threads ${CMAKE_DL_LIBS})
target_link_options(tz PRIVATE ${TZ_LINK_DEFS})
set_target_properties(tz PROPERTIES VERSION 1 SOVERSION 1)
# What a module of a stranger sees of it, here and installed.
target_include_directories(tz INTERFACE
    $<BUILD_INTERFACE:${TZ_ROOT_sdk}> $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>)
target_compile_features(tz INTERFACE cxx_std_20)
add_library(tz::tz ALIAS tz)
add_dependencies(tz_products tz)

# The module: every module layer whole, hidden but for the names of its list.
tz_layers_in("^module/" layers)
set(exports ${PROJECT_SOURCE_DIR}/module/shell/exports.txt)
set(version_script ${CMAKE_BINARY_DIR}/tzmted.version)
add_custom_command(OUTPUT ${version_script}
    COMMAND Python3::Interpreter ${PROJECT_SOURCE_DIR}/scripts/lint/exports.py
        --list ${exports} --version-script ${version_script}
    DEPENDS ${exports} ${PROJECT_SOURCE_DIR}/scripts/lint/exports.py VERBATIM)
add_custom_target(tzmted_version_script DEPENDS ${version_script})
add_library(tzmted MODULE ${CMAKE_CURRENT_LIST_DIR}/empty.cpp)
foreach(layer IN LISTS layers)
    target_link_libraries(tzmted PRIVATE $<LINK_LIBRARY:WHOLE_ARCHIVE,${layer}>)
endforeach()
target_link_libraries(tzmted PRIVATE tz)
tz_module_properties(tzmted tzmted)
target_link_options(tzmted PRIVATE -Wl,--version-script=${version_script})
set_target_properties(tzmted PROPERTIES LINK_DEPENDS ${version_script})
add_dependencies(tzmted tzmted_version_script)
add_dependencies(tz_products tzmted)
# What a module links that calls this one.
add_library(tzmted_linked INTERFACE)
target_link_libraries(tzmted_linked INTERFACE $<TARGET_FILE:tzmted> tz)
add_dependencies(tzmted_linked tzmted)
add_library(tz::tzmted ALIAS tzmted_linked)

# The programs: each is its layer, which suites link too, and a main.cpp.
function(tz_program name)
    add_executable(${name} ${PROJECT_SOURCE_DIR}/apps/${name}/main.cpp)
    tz_flags(${name})
    target_link_libraries(${name} PRIVATE app_${name} ${ARGN})
    add_dependencies(tz_products ${name})
endfunction()
tz_program(tzdraft app_options tz Threads::Threads ${CMAKE_DL_LIBS})
# Archives only, so that no drawing database and no display library comes along.
tz_link_closure(layers app_tzconvert)
list(REMOVE_ITEM layers app_tzconvert)
tz_program(tzconvert ${layers} tz_ground)
