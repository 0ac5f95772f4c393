# cpack reads this before it packs. Nobody but the packager knows who answers for packages.
if(NOT CPACK_PACKAGE_CONTACT MATCHES "^[^<>]+ <[^<>@ ]+@[^<>@ ]+>$")
    message(FATAL_ERROR "The packages need somebody who answers for them: configure with "
                        "-DSENNET_PACKAGE_CONTACT=\"Name <address>\"")
endif()
