# Manual pages and completions of the programs, made from the options that they declare.
set(TZ_BASH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
set(TZ_FISH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d)
set(TZ_ZSH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/zsh/site-functions)
if(TZ_DEBIAN)
    set(TZ_ZSH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/zsh/vendor-completions)
endif()

# Makes ${CMAKE_BINARY_DIR}/pages/NAME from a list of options, and a template if the format wants
# one.
function(tz_option_page list name format)
    set(script ${PROJECT_SOURCE_DIR}/scripts/option_pages.py)
    set(page ${CMAKE_BINARY_DIR}/pages/${name})
    add_custom_command(OUTPUT ${page} DEPENDS ${list} ${script} ${ARGN}
        COMMAND Python3::Interpreter ${script} ${list} ${format} ${ARGN} > ${page} VERBATIM)
    string(REPLACE "/" "_" target page_${name})
    add_custom_target(${target} DEPENDS ${page} ${list})
    add_dependencies(tz_products ${target})
endfunction()

file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/pages)
foreach(program tzdraft tzconvert)
    set(pages ${CMAKE_BINARY_DIR}/pages)
    add_custom_command(OUTPUT ${pages}/${program}.json
        DEPENDS ${program} tzmted_beside_module
        COMMAND ${CMAKE_COMMAND} -E env LC_ALL=C $<TARGET_FILE:${program}> --option-list
            > ${pages}/${program}.json VERBATIM)
    tz_option_page(${pages}/${program}.json ${program}.1 man
        ${PROJECT_SOURCE_DIR}/docs/man/${program}.1)
    foreach(shell bash zsh fish)
        tz_option_page(${pages}/${program}.json ${program}.${shell} ${shell})
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

# In each other language that docs/man has a folder for.
file(GLOB languages CONFIGURE_DEPENDS RELATIVE ${PROJECT_SOURCE_DIR}/docs/man
    ${PROJECT_SOURCE_DIR}/docs/man/*/tzdraft.1)
foreach(language IN LISTS languages)
    get_filename_component(language ${language} DIRECTORY)
    file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/pages/${language})
    foreach(program tzdraft tzconvert)
        set(list ${CMAKE_BINARY_DIR}/pages/${language}/${program}.json)
        add_custom_command(OUTPUT ${list}
            DEPENDS ${program} ${CMAKE_BINARY_DIR}/lib/${language}/options.texts
            COMMAND ${CMAKE_COMMAND} -E env LC_ALL=${language} $<TARGET_FILE:${program}>
                --option-list > ${list} VERBATIM)
        tz_option_page(${list} ${language}/${program}.1 man
            ${PROJECT_SOURCE_DIR}/docs/man/${language}/${program}.1)
        add_dependencies(page_${language}_${program}.1 tzmted_beside_module)
        tz_compressed(${CMAKE_BINARY_DIR}/pages/${language}/${program}.1 manual)
        install(FILES ${manual} DESTINATION ${CMAKE_INSTALL_MANDIR}/${language}/man1
            COMPONENT programs)
    endforeach()
endforeach()
