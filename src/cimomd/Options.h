#pragma once

// What the command line asks for.

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "protocol/HttpServer.h"
#include "protocol/LoopbackAddress.h"
#include "service/UnixListener.h"

namespace cimomd {

struct Options {
    /// The only client, which excludes the places to listen at.
    std::optional<int> connectedDescriptor;
    /// Empty for none.
    std::string socketPath;
    SocketAccess socketAccess;
    std::optional<LoopbackAddress> httpAddress;
    /// The directory of the schema.
    std::filesystem::path schemaDirectory;
    /// The administrator's own MOF files, if any shall be served.
    std::optional<std::filesystem::path> mofDirectory;
    std::filesystem::path rootDirectory = "/";
    HttpLimits limits;
    /// The MOF files to check instead of serving; empty for none.
    std::vector<std::filesystem::path> checkedFiles;
};

/// The options, or the exit status when there is nothing to serve: 0 after --help and --version, 1
/// after a mistake, which is told on standard error.
struct ParsedOptions {
    Options options;
    std::optional<int> exitStatus;
};
ParsedOptions parseOptions(int argc, char** argv);

}  // namespace cimomd
