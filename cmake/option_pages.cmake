# Manual pages and completions of the programs, made from the options that they declare.
set(TZ_BASH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
set(TZ_FISH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d)
set(TZ_ZSH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/zsh/site-functions)
if(TZ_DEBIAN)
    set(TZ_ZSH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/zsh/vendor-completions)
endif()

# Makes ${CMAKE_BINARY_DIR}/pages/NAME from the options of a program, and a template if the format
# wants one.
function(tz_option_page program name format)
    set(list ${CMAKE_BINARY_DIR}/pages/${program}.json)
    set(script ${PROJECT_SOURCE_DIR}/scripts/option_pages.py)
    set(page ${CMAKE_BINARY_DIR}/pages/${name})
    add_custom_command(OUTPUT ${page} DEPENDS ${list} ${script} ${ARGN}
        COMMAND Python3::Interpreter ${script} ${list} ${format} ${ARGN} > ${page} VERBATIM)
    add_custom_target(page_${name} DEPENDS ${page} ${list})
    add_dependencies(tz_products page_${name})
endfunction()

file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/pages)
foreach(program tzdraft tzconvert)
    set(pages ${CMAKE_BINARY_DIR}/pages)
    add_custom_command(OUTPUT ${pages}/${program}.json DEPENDS ${program}
        COMMAND ${program} --option-list > ${pages}/${program}.json VERBATIM)
    tz_option_page(${program} ${program}.1 man ${PROJECT_SOURCE_DIR}/docs/man/${program}.1)
    foreach(shell bash zsh fish)
        tz_option_page(${program} ${program}.${shell} ${shell})
    endforeach()
    tz_compressed(${pages}/${program}.1 manual)
    install(FILES ${manual} DESTINATION ${CMAKE_INSTALL_MANDIR}/man1 COMPONENT programs)
    install(FILES ${pages}/${program}.bash DESTINATION ${TZ_BASH_COMPLETIONS} RENAME ${program}
        COMPONENT programs)
    install(FILES ${pages}/${program}.zsh DESTINATION ${TZ_ZSH_COMPLETIONS} RENAME _${program}
        COMPONENT programs)
    install(FILES ${pages}/${program}.fish DESTINATION ${TZ_FISH_COMPLETIONS}
        COMPONENT programs)
endforeach()
