# The words that every CMakeLists.txt below uses:
#
#   add_layer(NAME sources...)            a folder of the layer table; its headers are found
#   add_test_support(NAME sources... *)   shared code of the suites
#   add_suite(NAME sources... *)          a GoogleTest program, target test_NAME
#   add_fuzz(NAME source *)               a fuzzer and the replay of its seeds, target fuzz_NAME
#   add_bench(NAME sources... *)          a benchmark (release only), target bench_NAME
#   add_bench_program(NAME sources...)    a program for scripts/compare.py (release only)
#   add_example_module(NAME)              a folder with a further module, built as a stranger would
#   add_example_program(NAME sources...)  a program bin/NAME, built from sdk/ alone
#   add_lint(NAME command...)             a check of the source tree, test lint.NAME
#
# Those with a * take LIBS and names after it: layers (module_prompt, app_tzdraft), support libraries
# or third-party targets. A layer brings the layers of its row along, and libtz is always there.

include(${CMAKE_CURRENT_LIST_DIR}/tz_module.cmake)

set(TZ_ROOTS ${CMAKE_BINARY_DIR}/roots)
set(TZ_FOLDERS "")

# Reads one row of the table into TZ_USES_<folder> and TZ_LIBRARIES_<folder>.
macro(tz_row folder)
    cmake_parse_arguments(TZ_ROW "" "" "USES;LIBRARIES" ${ARGN})
    list(APPEND TZ_FOLDERS ${folder})
    set(TZ_USES_${folder} ${TZ_ROW_USES})
    set(TZ_LIBRARIES_${folder} ${TZ_ROW_LIBRARIES})
    foreach(used IN LISTS TZ_ROW_USES)
        if(NOT used IN_LIST TZ_FOLDERS OR used STREQUAL "${folder}")
            message(FATAL_ERROR "cmake/layers.cmake: ${folder} uses ${used}, which is not below it")
        endif()
    endforeach()
endmacro()

include(${CMAKE_CURRENT_LIST_DIR}/layers.cmake)

# host/drawing_file -> host_drawing_file, apps/tzdraft -> app_tzdraft
function(tz_target_of folder out)
    string(REGEX REPLACE "^apps/" "app/" name "${folder}")
    string(REPLACE "/" "_" name "${name}")
    set(${out} ${name} PARENT_SCOPE)
endfunction()

# Each folder gets an include root of its own in the build tree, which holds nothing but a link to
# it. So a header of a folder that the row does not name is not even found.
foreach(folder IN LISTS TZ_FOLDERS)
    tz_target_of(${folder} name)
    set(TZ_FOLDER_${name} ${folder})
    set(TZ_ROOT_${folder} ${TZ_ROOTS}/${name})
    if(folder STREQUAL "sdk")
        set(link ${TZ_ROOTS}/sdk/tz)
        set(source ${PROJECT_SOURCE_DIR}/sdk/tz)
    else()
        set(link ${TZ_ROOTS}/${name}/${folder})
        set(source ${PROJECT_SOURCE_DIR}/${folder})
    endif()
    get_filename_component(parent ${link} DIRECTORY)
    file(MAKE_DIRECTORY ${parent})
    file(CREATE_LINK ${source} ${link} SYMBOLIC)
endforeach()
set(TZ_ALL_ROOTS "")
foreach(folder IN LISTS TZ_FOLDERS)
    list(APPEND TZ_ALL_ROOTS ${TZ_ROOT_${folder}})
endforeach()
foreach(folder tests bench fuzz)
    file(MAKE_DIRECTORY ${TZ_ROOTS}/proofs)
    file(CREATE_LINK ${PROJECT_SOURCE_DIR}/${folder} ${TZ_ROOTS}/proofs/${folder} SYMBOLIC)
endforeach()
list(APPEND TZ_ALL_ROOTS ${TZ_ROOTS}/proofs)

# Flags of every target of ours.
function(tz_flags target)
    target_compile_options(${target} PRIVATE -Wall -Wextra -Wshadow -Wconversion -Wsign-conversion
        -Wnon-virtual-dtor -Wold-style-cast $<$<BOOL:${TZ_WERROR}>:-Werror>)
endfunction()

# The targets of `names`, each layer followed by those of its row, highest first, so that
# archives stand in the order in which a linker wants them. Host layers are left out: they come as
# libtz, or (for programs without it) are named by the caller.
function(tz_link_closure out)
    set(wanted "")
    set(others "")
    foreach(name IN LISTS ARGN)
        if(DEFINED TZ_FOLDER_${name})
            set(folder ${TZ_FOLDER_${name}})
            list(APPEND wanted ${folder} ${TZ_USES_${folder}})
        else()
            list(APPEND others ${name})
        endif()
    endforeach()
    # A support library comes before the layers that it calls.
    set(result ${others})
    set(folders ${TZ_FOLDERS})
    list(REVERSE folders)
    foreach(folder IN LISTS folders)
        tz_target_of(${folder} name)
        if(folder IN_LIST wanted AND NOT folder MATCHES "^host/|^sdk$")
            list(APPEND result ${name})
        endif()
    endforeach()
    set(${out} ${result} PARENT_SCOPE)
endfunction()

function(add_layer name)
    if(NOT DEFINED TZ_FOLDER_${name})
        message(FATAL_ERROR "add_layer(${name}): no such row in cmake/layers.cmake")
    endif()
    set(folder ${TZ_FOLDER_${name}})
    if(NOT CMAKE_CURRENT_SOURCE_DIR STREQUAL "${PROJECT_SOURCE_DIR}/${folder}")
        message(FATAL_ERROR "add_layer(${name}) belongs into ${folder}/CMakeLists.txt")
    endif()
    set(root ${TZ_ROOT_${folder}})
    if(folder STREQUAL "sdk")
        set(search ${root}/tz)
    else()
        set(search ${root}/${folder})
    endif()
    file(GLOB_RECURSE headers FOLLOW_SYMLINKS CONFIGURE_DEPENDS ${search}/*.h)

    if(ARGN)
        add_library(${name} STATIC ${ARGN})
        set(scope PUBLIC)
        tz_flags(${name})
    else()
        add_library(${name} INTERFACE)
        set(scope INTERFACE)
    endif()
    set(roots ${root})
    foreach(used IN LISTS TZ_USES_${folder})
        list(APPEND roots ${TZ_ROOT_${used}})
    endforeach()
    target_include_directories(${name} ${scope} ${roots})
    if(headers)
        target_sources(${name} ${scope} FILE_SET HEADERS BASE_DIRS ${root} FILES ${headers})
    endif()
    set_target_properties(${name} PROPERTIES VERIFY_INTERFACE_HEADER_SETS ON)
    foreach(library IN LISTS TZ_LIBRARIES_${folder})
        target_link_libraries(${name} ${scope} tz_library_${library})
    endforeach()
    if(ARGN AND folder MATCHES "^module/")
        set_target_properties(${name} PROPERTIES CXX_VISIBILITY_PRESET hidden
            VISIBILITY_INLINES_HIDDEN ON)
        # Unique symbols would keep the module in the process for ever.
        target_compile_options(${name} PRIVATE
            $<$<CXX_COMPILER_ID:GNU>:-fno-gnu-unique>)
    endif()
    set_property(GLOBAL APPEND PROPERTY TZ_LAYERS ${name})
endfunction()

# The layers with code whose folder matches `pattern`.
function(tz_layers_in pattern out)
    get_property(layers GLOBAL PROPERTY TZ_LAYERS)
    set(result "")
    foreach(name IN LISTS layers)
        get_target_property(type ${name} TYPE)
        if(TZ_FOLDER_${name} MATCHES "${pattern}" AND type STREQUAL "STATIC_LIBRARY")
            list(APPEND result ${name})
        endif()
    endforeach()
    set(${out} ${result} PARENT_SCOPE)
endfunction()

# Common part of everything that may include anything.
function(tz_proof_target target)
    tz_flags(${target})
    target_include_directories(${target} PRIVATE ${TZ_ALL_ROOTS})
    tz_link_closure(libs ${ARGN})
    target_link_libraries(${target} PUBLIC ${libs} tz
        tz_library_json tz_library_ini tz_library_fontconfig tz_library_pango tz_library_cairo
        tz_library_cli tz_library_editline)
    get_target_property(type ${target} TYPE)
    if(type STREQUAL "EXECUTABLE")
        set_target_properties(${target} PROPERTIES RUNTIME_OUTPUT_DIRECTORY
            ${CMAKE_BINARY_DIR}/tests)
        # A suite starts the programs and loads the module with its resources, so they are built
        # with it.
        add_dependencies(${target} tz_products)
    endif()
endfunction()

function(add_test_support name)
    cmake_parse_arguments(PARSE_ARGV 1 ARG "" "" "LIBS")
    add_library(${name} STATIC ${ARG_UNPARSED_ARGUMENTS})
    tz_proof_target(${name} ${ARG_LIBS})
    target_link_libraries(${name} PUBLIC GTest::gtest)
endfunction()

function(add_suite name)
    if(NOT TZ_TESTS)
        return()
    endif()
    cmake_parse_arguments(PARSE_ARGV 1 ARG "" "" "LIBS")
    add_executable(test_${name} ${ARG_UNPARSED_ARGUMENTS})
    tz_proof_target(test_${name} ${ARG_LIBS})
    target_link_libraries(test_${name} PRIVATE GTest::gtest GTest::gtest_main)
    # The report lets ./test add up the single cases of all suites.
    add_test(NAME suite.${name} COMMAND test_${name} --gtest_shuffle --gtest_color=no
        --gtest_output=json:${CMAKE_BINARY_DIR}/reports/${name}.json)
    tz_test_environment(suite.${name} ${name})
endfunction()

# Every test sees the same fonts, locale, folders and (empty) user configuration on each machine.
function(tz_test_environment test name)
    set(scratch ${CMAKE_BINARY_DIR}/tests/scratch/${name})
    file(MAKE_DIRECTORY ${scratch}/config ${scratch}/tmp)
    set(environment
        LC_ALL=C.UTF-8
        TZ=UTC
        FONTCONFIG_FILE=${TZ_TEST_FONTS_CONF}
        XDG_CONFIG_HOME=${scratch}/config
        TMPDIR=${scratch}/tmp
        TZ_TEST_LIB=${CMAKE_BINARY_DIR}/lib
        TZ_TEST_BIN=${CMAKE_BINARY_DIR}/bin
        TZ_TEST_SOURCE=${PROJECT_SOURCE_DIR}
        TZ_TEST_SCRATCH=${scratch})
    if(TZ_SANITIZE)
        list(APPEND environment
            "LSAN_OPTIONS=suppressions='${PROJECT_SOURCE_DIR}/tests/leaks.supp':print_suppressions=0"
            UBSAN_OPTIONS=print_stacktrace=1)
    endif()
    set_tests_properties(${test} PROPERTIES TIMEOUT 900 WORKING_DIRECTORY ${scratch}
        ENVIRONMENT "${environment}" ENVIRONMENT_MODIFICATION "VISUAL=unset:;EDITOR=unset:")
endfunction()

# Runs in the root of the source tree; exit status 77 skips it.
function(add_lint name)
    add_test(NAME lint.${name} COMMAND ${ARGN} WORKING_DIRECTORY ${PROJECT_SOURCE_DIR})
    set_tests_properties(lint.${name} PROPERTIES SKIP_RETURN_CODE 77 TIMEOUT 600)
endfunction()

function(add_fuzz name source)
    cmake_parse_arguments(PARSE_ARGV 2 ARG "" "" "LIBS")
    set(seeds ${PROJECT_SOURCE_DIR}/fuzz/corpus/${name})
    if(TZ_FUZZ)
        add_executable(fuzz_${name} ${source} ${ARG_UNPARSED_ARGUMENTS})
        target_link_options(fuzz_${name} PRIVATE -fsanitize=fuzzer)
        set(arguments -runs=0 ${seeds})
    else()
        add_executable(fuzz_${name} ${source} ${ARG_UNPARSED_ARGUMENTS}
            ${PROJECT_SOURCE_DIR}/fuzz/support/replay_main.cpp)
        set(arguments ${seeds})
    endif()
    tz_proof_target(fuzz_${name} ${ARG_LIBS})
    add_test(NAME fuzz.${name} COMMAND fuzz_${name} ${arguments})
    tz_test_environment(fuzz.${name} fuzz_${name})
endfunction()

function(add_bench name)
    if(NOT TZ_BENCH)
        return()
    endif()
    cmake_parse_arguments(PARSE_ARGV 1 ARG "" "" "LIBS")
    add_executable(bench_${name} ${ARG_UNPARSED_ARGUMENTS}
        ${PROJECT_SOURCE_DIR}/bench/support/against_floor.cpp)
    tz_proof_target(bench_${name} ${ARG_LIBS})
    target_link_libraries(bench_${name} PRIVATE benchmark::benchmark benchmark::benchmark_main)
endfunction()

function(add_bench_program name)
    if(NOT TZ_BENCH)
        return()
    endif()
    add_executable(${name} ${ARGN})
    tz_flags(${name})
    set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
endfunction()

function(add_example_program name)
    add_executable(example_${name} ${ARGN})
    tz_flags(example_${name})
    set_target_properties(example_${name} PROPERTIES OUTPUT_NAME ${name})
    target_include_directories(example_${name} PRIVATE ${TZ_ROOT_sdk} ${TZ_ROOT_examples})
    target_link_libraries(example_${name} PRIVATE tz ${CMAKE_DL_LIBS})
    add_dependencies(tz_products example_${name})
endfunction()

# The folder stands for itself: outside of this tree its CMakeLists.txt builds by find_package(tz).
function(add_example_module name)
    add_subdirectory(${name})
    get_property(modules DIRECTORY ${name} PROPERTY BUILDSYSTEM_TARGETS)
    foreach(module IN LISTS modules)
        tz_flags(${module})
        add_dependencies(tz_products ${module})
    endforeach()
endfunction()
