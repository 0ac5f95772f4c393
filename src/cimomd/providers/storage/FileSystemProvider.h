#pragma once

// What providers of mounted file systems have in common: each serves those of one kind.

#include "providers/Provider.h"
#include "providers/storage/FileSystemProperties.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"

namespace cimomd {

class FileSystemProvider : public Provider {
  public:
    std::unique_ptr<InstanceStream> enumerate() const override {
        return streamFileSystems(paths, calls, kind, publisher);
    }

  protected:
    /// `systemCalls` must outlive the provider and its streams.
    FileSystemProvider(SystemPaths systemPaths, const SystemCalls& systemCalls,
                       FileSystemKind servedKind, PublishFileSystem publishOne)
        : paths(std::move(systemPaths)),
          calls(systemCalls),
          kind(servedKind),
          publisher(publishOne) {}

  private:
    SystemPaths paths;
    const SystemCalls& calls;
    FileSystemKind kind;
    PublishFileSystem publisher;
};

}  // namespace cimomd
