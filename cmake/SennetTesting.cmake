# sennet_add_test(NAME SOURCES file... [LIBS target...])
#   One GoogleTest program, registered case by case with CTest.
# sennet_add_fuzz_target(NAME SOURCES file... [LIBS target...] [DICTIONARY name])
#   A source with LLVMFuzzerTestOneInput. With SENNET_BUILD_FUZZERS a libFuzzer program fuzz-NAME,
#   beside it the dictionary as fuzz-NAME.dict; otherwise a program that replays
#   tests/fuzz/corpus/NAME/* once, registered as a test.

find_package(GTest REQUIRED)
include(GoogleTest)

function(sennet_add_test NAME)
    cmake_parse_arguments(ARG "" "" "SOURCES;LIBS" ${ARGN})
    if(NOT SENNET_BUILD_TESTS)
        return()
    endif()
    add_executable(${NAME} ${ARG_SOURCES})
    target_link_libraries(${NAME} PRIVATE sennet_compile ${ARG_LIBS} GTest::gtest GTest::gmock
                          GTest::gtest_main)
    # The sanitizers and the coverage are to look at what is tested: in the tests themselves they
    # would only double the time that these take to compile.
    if(CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
        target_compile_options(${NAME} PRIVATE -fno-sanitize=all -fno-profile-instr-generate
                               -fno-coverage-mapping)
    endif()
    sennet_precompile(${NAME} <gmock/gmock.h> <gtest/gtest.h>)
    if(SENNET_SANITIZE)
        target_compile_definitions(${NAME} PRIVATE SENNET_TEST_SANITIZED)
    endif()
    target_include_directories(${NAME} PRIVATE "${PROJECT_SOURCE_DIR}/tests")
    target_compile_definitions(${NAME} PRIVATE
        TEST_BIN_DIR="${CMAKE_RUNTIME_OUTPUT_DIRECTORY}"
        TEST_SOURCE_DIR="${PROJECT_SOURCE_DIR}/tests")
    set_target_properties(${NAME} PROPERTIES RUNTIME_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/tests")
    gtest_discover_tests(${NAME} TEST_PREFIX "${NAME}." DISCOVERY_TIMEOUT 60
                         PROPERTIES TIMEOUT 300)
endfunction()

function(sennet_add_fuzz_target NAME)
    cmake_parse_arguments(ARG "" "DICTIONARY" "SOURCES;LIBS" ${ARGN})
    set(corpus "${PROJECT_SOURCE_DIR}/tests/fuzz/corpus/${NAME}")
    if(SENNET_BUILD_FUZZERS)
        add_executable(fuzz-${NAME} ${ARG_SOURCES})
        target_link_options(fuzz-${NAME} PRIVATE -fsanitize=fuzzer)
        if(ARG_DICTIONARY)
            configure_file("${PROJECT_SOURCE_DIR}/tests/fuzz/dictionaries/${ARG_DICTIONARY}.dict"
                           "${CMAKE_BINARY_DIR}/fuzz/fuzz-${NAME}.dict" COPYONLY)
        endif()
    else()
        add_executable(fuzz-${NAME} ${ARG_SOURCES}
                       "${PROJECT_SOURCE_DIR}/tests/fuzz/ReplayMain.cc")
        add_test(NAME fuzz-${NAME}.replay COMMAND fuzz-${NAME} "${corpus}")
    endif()
    target_link_libraries(fuzz-${NAME} PRIVATE sennet_compile ${ARG_LIBS})
    set_target_properties(fuzz-${NAME} PROPERTIES
        RUNTIME_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/fuzz")
endfunction()
