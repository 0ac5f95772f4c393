#include "providers/storage/RemoteFileSystemProvider.h"

#include "providers/storage/FileSystemProperties.h"
#include "system/storage/ServerName.h"

namespace cimomd {

ProvidedInstance RemoteFileSystemProvider::publish(const std::string& hostName, const Mount& mount,
                                                   const Fact<FileSystemSize>& size) {
    InstanceBuilder builder(kClassName);
    addFileSystemProperties(builder, kClassName, hostName, mount, size);
    builder.text("ServerName", serverNameOf(mount));
    return builder.take();
}

}  // namespace cimomd
