#pragma once

// What the kernel's names of file systems stand for.

#include <string_view>

namespace cimomd {

enum class FileSystemKind {
    /// On devices, or in the memory, of this machine.
    Local,
    /// On a server, over NFS.
    Nfs,
    /// On a server, over something else; also on the host of a virtual machine.
    Remote,
    /// The kernel's own, layers over others, images of software, and what a program makes up.
    Other
};

FileSystemKind fileSystemKindOf(std::string_view type);

/// Whether the kernel looks into it without waiting for a server or a program.
bool answersAtOnce(std::string_view type);

/// Whether its content is gone after a restart.
bool isTemporary(std::string_view type);

}  // namespace cimomd
