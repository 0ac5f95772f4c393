#include "report/WholeFile.h"

#include <Velm/TextFile.h>

#include <cerrno>
#include <system_error>

#include "velmclient/FileDescriptor.h"

namespace sennetctl {

std::string causeOf(int error) {
    return error == 0 ? "input/output error" : std::generic_category().message(error);
}

namespace {

std::string causeOfRefusal(int error) {
    switch (error) {
        case ENOENT:
        case ENOTDIR:
            return "there is no such file";
        case EISDIR:
        case EINVAL:
        case ENXIO:  // a socket, which nothing opens
            return "is no regular file";
        default:
            return causeOf(error);
    }
}

}  // namespace

std::string readWholeFile(const std::string& path, std::size_t limitOctets) {
    const Velm::FileDescriptor file = Velm::FileDescriptor::openRegularFile(path.c_str());
    if (!file.isOpen()) {
        throw CannotRun(path, causeOfRefusal(errno));
    }
    std::string octets;
    char piece[64 * 1024];
    ssize_t count = 0;
    while ((count = file.read(piece, sizeof piece)) > 0) {
        octets.append(piece, static_cast<std::size_t>(count));
        if (octets.size() > limitOctets) {
            throw CannotRun(path, "is larger than " + std::to_string(limitOctets >> 20) +
                                      " MiB, which is the most that sennetctl reads of it");
        }
    }
    if (count < 0) {
        throw CannotRun(path, causeOf(errno));
    }
    return octets;
}

void refuseExisting(const std::string& path) {
    if (Velm::TextFile(path.c_str()).exists()) {
        throw CannotRun(path, "exists already");
    }
}

void writeWholeFile(const std::string& path, const std::string& octets) {
    constexpr int kOpenForWriting = 1;
    Velm::TextFile file(path.c_str());
    if (file.open(kOpenForWriting) != 0 ||
        file.writeLine(octets.data(), static_cast<int>(octets.size())) < 0 || file.close() != 0) {
        throw CannotRun(path, causeOf(errno));
    }
}

}  // namespace sennetctl
