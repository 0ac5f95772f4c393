# Manual pages and completions. A new page needs no line here: cimomd.* belongs to cimomd,
# everything else to sennet.

find_program(GZIP_PROGRAM gzip REQUIRED)

# Compresses without name and time, so that every build gives the same bytes.
function(sennet_compress FROM TO)
    add_custom_command(OUTPUT "${TO}" DEPENDS "${FROM}" VERBATIM
                       COMMAND sh -c "\"$1\" -9nc \"$2\" > \"$3\"" sh "${GZIP_PROGRAM}" "${FROM}" "${TO}")
endfunction()

function(sennet_component_of FILE RESULT)
    get_filename_component(name "${FILE}" NAME)
    set(component sennet)
    if(name MATCHES "^cimomd")
        set(component cimomd)
    endif()
    set(${RESULT} ${component} PARENT_SCOPE)
endfunction()

file(GLOB pages CONFIGURE_DEPENDS man/*.in)
foreach(page IN LISTS pages)
    get_filename_component(name "${page}" NAME_WLE)
    string(REGEX MATCH "[1-8]$" section "${name}")
    set(built "${CMAKE_CURRENT_BINARY_DIR}/man/${name}")
    configure_file("${page}" "${built}" @ONLY)
    sennet_compress("${built}" "${built}.gz")
    list(APPEND compressed "${built}.gz")
    sennet_component_of("${page}" component)
    install(FILES "${built}.gz" DESTINATION "${CMAKE_INSTALL_MANDIR}/man${section}"
            COMPONENT ${component})
endforeach()
add_custom_target(sennet_manual ALL DEPENDS ${compressed})

file(GLOB completions CONFIGURE_DEPENDS completion/*)
foreach(completion IN LISTS completions)
    sennet_component_of("${completion}" component)
    install(FILES "${completion}" DESTINATION "${SENNET_COMPLETION_DIR}" COMPONENT ${component})
endforeach()
