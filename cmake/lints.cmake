# Lints are tests like any other; the scripts need nothing but Python's standard library.
set(lint ${PROJECT_SOURCE_DIR}/scripts/lint)
function(tz_lint name)
    add_test(NAME lint.${name} COMMAND ${ARGN} WORKING_DIRECTORY ${PROJECT_SOURCE_DIR})
    set_tests_properties(lint.${name} PROPERTIES SKIP_RETURN_CODE 77 TIMEOUT 600)
endfunction()
tz_lint(layers Python3::Interpreter ${lint}/layers.py)
tz_lint(words Python3::Interpreter ${lint}/words.py)
tz_lint(format Python3::Interpreter ${lint}/format.py)
tz_lint(exports Python3::Interpreter ${lint}/exports.py
    --list ${PROJECT_SOURCE_DIR}/module/shell/exports.txt
    --module ${CMAKE_BINARY_DIR}/lib/tzmted.tzx)
tz_lint(needed Python3::Interpreter ${lint}/needed.py --build ${CMAKE_BINARY_DIR})
# Compiles each header alone. One preset is enough for that.
if(NOT TZ_SANITIZE)
    tz_lint(headers ${CMAKE_COMMAND} --build ${CMAKE_BINARY_DIR}
        --target all_verify_interface_header_sets -- -k 0)
    set_tests_properties(lint.headers PROPERTIES RUN_SERIAL ON)
endif()
