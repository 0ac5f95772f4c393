// cimomd: a local CIM object manager. It compiles its schema, then serves one connection, or those
// of its sockets, until it is told to stop.

#include <fmt/format.h>
#include <malloc.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <stdexcept>

#include "Options.h"
#include "mof/MofCheck.h"
#include "mof/MofCompiler.h"
#include "process/ProcessGuards.h"
#include "protocol/CimService.h"
#include "providers/ProviderList.h"
#include "repository/CurrentRepository.h"
#include "service/Log.h"
#include "service/LoopbackListener.h"
#include "service/MainLoop.h"
#include "service/SchemaLoader.h"
#include "service/ServiceManager.h"
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

/// Whether the process that made the connection is gone, which counts as long as it is a zombie.
bool hasClientEnded(int connection) {
    ucred client{};
    socklen_t length = sizeof client;
    // Number 0 is a process that cannot be seen from here.
    if (::getsockopt(connection, SOL_SOCKET, SO_PEERCRED, &client, &length) != 0 || client.pid <= 0)
        return false;
    const long process = ::syscall(SYS_pidfd_open, client.pid, 0);
    if (process < 0)
        return errno == ESRCH;
    pollfd end{static_cast<int>(process), POLLIN, 0};
    const bool ended = ::poll(&end, 1, 0) > 0;
    ::close(end.fd);
    return ended;
}

/// The parent is the only client: without it nobody would ever close the connection again, should
/// another child have inherited its end.
void endWithParent(int connection) {
    ::prctl(PR_SET_PDEATHSIG, SIGTERM);
    // No signal comes from a parent that ended before.
    if (hasClientEnded(connection))
        std::raise(SIGTERM);
}

/// The listening sockets of a daemon, those that were handed over included.
class Listeners {
  public:
    Listeners(const Options& options, MainLoop& loop) {
        if (!options.socketPath.empty())
            loop.listenOn(unixSocket.emplace(options.socketPath, options.socketAccess).socket());
        if (options.httpAddress) {
            loop.listenOn(http.emplace(*options.httpAddress).descriptor());
            fmt::print("listening on {}\n", http->url());
            std::fflush(stdout);
        }
        const std::vector<int> handedOver = ServiceManager::takeListeningSockets();
        for (const int socket : handedOver)
            loop.listenOn(socket);
        if (!unixSocket && !http && handedOver.empty())
            throw std::runtime_error("nowhere to serve: give --fd, --socket or --http");
    }

  private:
    std::optional<UnixListener> unixSocket;
    std::optional<LoopbackListener> http;
};

/// The allocator would keep what the classes that are gone, or the wrong ones, once needed.
void giveFreedMemoryBack() {
#ifdef __GLIBC__
    ::malloc_trim(0);
#endif
}

/// Old classes stay when the new ones are wrong.
void reload(const SchemaLoader& loader, CurrentRepository& repository) {
    ServiceManager::notifyReloading();
    try {
        repository.replace(loader.loadAll());
        logText(LogLevel::Info, "the classes have been loaded again");
    } catch (const std::exception& error) {
        logText(LogLevel::Error, fmt::format("the old classes stay: {}", error.what()));
    }
    giveFreedMemoryBack();
    ServiceManager::notify("READY=1");
}

void runDaemon(const Options& options, MainLoop& loop, const SchemaLoader& loader,
               CurrentRepository& repository) {
    const Listeners listeners(options, loop);
    ServiceManager::notify("READY=1");
    loop.run([&] { reload(loader, repository); });
    ServiceManager::notify("STOPPING=1");
}

void runEmbedded(int descriptor, MainLoop& loop, const SchemaLoader& loader,
                 CurrentRepository& repository) {
    requireStreamSocket(descriptor);
    loop.serveOnly(descriptor);
    loop.run([&] { reload(loader, repository); });
}

/// Each thread's heap would keep what a large source once needed, and there are many threads.
void giveLargeMemoryBack() {
#ifdef __GLIBC__
    constexpr int kLargeBytes = 256 << 10;
    ::mallopt(M_MMAP_THRESHOLD, kLargeBytes);
#endif
}

HttpLimits limitsFor(const Options& options) {
    // The parent may be as slow as it likes.
    return options.connectedDescriptor ? HttpLimits{1, std::chrono::seconds(0)} : options.limits;
}

void serve(const Options& options) {
    if (options.connectedDescriptor)
        endWithParent(*options.connectedDescriptor);
    Signals signals;
    const Pegasus::CIMNamespaceName nameSpace(kNamespace);
    const SchemaLoader loader(
        {options.schemaDirectory / kSchemaFile, options.mofDirectory, nameSpace});
    CurrentRepository repository(loader.loadWhatIsRight());
    const std::unique_ptr<SystemCalls> calls = systemCallsFor(options);
    const ProviderList providers = makeProviders(SystemPaths(options.rootDirectory), *calls);
    const ProviderIndex index(providers, nameSpace);
    const Dispatcher dispatcher(repository, index);
    const CimService service(dispatcher);
    HttpServer server(service, limitsFor(options));
    MainLoop loop(server, signals);
    if (options.connectedDescriptor)
        runEmbedded(*options.connectedDescriptor, loop, loader, repository);
    else
        runDaemon(options, loop, loader, repository);
}

/// The exit status.
int check(const Options& options) {
    const Pegasus::CIMNamespaceName nameSpace(kNamespace);
    ClassRepository shipped;
    try {
        MofCompiler(shipped, nameSpace).compileFile(options.schemaDirectory / kSchemaFile);
        checkMofFiles(options.checkedFiles, shipped, nameSpace);
        return 0;
    } catch (const MofErrors& errors) {
        std::fputs(fmt::format("{}\n", errors.what()).c_str(), stderr);
        return 1;
    }
}

}  // namespace
}  // namespace cimomd

int main(int argc, char** argv) {
    if (!holdStandardStreams())
        return 1;
    const cimomd::ParsedOptions parsed = cimomd::parseOptions(argc, argv);
    if (parsed.exitStatus)
        return *parsed.exitStatus;
    try {
        std::signal(SIGPIPE, SIG_IGN);
        if (!parsed.options.checkedFiles.empty())
            return cimomd::check(parsed.options);
        cimomd::giveLargeMemoryBack();
        cimomd::serve(parsed.options);
        return 0;
    } catch (const std::exception& error) {
        cimomd::logText(cimomd::LogLevel::Error, error.what());
        return 1;
    }
}
