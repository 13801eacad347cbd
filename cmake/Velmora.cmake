# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# What every target of the project is built with, and the helpers that declare them.

include(cmake/Hardening.cmake)

add_library(velmora_options INTERFACE)
target_include_directories(velmora_options INTERFACE ${PROJECT_SOURCE_DIR})
target_compile_options(velmora_options INTERFACE -Wall -Wextra -Wpedantic -Wshadow -Wconversion
                       $<$<BOOL:${VELMORA_WERROR}>:-Werror> -fstack-protector-strong)
target_link_options(velmora_options INTERFACE -Wl,-z,relro,-z,now)
if(VELMORA_SANITIZE STREQUAL thread)
    target_compile_options(velmora_options INTERFACE -fsanitize=thread)
    target_link_options(velmora_options INTERFACE -fsanitize=thread)
elseif(VELMORA_SANITIZE)
    target_compile_options(velmora_options INTERFACE -fsanitize=address,undefined -fno-sanitize-recover=all
                           -fno-omit-frame-pointer)
    target_link_options(velmora_options INTERFACE -fsanitize=address,undefined)
elseif(VELMORA_FUZZ)
    # Every library counts what it runs through; the engine's main is linked to the fuzzers alone. The check of
    # dynamic types is left out for speed.
    target_compile_options(velmora_options INTERFACE -fsanitize=fuzzer-no-link,address,undefined
                           -fno-sanitize=vptr -fno-sanitize-recover=all -fno-omit-frame-pointer)
    target_link_options(velmora_options INTERFACE -fsanitize=address,undefined)
elseif(VELMORA_COVERAGE)
    # The tests are compiled so too, since the linker may take a header's function from them, but only what is
    # tested is counted. Atomically, since some tests start threads.
    target_compile_options(velmora_options INTERFACE --coverage -fprofile-update=atomic
                           "-fprofile-exclude-files=^(/usr|${PROJECT_SOURCE_DIR}/(Tests|Fuzz))/")
    target_link_options(velmora_options INTERFACE --coverage)
elseif(CMAKE_BUILD_TYPE MATCHES "Rel")
    velmora_harden(velmora_options)
    # The programs hold no paths of the build, which would make two builds of one source differ. The build tree comes
    # last, since it may lie in the source tree and the last option that matches applies.
    target_compile_options(velmora_options INTERFACE -ffile-prefix-map=${PROJECT_SOURCE_DIR}=.
                           -ffile-prefix-map=${CMAKE_BINARY_DIR}=build)
    # A library that is linked but not used would become a dependency of the package.
    target_link_options(velmora_options INTERFACE -Wl,--as-needed)
endif()

if(VELMORA_EMULATED)
    # Part of linking, so that it is done again whenever a program is linked again. Nothing needs to know the emulator then.
    list(JOIN CMAKE_CROSSCOMPILING_EMULATOR " " emulator)
    list(APPEND CMAKE_CXX_LINK_EXECUTABLE "${PROJECT_SOURCE_DIR}/Scripts/wrap-emulated <TARGET> ${emulator}")
    set(CMAKE_CROSSCOMPILING_EMULATOR)
endif()

# What most sources include: reading it takes half of the time of compiling one. g++ 12 takes some sums of strings for
# copies past their end, and does not know a system's header once it is precompiled.
set(velmora_precompiled_headers <algorithm> <array> <chrono> <filesystem> <functional> <map> <memory> <optional> <span>
                                <string> <string_view> <variant> <vector>)
set(velmora_precompiled_options $<$<CXX_COMPILER_ID:GNU>:-Wno-array-bounds;-Wno-restrict;-Wno-stringop-overflow;-Wno-stringop-overread>)

# velmora_library(NAME SOURCES file... [LINK target...]): a static library; what it links is all it may include.
function(velmora_library name)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LINK")
    add_library(${name} STATIC ${arg_SOURCES})
    target_link_libraries(${name} PUBLIC velmora_options ${arg_LINK})
    if(VELMORA_PRECOMPILED_HEADERS)
        target_precompile_headers(${name} PRIVATE ${velmora_precompiled_headers})
        # Objects would have the debugger's account of all that is precompiled: three times their size. Lines and
        # functions stay.
        target_compile_options(${name} PRIVATE ${velmora_precompiled_options}
                               $<$<CONFIG:Release,RelWithDebInfo>:-g1>)
    endif()
endfunction()

# velmora_generate_from_sections(OUTPUT TABLE [TEMPLATE file] [READS file...]): a file that list-sections (in
# Tools/ListSections) prints, again whenever a section or a file changes that it reads. A file that comes out the same is
# left alone, so that nothing that uses it is built again. The program has to run on the machine that builds: a toolchain
# file for another kind names an emulator.
function(velmora_generate_from_sections output table)
    cmake_parse_arguments(PARSE_ARGV 2 arg "" "TEMPLATE" "READS")
    set(input)
    if(arg_TEMPLATE)
        set(input < ${arg_TEMPLATE})
    endif()
    cmake_path(GET output FILENAME name)
    set(printed ${CMAKE_BINARY_DIR}/generated/${name}.new)
    file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/generated)
    add_custom_command(OUTPUT ${output} BYPRODUCTS ${printed}
                       COMMAND ${CMAKE_CROSSCOMPILING_EMULATOR} $<TARGET_FILE:list-sections> ${table} ${input} > ${printed}
                       COMMAND ${CMAKE_COMMAND} -E copy_if_different ${printed} ${output}
                       DEPENDS list-sections ${arg_TEMPLATE} ${arg_READS}
                       COMMENT "Generating ${name} from the sections" VERBATIM)
endfunction()

# velmora_compile_quickly(NAME): for what is run a few times at most; optimizing it takes longer than it saves.
function(velmora_compile_quickly name)
    target_compile_options(${name} PRIVATE "$<$<CONFIG:Release,RelWithDebInfo>:-O1;-g1>")
endfunction()

# velmora_uses_regex(FILE...): turns off a warning in these sources of the folder. With the sanitizers' code added, g++
# gives it by mistake for the standard library's regular expressions.
function(velmora_uses_regex)
    if(VELMORA_SANITIZE AND CMAKE_CXX_COMPILER_ID STREQUAL GNU)
        set_source_files_properties(${ARGN} PROPERTIES COMPILE_OPTIONS -Wno-maybe-uninitialized)
    endif()
endfunction()

# In seconds, of a case.
set(velmora_test_timeout 60)
if(VELMORA_EMULATED)
    set(velmora_test_timeout 900)
endif()

# The tests whose code, or the code that they test, starts threads. ./test --threads runs them with the thread sanitizer.
set(velmora_threaded_tests test-model test-platform-linux test-recording test-tools)

# velmora_test(NAME SOURCES file... [LINK target...] [NEEDS program...]): a GoogleTest executable whose cases
# CTest runs one by one; all at once where coverage is counted, since every program that ends adds its counts to some
# hundred files. NEEDS builds programs that the cases start, so that one target builds all a test needs.
function(velmora_test name)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LINK;NEEDS")
    add_executable(${name} ${arg_SOURCES})
    set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
    target_link_libraries(${name} PRIVATE velmora_options ${arg_LINK} GTest::gtest GTest::gmock)
    target_compile_definitions(${name} PRIVATE VELMORA_SOURCE_DIR="${PROJECT_SOURCE_DIR}"
                               VELMORA_BUILD_DIR="${CMAKE_BINARY_DIR}")
    velmora_compile_quickly(${name})
    if(VELMORA_PRECOMPILED_HEADERS)
        target_precompile_headers(${name} REUSE_FROM test-headers)
        # As the headers were compiled, and as the tests that use Qt are.
        target_compile_options(${name} PRIVATE -fPIC ${velmora_precompiled_options})
    endif()
    if(arg_NEEDS)
        add_dependencies(${name} ${arg_NEEDS})
    endif()
    if(VELMORA_COVERAGE)
        add_test(NAME ${name} COMMAND ${name})
        return()
    endif()
    set(labels)
    if(name IN_LIST velmora_threaded_tests)
        set(labels LABELS threads)
    endif()
    include(GoogleTest)
    gtest_discover_tests(${name} TEST_PREFIX "${name}." NO_PRETTY_VALUES DISCOVERY_MODE PRE_TEST
                         PROPERTIES TIMEOUT ${velmora_test_timeout} ${labels})
endfunction()

# velmora_python_tests(NAME PACKAGE [SCRIPT...]): runs the unit tests of a Python package of this folder, and, where mypy
# is installed, checks its types and those of the scripts that start it.
function(velmora_python_tests name package)
    add_test(NAME ${name}-scripts COMMAND python3 -m unittest discover -t . -s ${package}
             WORKING_DIRECTORY ${CMAKE_CURRENT_SOURCE_DIR})
    set_tests_properties(${name}-scripts PROPERTIES LABELS scripts TIMEOUT 600
                         ENVIRONMENT PYTHONPYCACHEPREFIX=${CMAKE_BINARY_DIR}/pycache)
    find_program(MYPY mypy)
    if(MYPY)
        add_test(NAME ${name}-scripts-types COMMAND ${MYPY} --strict --scripts-are-modules
                 --cache-dir=${CMAKE_BINARY_DIR}/mypy/${name} ${package} ${ARGN}
                 WORKING_DIRECTORY ${CMAKE_CURRENT_SOURCE_DIR})
        set_tests_properties(${name}-scripts-types PROPERTIES LABELS scripts TIMEOUT 180)
    endif()
endfunction()

# velmora_benchmark(NAME SOURCES file... [LINK target...]): a Google Benchmark executable.
function(velmora_benchmark name)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LINK")
    add_executable(${name} ${arg_SOURCES})
    set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/benchmarks)
    target_link_libraries(${name} PRIVATE velmora_options ${arg_LINK} benchmark::benchmark benchmark::benchmark_main)
endfunction()

# velmora_header_check(): compiles every header of the project that no source of the same name includes first, so
# that each header is known to compile alone.
function(velmora_header_check)
    file(GLOB_RECURSE headers CONFIGURE_DEPENDS RELATIVE ${PROJECT_SOURCE_DIR}
         ${PROJECT_SOURCE_DIR}/Analysis/*.h ${PROJECT_SOURCE_DIR}/App/*.h ${PROJECT_SOURCE_DIR}/Export/*.h
         ${PROJECT_SOURCE_DIR}/Fuzz/*.h ${PROJECT_SOURCE_DIR}/LogGenerator/*.h ${PROJECT_SOURCE_DIR}/LogMessages/*.h
         ${PROJECT_SOURCE_DIR}/Model/*.h ${PROJECT_SOURCE_DIR}/Platform/*.h ${PROJECT_SOURCE_DIR}/Playback/*.h
         ${PROJECT_SOURCE_DIR}/PropertyLists/*.h ${PROJECT_SOURCE_DIR}/Recorder/*.h ${PROJECT_SOURCE_DIR}/Recording/*.h ${PROJECT_SOURCE_DIR}/Telephony/*.h ${PROJECT_SOURCE_DIR}/Tests/*.h
         ${PROJECT_SOURCE_DIR}/Toolkit/*.h ${PROJECT_SOURCE_DIR}/Tools/*.h)
    set(sources)
    foreach(header IN LISTS headers)
        string(REGEX REPLACE "\\.h$" ".cpp" source ${header})
        if(NOT EXISTS ${PROJECT_SOURCE_DIR}/${source})
            set(check ${CMAKE_BINARY_DIR}/header-check/${source})
            file(CONFIGURE OUTPUT ${check} CONTENT "#include \"${header}\"\n")
            list(APPEND sources ${check})
        endif()
    endforeach()
    add_library(header-check OBJECT ${sources})
    velmora_compile_quickly(header-check)
    target_link_libraries(header-check PRIVATE velmora_options velmora_app velmora_tools velmora_telephony
                          velmora_test_support GTest::gtest GTest::gmock Qt6::Test Qt6::Widgets)
endfunction()
