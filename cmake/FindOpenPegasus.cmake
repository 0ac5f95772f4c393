# Finds an installed OpenPegasus CIM client.
#
#   OPENPEGASUS_ROOT      where to look first: a tree with include/ and lib/ (or lib64/)
#   OpenPegasus_FOUND     result
#   OpenPegasus::client   target: headers, platform definition, libpegclient and libpegcommon

find_path(OpenPegasus_INCLUDE_DIR Pegasus/Client/CIMClient.h
    HINTS ${OPENPEGASUS_ROOT} ENV OPENPEGASUS_ROOT PATH_SUFFIXES include)
find_library(OpenPegasus_CLIENT_LIBRARY pegclient
    HINTS ${OPENPEGASUS_ROOT} ENV OPENPEGASUS_ROOT PATH_SUFFIXES lib lib64)
find_library(OpenPegasus_COMMON_LIBRARY pegcommon
    HINTS ${OPENPEGASUS_ROOT} ENV OPENPEGASUS_ROOT PATH_SUFFIXES lib lib64)

# The library's headers do not recognise the platform by themselves.
if(CMAKE_SYSTEM_PROCESSOR MATCHES "aarch64|arm64")
    set(OpenPegasus_PLATFORM PEGASUS_PLATFORM_LINUX_AARCH64_GNU)
elseif(CMAKE_SYSTEM_PROCESSOR MATCHES "ppc64")
    set(OpenPegasus_PLATFORM PEGASUS_PLATFORM_LINUX_PPC64_GNU)
elseif(CMAKE_SYSTEM_PROCESSOR MATCHES "s390x")
    set(OpenPegasus_PLATFORM PEGASUS_PLATFORM_LINUX_ZSERIES64_GNU)
else()
    set(OpenPegasus_PLATFORM PEGASUS_PLATFORM_LINUX_X86_64_GNU)
endif()

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(OpenPegasus REQUIRED_VARS
    OpenPegasus_CLIENT_LIBRARY OpenPegasus_COMMON_LIBRARY OpenPegasus_INCLUDE_DIR)

if(OpenPegasus_FOUND AND NOT TARGET OpenPegasus::client)
    add_library(OpenPegasus::common UNKNOWN IMPORTED)
    set_target_properties(OpenPegasus::common PROPERTIES
        IMPORTED_LOCATION "${OpenPegasus_COMMON_LIBRARY}")
    # The client library needs others of its own, which stand beside it: let the linker look there,
    # and the loader too (a run path of the old kind serves the libraries' libraries).
    get_filename_component(OpenPegasus_LIBRARY_DIR "${OpenPegasus_CLIENT_LIBRARY}" DIRECTORY)
    add_library(OpenPegasus::client UNKNOWN IMPORTED)
    set_target_properties(OpenPegasus::client PROPERTIES
        IMPORTED_LOCATION "${OpenPegasus_CLIENT_LIBRARY}"
        INTERFACE_INCLUDE_DIRECTORIES "${OpenPegasus_INCLUDE_DIR}"
        INTERFACE_COMPILE_DEFINITIONS "${OpenPegasus_PLATFORM}"
        INTERFACE_LINK_OPTIONS
            "LINKER:-rpath-link,${OpenPegasus_LIBRARY_DIR};LINKER:--disable-new-dtags"
        INTERFACE_LINK_LIBRARIES OpenPegasus::common)
endif()
mark_as_advanced(OpenPegasus_INCLUDE_DIR OpenPegasus_CLIENT_LIBRARY OpenPegasus_COMMON_LIBRARY)
