# The packages that cpack makes: Debian's (DEB) and RPM's (RPM) from one description.

set(SENNET_PACKAGE_CONTACT "" CACHE STRING
    "Who answers for the packages that cpack makes: Name <address>")
set(SENNET_PACKAGE_RELEASE 1 CACHE STRING "Release of the packages of this version")

set(debian "${CMAKE_CURRENT_BINARY_DIR}/debian")
set(CPACK_COMPONENTS_ALL sennet cimomd libvelmclient libvelmclient_dev)
set(names sennet cimomd libvelmclient libvelmclient-dev)

# --- what every package has ----------------------------------------------------------------------

configure_file(debian/changelog.in "${debian}/changelog" @ONLY)
sennet_compress("${debian}/changelog" "${debian}/changelog.Debian.gz")
sennet_compress("${PROJECT_SOURCE_DIR}/CHANGELOG.md" "${debian}/changelog.gz")
add_custom_target(sennet_changelogs ALL
                  DEPENDS "${debian}/changelog.Debian.gz" "${debian}/changelog.gz")
foreach(component name IN ZIP_LISTS CPACK_COMPONENTS_ALL names)
    set(papers "${CMAKE_INSTALL_DATADIR}/doc/${name}")
    install(FILES "${debian}/changelog.Debian.gz" "${debian}/changelog.gz"
            DESTINATION "${papers}" COMPONENT ${component})
    install(FILES "${PROJECT_SOURCE_DIR}/LICENSE"
            DESTINATION "${papers}" RENAME copyright COMPONENT ${component})
    string(TOUPPER ${component} upper)
    set(CPACK_DEBIAN_${upper}_PACKAGE_NAME ${name})
    set(CPACK_RPM_${upper}_PACKAGE_NAME ${name})
    set(CPACK_RPM_${upper}_USER_FILELIST
        "%exclude ${CMAKE_INSTALL_FULL_DATADIR}/doc/${name}/changelog.Debian.gz")
endforeach()
file(GLOB manual_texts CONFIGURE_DEPENDS "${PROJECT_SOURCE_DIR}/docs/*.md")
install(FILES ${manual_texts} DESTINATION "${CMAKE_INSTALL_DATADIR}/doc/sennet" COMPONENT sennet)
install(DIRECTORY "${PROJECT_SOURCE_DIR}/docs/examples"
        DESTINATION "${CMAKE_INSTALL_DATADIR}/doc/sennet" COMPONENT sennet)

set(CPACK_PACKAGE_NAME sennet)
set(CPACK_PACKAGE_VENDOR "The sennet maintainers")
set(CPACK_PACKAGE_CONTACT "${SENNET_PACKAGE_CONTACT}")
set(CPACK_PROJECT_CONFIG_FILE "${CMAKE_CURRENT_SOURCE_DIR}/BeforePacking.cmake")
set(CPACK_PACKAGE_DIRECTORY "${CMAKE_BINARY_DIR}/packages")
set(CPACK_STRIP_FILES ON)
# Some files go below the system configuration directory, outside the prefix.
set(CPACK_SET_DESTDIR ON)
set(CPACK_INSTALL_PREFIX "${CMAKE_INSTALL_PREFIX}")
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE
    GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)

set(version "${PROJECT_VERSION}-${SENNET_PACKAGE_RELEASE}")

# What a package is: a line without a full stop, and a text.
function(sennet_describe COMPONENT LINE TEXT)
    set(CPACK_DEBIAN_${COMPONENT}_DESCRIPTION "${LINE}\n${TEXT}" PARENT_SCOPE)
    set(CPACK_RPM_${COMPONENT}_PACKAGE_SUMMARY "${LINE}" PARENT_SCOPE)
    set(CPACK_RPM_${COMPONENT}_PACKAGE_DESCRIPTION "${TEXT}" PARENT_SCOPE)
endfunction()

sennet_describe(SENNET "inventory of a machine as MIF files"
"sennet writes the hardware and software inventory that the CIM server of this
machine holds into DMTF MIF files, which Microsoft SMS, CA, LANDesk and QVE
import, and for QVE into SQL schema scripts and query scripts, too.

The inventory scripts of this package list everything from firmware to
processes; further ones are text files of a few lines.")
sennet_describe(CIMOMD "local CIM object manager for inventories"
"cimomd reads the inventory of a Linux machine from the kernel, the firmware
and the package manager and serves it to local CIM clients, for reading only.

sennet starts it for the time of a run where no other CIM server is
installed. As a service it is started by its socket, which an administrator
enables.")
sennet_describe(LIBVELMCLIENT "platform library of sennet"
"Where the platform keeps sennet's files, and how they are read and written:
properties files, line by line reading, and writing of files that appear only
when they are complete.")
sennet_describe(LIBVELMCLIENT_DEV "platform library of sennet - development files"
"Headers of libvelmclient and what pkg-config and CMake need to find it.")

# --- Debian --------------------------------------------------------------------------------------

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_RELEASE ${SENNET_PACKAGE_RELEASE})
set(CPACK_DEBIAN_PACKAGE_SOURCE sennet)
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
# The programs need the library that is packaged together with them.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS "${CMAKE_BINARY_DIR}/src/velmclient")
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)

set(CPACK_DEBIAN_SENNET_PACKAGE_SECTION admin)
set(CPACK_DEBIAN_SENNET_PACKAGE_DEPENDS "libvelmclient (= ${version})")
set(CPACK_DEBIAN_SENNET_PACKAGE_RECOMMENDS cimomd)
file(GLOB control CONFIGURE_DEPENDS debian/sennet/*)
set(CPACK_DEBIAN_SENNET_PACKAGE_CONTROL_EXTRA ${control})

set(CPACK_DEBIAN_CIMOMD_PACKAGE_SECTION admin)
# Its reader of services loads libsystemd when it is there.
set(CPACK_DEBIAN_CIMOMD_PACKAGE_RECOMMENDS "libsystemd0, pci.ids, usb.ids")
file(GLOB control CONFIGURE_DEPENDS debian/cimomd/*)
set(CPACK_DEBIAN_CIMOMD_PACKAGE_CONTROL_EXTRA ${control})

set(CPACK_DEBIAN_LIBVELMCLIENT_PACKAGE_SECTION libs)
file(GLOB control CONFIGURE_DEPENDS debian/libvelmclient/*)
set(CPACK_DEBIAN_LIBVELMCLIENT_PACKAGE_CONTROL_EXTRA ${control})

set(CPACK_DEBIAN_LIBVELMCLIENT_DEV_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_LIBVELMCLIENT_DEV_PACKAGE_SHLIBDEPS OFF)
set(CPACK_DEBIAN_LIBVELMCLIENT_DEV_PACKAGE_DEPENDS "libvelmclient (= ${version})")

# --- RPM -----------------------------------------------------------------------------------------

set(CPACK_RPM_COMPONENT_INSTALL ON)
set(CPACK_RPM_MAIN_COMPONENT sennet)
set(CPACK_RPM_FILE_NAME RPM-DEFAULT)
set(CPACK_RPM_PACKAGE_RELEASE ${SENNET_PACKAGE_RELEASE})
set(CPACK_RPM_PACKAGE_LICENSE MIT)
set(CPACK_RPM_PACKAGE_GROUP System)
set(CPACK_RPM_EXCLUDE_FROM_AUTO_FILELIST_ADDITION
    "${CMAKE_INSTALL_FULL_SYSCONFDIR}" "${CMAKE_INSTALL_PREFIX}/lib/systemd"
    "${CMAKE_INSTALL_PREFIX}/lib/systemd/system" "${CMAKE_INSTALL_PREFIX}/lib/sysusers.d"
    "${CMAKE_INSTALL_FULL_MANDIR}"
    "${CMAKE_INSTALL_FULL_MANDIR}/man1" "${CMAKE_INSTALL_FULL_MANDIR}/man5"
    "${CMAKE_INSTALL_FULL_MANDIR}/man8" "${CMAKE_INSTALL_FULL_LIBDIR}"
    "${CMAKE_INSTALL_FULL_LIBDIR}/cmake" "${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig"
    "${CMAKE_INSTALL_FULL_DATADIR}/doc" "${CMAKE_INSTALL_FULL_SBINDIR}"
    "${CMAKE_INSTALL_FULL_INCLUDEDIR}" "${CMAKE_INSTALL_FULL_DATADIR}/bash-completion"
    "${CMAKE_INSTALL_FULL_DATADIR}/bash-completion/completions")

set(scripts "${CMAKE_CURRENT_SOURCE_DIR}/rpm")
set(CPACK_RPM_SPEC_MORE_DEFINE "%define _build_id_links none")
set(CPACK_RPM_LIBVELMCLIENT_DEV_PACKAGE_NAME libvelmclient-devel)
set(CPACK_RPM_SENNET_PACKAGE_REQUIRES "libvelmclient = ${version}")
set(CPACK_RPM_SENNET_PACKAGE_SUGGESTS cimomd)
list(APPEND CPACK_RPM_SENNET_USER_FILELIST
    "%config(noreplace) ${CMAKE_INSTALL_FULL_SYSCONFDIR}/velmira/velm.properties")
set(CPACK_RPM_SENNET_POST_INSTALL_SCRIPT_FILE "${scripts}/reload-units")
set(CPACK_RPM_SENNET_PRE_UNINSTALL_SCRIPT_FILE "${scripts}/stop-timers")
set(CPACK_RPM_SENNET_POST_UNINSTALL_SCRIPT_FILE "${scripts}/reload-units")
set(CPACK_RPM_CIMOMD_POST_INSTALL_SCRIPT_FILE "${scripts}/make-user-and-reload-units")
set(CPACK_RPM_CIMOMD_PRE_UNINSTALL_SCRIPT_FILE "${scripts}/stop-cimomd")
set(CPACK_RPM_CIMOMD_POST_UNINSTALL_SCRIPT_FILE "${scripts}/reload-units-and-restart")
set(CPACK_RPM_LIBVELMCLIENT_DEV_PACKAGE_REQUIRES "libvelmclient = ${version}")

include(CPack)
