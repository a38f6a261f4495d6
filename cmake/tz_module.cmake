# For modules of the host tz, in its own tree and in any other:
#
#   tz_add_module(NAME sources...)    the module NAME.tzx, which the command LOAD takes
#
# It is linked with the host, tz::tz. One that calls the text module is also linked with tz::tzmted.

# What a loadable module needs to be: a plain file NAME.tzx that nothing pins to the process, with
# no symbol that is defined nowhere. (TZ_LINK_DEFS is empty where the linker cannot tell.)
function(tz_module_properties target output)
    if(NOT DEFINED TZ_LINK_DEFS)
        set(TZ_LINK_DEFS -Wl,-z,defs)
    endif()
    set_target_properties(${target} PROPERTIES PREFIX "" SUFFIX .tzx OUTPUT_NAME ${output}
        CXX_VISIBILITY_PRESET hidden VISIBILITY_INLINES_HIDDEN ON)
    target_compile_options(${target} PRIVATE $<$<CXX_COMPILER_ID:GNU>:-fno-gnu-unique>)
    target_link_options(${target} PRIVATE -Wl,-soname,${output}.tzx ${TZ_LINK_DEFS})
endfunction()

function(tz_add_module name)
    add_library(${name} MODULE ${ARGN})
    tz_module_properties(${name} ${name})
    target_link_libraries(${name} PRIVATE tz::tz)
endfunction()
