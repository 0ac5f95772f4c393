// The hidden names of temporary files, and the removal of those whose writer was killed.
//
// A writer holds a lock (flock) on its temporary file as long as this may bear such a name. So a
// file of such a name that nobody has locked is abandoned.
#pragma once

#include <string>
#include <string_view>

namespace Velm {

// A name that is most likely free; empty, with errno set, when the system has no random numbers.
std::string randomTemporaryName();

// Whether randomTemporaryName may have made this name.
bool isTemporaryName(std::string_view name);

// Locks a file that was just made. False only when somebody who takes it for abandoned was faster;
// where the file system has no locks nobody can be.
bool lockTemporaryFile(int descriptor);

// Removes this user's abandoned temporary files from a directory, as far as that can be done and
// among its first 4,096 entries; never waits, follows no link and touches nothing of another name
// or kind. `directory` may be opened with O_PATH.
void removeAbandonedFiles(int directory);

}  // namespace Velm
