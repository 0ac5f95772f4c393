# How other programs find the installed platform library: pkg-config and CMake.

include(CMakePackageConfigHelpers)

configure_file(velmclient/velmclient.pc.in velmclient/velmclient.pc @ONLY)
install(FILES "${CMAKE_CURRENT_BINARY_DIR}/velmclient/velmclient.pc"
        DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig" COMPONENT libvelmclient_dev)

set(version_file "${CMAKE_CURRENT_BINARY_DIR}/velmclient/velmclient-config-version.cmake")
write_basic_package_version_file("${version_file}" COMPATIBILITY SameMajorVersion)
set(config_directory "${CMAKE_INSTALL_LIBDIR}/cmake/velmclient")
install(FILES "${version_file}" DESTINATION "${config_directory}" COMPONENT libvelmclient_dev)
install(EXPORT velmclientTargets NAMESPACE velmclient:: FILE velmclient-config.cmake
        DESTINATION "${config_directory}" COMPONENT libvelmclient_dev)
