#include "providers/storage/NFSProvider.h"

#include "providers/storage/FileSystemProperties.h"
#include "system/storage/NfsOptions.h"
#include "system/storage/ServerName.h"

namespace cimomd {
namespace {

using Pegasus::Boolean;
using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

void addOptions(InstanceBuilder& builder, const NfsOptions& options) {
    builder.value<Boolean>("HardMount", options.isHard)
        .value<Uint16>("RetransmissionAttempts", options.retransmissions)
        .value<Uint32>("RetransmissionTimeout", options.timeoutTenths)
        .value<Uint64>("ReadBufferSize", options.readBytes)
        .value<Uint64>("WriteBufferSize", options.writeBytes)
        .value<Uint32>("ServerCommunicationPort", options.port)
        .value<Boolean>("AttributeCaching", options.cachesAttributes)
        .value<Uint16>("AttributeCachingForRegularFilesMin", options.fileCacheMinSeconds)
        .value<Uint16>("AttributeCachingForRegularFilesMax", options.fileCacheMaxSeconds)
        .value<Uint16>("AttributeCachingForDirectoriesMin", options.directoryCacheMinSeconds)
        .value<Uint16>("AttributeCachingForDirectoriesMax", options.directoryCacheMaxSeconds)
        .text("NFSVersion", options.version)
        .text("TransportProtocol", options.protocol);
}

}  // namespace

ProvidedInstance NFSProvider::publish(const std::string& hostName, const Mount& mount,
                                      const Fact<FileSystemSize>& size) {
    InstanceBuilder builder(kClassName);
    addFileSystemProperties(builder, kClassName, hostName, mount, size);
    addOptions(builder, nfsOptionsOf(mount.fileSystemOptions));
    builder.text("ServerName", serverNameOf(mount));
    return builder.take();
}

}  // namespace cimomd
