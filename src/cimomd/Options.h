#pragma once

// What the command line asks for.

#include <filesystem>
#include <optional>
#include <string>

namespace cimomd {

struct Options {
    /// Exactly one of the two is set.
    std::optional<int> connectedDescriptor;
    std::string socketPath;
    /// The directory of the schema.
    std::filesystem::path schemaDirectory;
    std::filesystem::path rootDirectory = "/";
    unsigned maxConnections = 128;
    unsigned idleSeconds = 30;
};

/// The options, or the exit status when there is nothing to serve: 0 after --help and --version, 1
/// after a mistake, which is told on standard error.
struct ParsedOptions {
    Options options;
    std::optional<int> exitStatus;
};
ParsedOptions parseOptions(int argc, char** argv);

}  // namespace cimomd
