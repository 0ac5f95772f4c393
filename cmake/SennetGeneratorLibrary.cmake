# sennet_add_generator_library(NAME SOURCES file... [ROOMS name...] [LIBS target...])
#   One room of the generator, built with the chosen CIM library, and on top of the other rooms that
#   it names. NAME_bundled is the same with the bundled library, for programs that ask that for more
#   than other ones tell. ROOMS and LIBS are linked publicly.

function(sennet_add_generator_library NAME)
    cmake_parse_arguments(ARG "" "" "SOURCES;ROOMS;LIBS" ${ARGN})
    add_library(${NAME} ${ARG_SOURCES})
    target_include_directories(${NAME} PUBLIC "${CMAKE_CURRENT_SOURCE_DIR}/..")
    target_link_libraries(${NAME} PUBLIC ${ARG_ROOMS} sennet_cim ${ARG_LIBS}
                          PRIVATE sennet_compile)
    if(NOT TARGET OpenPegasus::client)
        add_library(${NAME}_bundled ALIAS ${NAME})
        return()
    endif()
    list(TRANSFORM ARG_ROOMS APPEND _bundled)
    add_library(${NAME}_bundled EXCLUDE_FROM_ALL ${ARG_SOURCES})
    target_include_directories(${NAME}_bundled PUBLIC "${CMAKE_CURRENT_SOURCE_DIR}/..")
    target_link_libraries(${NAME}_bundled PUBLIC ${ARG_ROOMS} cimclient ${ARG_LIBS}
                          PRIVATE sennet_compile)
endfunction()
