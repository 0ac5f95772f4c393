#include "Options.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <system_error>

#ifndef CIMOMD_VERSION
#error "CIMOMD_VERSION must be defined"
#endif

namespace cimomd {
namespace {

/// Beside the program: it is found after an installation anywhere, and in the build tree.
std::filesystem::path defaultSchemaDirectory() {
    std::error_code error;
    const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
    return program.parent_path().parent_path() / "share" / "cimomd" / "schema";
}

}  // namespace

ParsedOptions parseOptions(int argc, char** argv) {
    ParsedOptions parsed;
    Options& options = parsed.options;
    options.schemaDirectory = defaultSchemaDirectory();
    CLI::App app("A local CIM object manager: serves the inventory of this machine, read-only.",
                 "cimomd");
    app.set_version_flag("--version", std::string("cimomd ") + CIMOMD_VERSION);
    CLI::Option_group* place = app.add_option_group("Where to serve (exactly one)");
    place
        ->add_option("--fd", options.connectedDescriptor,
                     "serve the connection on this open descriptor and end with it")
        ->check(CLI::NonNegativeNumber);
    place->add_option("--socket", options.socketPath,
                      "listen on a Unix domain socket with this path");
    place->require_option(1);
    app.add_option("--schema", options.schemaDirectory, "directory of the schema's MOF files")
        ->check(CLI::ExistingDirectory);
    app.add_option("--root", options.rootDirectory,
                   "read the machine recorded below this directory instead of the live one")
        ->check(CLI::ExistingDirectory);
    app.add_option("--max-connections", options.maxConnections,
                   "further connections wait (with --socket)")
        ->check(CLI::Range(1, 10000))
        ->capture_default_str();
    app.add_option("--idle-timeout", options.idleSeconds,
                   "seconds until an idle connection is closed (with --socket)")
        ->check(CLI::Range(1, 86400))
        ->capture_default_str();
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        parsed.exitStatus = std::min(app.exit(error), 1);
    }
    return parsed;
}

}  // namespace cimomd
