#include "client/ServerPlaces.h"

#include <filesystem>
#include <system_error>

namespace Pegasus {

namespace {

// An object manager built or unpacked together with the program comes before the installed one.
std::vector<std::string> ownObjectManagers() {
    std::vector<std::string> programs;
    std::error_code error;
    const std::filesystem::path self = std::filesystem::read_symlink("/proc/self/exe", error);
    if (!error) {
        programs.push_back((self.parent_path() / "cimomd").string());
    }
    programs.emplace_back(SENNET_INSTALLED_CIMOMD);
    return programs;
}

}  // namespace

ServerPlaces ServerPlaces::standard() {
    ServerPlaces places;
    places.sockets = {"/var/run/tog-pegasus/socket/cimxml.socket",
                      "/var/run/tog-pegasus/cimxml.socket", "/var/tmp/cimxml.socket",
                      "/tmp/cimxml.socket", "/run/cimomd/cimxml.socket"};
    places.programs = {
        "/usr/sbin/cimserver",     "/usr/local/sbin/cimserver", "/opt/tog-pegasus/sbin/cimserver",
        "/usr/sbin/sfcbd",         "/usr/local/sbin/sfcbd",     "/usr/sbin/owcimomd",
        "/usr/local/sbin/owcimomd"};
    places.embeddedPrograms = ownObjectManagers();
    return places;
}

}  // namespace Pegasus
