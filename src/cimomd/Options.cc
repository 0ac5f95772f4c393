#include "Options.h"

#include <grp.h>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <charconv>
#include <chrono>
#include <system_error>

#ifndef CIMOMD_VERSION
#error "CIMOMD_VERSION must be defined"
#endif
#ifndef CIMOMD_MOF_DIR
#error "CIMOMD_MOF_DIR must be defined"
#endif

namespace cimomd {
namespace {

constexpr unsigned kAllModes = 0777;

/// Beside the program: it is found after an installation anywhere, and in the build tree.
std::filesystem::path defaultSchemaDirectory() {
    std::error_code error;
    const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
    return program.parent_path().parent_path() / "share" / "cimomd" / "schema";
}

std::string parseMode(const std::string& text, SocketAccess& access) {
    unsigned mode = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, mode, 8);
    if (text.empty() || error != std::errc() || stop != end || mode > kAllModes)
        return "expected an octal mode such as 0660";
    access.mode = mode;
    return {};
}

std::string findGroup(const std::string& name, SocketAccess& access) {
    const group* found = ::getgrnam(name.c_str());
    if (found == nullptr)
        return "there is no group " + name;
    access.group = found->gr_gid;
    return {};
}

std::string parseHttp(const std::string& text, Options& options) {
    options.httpAddress = LoopbackAddress::parse(text);
    return options.httpAddress ? "" : "expected a loopback address such as 127.0.0.1:5988";
}

void addPlaces(CLI::App& app, Options& options) {
    CLI::Option* descriptor =
        app.add_option("--fd", options.connectedDescriptor,
                       "serve the connection on this open descriptor and end with it")
            ->check(CLI::NonNegativeNumber);
    CLI::Option* socket = app.add_option("--socket", options.socketPath,
                                         "listen on a Unix domain socket with this path")
                              ->excludes(descriptor);
    app.add_option_function<std::string>(
           "--socket-mode", [](const std::string&) {},
           "octal mode of the socket, by default 0600: who may "
           "write to it may connect")
        ->needs(socket)
        ->check(
            [&options](const std::string& text) { return parseMode(text, options.socketAccess); });
    app.add_option_function<std::string>(
           "--socket-group", [](const std::string&) {}, "group that the socket is given to")
        ->needs(socket)
        ->check(
            [&options](const std::string& name) { return findGroup(name, options.socketAccess); });
    app.add_option_function<std::string>(
           "--http", [](const std::string&) {},
           "listen for HTTP on this loopback address, such as 127.0.0.1:5988 (port 0: any free "
           "one, told on standard output); every local user can connect there and read what "
           "cimomd may read")
        ->excludes(descriptor)
        ->check([&options](const std::string& text) { return parseHttp(text, options); });
    app.add_option("--check", options.checkedFiles,
                   "compile these MOF files together, as if they were added to the schema, tell "
                   "all mistakes and end; files that declare the schema's qualifiers anew may be "
                   "a schema of their own")
        ->option_text("FILE...")
        ->excludes("--fd")
        ->excludes("--socket")
        ->excludes("--http");
}

void addSources(CLI::App& app, Options& options) {
    app.add_option("--schema", options.schemaDirectory, "directory of the schema's MOF files")
        ->check(CLI::ExistingDirectory);
    app.add_option("--mof-dir", options.mofDirectory,
                   "directory of your own *.mof files, compiled after the schema in the order of "
                   "their names; by default " CIMOMD_MOF_DIR " unless --root is given")
        ->check(CLI::ExistingDirectory);
    app.add_option("--root", options.rootDirectory,
                   "read the machine recorded below this directory instead of the live one")
        ->check(CLI::ExistingDirectory);
}

void addLimits(CLI::App& app, HttpLimits& limits) {
    app.add_option("--max-connections", limits.maxConnections,
                   "connections at a time, an eighth of them for root and the server's own user "
                   "(not with --fd)")
        ->check(CLI::Range(1, 10000))
        ->capture_default_str();
    app.add_option_function<unsigned>(
           "--idle-timeout",
           [&limits](unsigned seconds) { limits.patience = std::chrono::seconds(seconds); },
           "seconds that a client has for each step: the head of a request, its body, taking a "
           "piece of the answer, and between requests (not with --fd); by default 30")
        ->check(CLI::Range(1, 86400));
}

}  // namespace

ParsedOptions parseOptions(int argc, char** argv) {
    ParsedOptions parsed;
    Options& options = parsed.options;
    options.schemaDirectory = defaultSchemaDirectory();
    CLI::App app("A local CIM object manager: serves the inventory of this machine, read-only.",
                 "cimomd");
    app.set_version_flag("--version", std::string("cimomd ") + CIMOMD_VERSION);
    app.footer(
        "cimomd serves one connection (--fd), or those of the sockets given here and by a service "
        "manager. SIGHUP makes it compile all MOF files again.");
    addPlaces(app, options);
    addSources(app, options);
    addLimits(app, options.limits);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        parsed.exitStatus = std::min(app.exit(error), 1);
    }
    if (!options.mofDirectory && options.rootDirectory == "/")
        options.mofDirectory = CIMOMD_MOF_DIR;
    return parsed;
}

}  // namespace cimomd
