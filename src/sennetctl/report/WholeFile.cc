#include "report/WholeFile.h"

#include <Velm/TextFile.h>

#include <cerrno>
#include <filesystem>
#include <fstream>
#include <system_error>

namespace sennetctl {

std::string causeOf(int error) {
    return error == 0 ? "input/output error" : std::generic_category().message(error);
}

std::string readWholeFile(const std::string& path, std::size_t limitOctets) {
    std::error_code error;
    const std::filesystem::file_status status = std::filesystem::status(path, error);
    if (status.type() == std::filesystem::file_type::not_found) {
        throw CannotRun(path, "there is no such file");
    }
    // A pipe or a terminal would keep the command waiting.
    if (!error && status.type() != std::filesystem::file_type::regular) {
        throw CannotRun(path, "is no regular file");
    }
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        throw CannotRun(path, causeOf(errno));
    }
    std::string octets;
    char piece[64 * 1024];
    while (file.read(piece, sizeof piece) || file.gcount() > 0) {
        octets.append(piece, static_cast<std::size_t>(file.gcount()));
        if (octets.size() > limitOctets) {
            throw CannotRun(path, "is larger than " + std::to_string(limitOctets >> 20) +
                                      " MiB, which is the most that sennetctl reads of it");
        }
    }
    if (file.bad()) {
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
