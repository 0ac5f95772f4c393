# Makes PageAssets.h of the page's style sheet and script.

# Sets RESULT to the octets that HEX tells, 32 of them, in base64.
function(sennet_base64_of_sha256 HEX RESULT)
    set(alphabet "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/")
    set(text "")
    # Three digits are two letters; the last letter stands for no octet.
    foreach(at RANGE 0 63 3)
        string(SUBSTRING "${HEX}00" ${at} 3 digits)
        math(EXPR high "0x${digits} >> 6")
        math(EXPR low "0x${digits} & 63")
        string(SUBSTRING "${alphabet}" ${high} 1 first)
        string(SUBSTRING "${alphabet}" ${low} 1 second)
        string(APPEND text "${first}${second}")
    endforeach()
    string(SUBSTRING "${text}" 0 43 text)
    set(${RESULT} "${text}=" PARENT_SCOPE)
endfunction()

function(sennet_read_page_asset FILE NAME)
    set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS "${FILE}")
    file(READ "${FILE}" text)
    file(SHA256 "${FILE}" hash)
    sennet_base64_of_sha256(${hash} hash)
    set(${NAME} "${text}" PARENT_SCOPE)
    set(${NAME}_SHA256 "${hash}" PARENT_SCOPE)
endfunction()

sennet_read_page_asset("${CMAKE_CURRENT_SOURCE_DIR}/html/page.css" PAGE_STYLE)
sennet_read_page_asset("${CMAKE_CURRENT_SOURCE_DIR}/html/page.js" PAGE_SCRIPT)
configure_file(html/PageAssets.h.in html/PageAssets.h @ONLY)
