// cimomd: a local CIM object manager. It compiles its schema, then serves one connection, or a
// socket, until it is told to stop.

#include <fmt/format.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <stdexcept>

#include "Options.h"
#include "StopSignal.h"
#include "mof/MofCompiler.h"
#include "protocol/HttpServer.h"
#include "protocol/UnixListener.h"
#include "providers/ProviderList.h"
#include "system/LiveSystemCalls.h"
#include "system/RecordedSystemCalls.h"

namespace cimomd {
namespace {

constexpr const char* kNamespace = "root/cimv2";
constexpr const char* kSchemaFile = "cimomd.mof";

std::unique_ptr<SystemCalls> systemCallsFor(const Options& options) {
    if (options.rootDirectory == "/")
        return std::make_unique<LiveSystemCalls>();
    return std::make_unique<RecordedSystemCalls>(SystemPaths(options.rootDirectory));
}

void requireStreamSocket(int descriptor) {
    int type = 0;
    socklen_t length = sizeof type;
    if (::getsockopt(descriptor, SOL_SOCKET, SO_TYPE, &type, &length) != 0 || type != SOCK_STREAM)
        throw std::runtime_error(
            fmt::format("the descriptor {} is no connected stream socket", descriptor));
}

/// The parent is the only client: without it nobody would ever close the connection again, should
/// another child have inherited its end.
void endWithParent() {
    ::prctl(PR_SET_PDEATHSIG, SIGTERM);
}

void serveDescriptor(int descriptor, HttpServer& server, StopSignal& stop) {
    requireStreamSocket(descriptor);
    endWithParent();
    server.serveConnection(descriptor, [&stop] { stop.request(); });
    stop.wait();
}

void serveSocket(const std::string& path, HttpServer& server, StopSignal& stop) {
    UnixListener listener(path);
    server.listenOn(listener.release());
    stop.wait();
}

void serve(const Options& options) {
    StopSignal stop;
    const Pegasus::CIMNamespaceName nameSpace(kNamespace);
    auto classes = std::make_shared<ClassRepository>();
    MofCompiler(*classes, nameSpace).compileFile(options.schemaDirectory / kSchemaFile);
    CurrentRepository repository(std::move(classes));
    const std::unique_ptr<SystemCalls> calls = systemCallsFor(options);
    const ProviderList providers = makeProviders(SystemPaths(options.rootDirectory), *calls);
    const ProviderIndex index(providers, nameSpace);
    const Dispatcher dispatcher(repository, index);
    const CimService service(dispatcher);
    HttpServer server(service, {options.maxConnections, options.idleSeconds});
    if (options.connectedDescriptor)
        serveDescriptor(*options.connectedDescriptor, server, stop);
    else
        serveSocket(options.socketPath, server, stop);
}

}  // namespace
}  // namespace cimomd

int main(int argc, char** argv) {
    const cimomd::ParsedOptions parsed = cimomd::parseOptions(argc, argv);
    if (parsed.exitStatus)
        return *parsed.exitStatus;
    try {
        std::signal(SIGPIPE, SIG_IGN);
        cimomd::serve(parsed.options);
        return 0;
    } catch (const std::exception& error) {
        std::fputs(fmt::format("cimomd: {}\n", error.what()).c_str(), stderr);
        return 1;
    }
}
