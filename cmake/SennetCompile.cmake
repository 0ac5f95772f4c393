# How every target of the project is compiled: link a target to sennet_compile to get it.

add_library(sennet_compile INTERFACE)
target_compile_options(sennet_compile INTERFACE -Wall -Wextra -Wpedantic -Werror)
if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    # When it optimises, g++ 12 takes strings put together and empty optionals for mistakes.
    target_compile_options(sennet_compile INTERFACE -Wno-restrict -Wno-maybe-uninitialized)
endif()

# The programs run as root and read what others send: addresses differ from run to run, and what the
# loader has resolved cannot be written to afterwards. tests/hardening looks at the built files.
include(CheckPIESupported)
check_pie_supported(LANGUAGES CXX)
target_link_options(sennet_compile INTERFACE -Wl,-z,relro,-z,now,-z,noexecstack)

if(NOT CMAKE_BUILD_TYPE STREQUAL "Debug" AND NOT SENNET_SANITIZE)
    # The fortified library functions need an optimising compiler.
    target_compile_definitions(sennet_compile INTERFACE _FORTIFY_SOURCE=2)
    target_compile_options(sennet_compile INTERFACE -fstack-protector-strong)
    # Not for every processor.
    include(CheckCXXCompilerFlag)
    foreach(protection stack-clash-protection cf-protection)
        check_cxx_compiler_flag(-f${protection} SENNET_HAS_${protection})
        if(SENNET_HAS_${protection})
            target_compile_options(sennet_compile INTERFACE -f${protection})
        endif()
    endforeach()
endif()

if(SENNET_SANITIZE)
    target_compile_options(sennet_compile INTERFACE -fsanitize=${SENNET_SANITIZE}
                           -fno-sanitize-recover=all -fno-omit-frame-pointer)
    target_link_options(sennet_compile INTERFACE -fsanitize=${SENNET_SANITIZE})
endif()

if(SENNET_BUILD_FUZZERS)
    if(NOT CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
        message(FATAL_ERROR "SENNET_BUILD_FUZZERS needs clang++: use the preset ci")
    endif()
    target_compile_options(sennet_compile INTERFACE -fsanitize=fuzzer-no-link)
endif()

if(SENNET_COVERAGE)
    if(NOT CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
        message(FATAL_ERROR "SENNET_COVERAGE needs clang++: use the preset ci")
    endif()
    # The place is compiled in: some tests start programs with an environment of their own.
    set(profile "-fprofile-instr-generate=${CMAKE_BINARY_DIR}/profile/%4m.profraw")
    target_compile_options(sennet_compile INTERFACE ${profile} -fcoverage-mapping)
    target_link_options(sennet_compile INTERFACE ${profile})
endif()

# sennet_precompile(TARGET header...): with SENNET_PRECOMPILE, where enough sources gain by it.
function(sennet_precompile TARGET)
    get_target_property(sources ${TARGET} SOURCES)
    list(LENGTH sources count)
    if(SENNET_PRECOMPILE AND count GREATER 8)
        target_precompile_headers(${TARGET} PRIVATE ${ARGN})
    endif()
endfunction()
