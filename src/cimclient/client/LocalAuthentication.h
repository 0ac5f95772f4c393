// Local authentication: a server proves nothing but that it can write a file that only the client's
// user can read, and the client proves its user by sending that file's text back.

#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace Pegasus {

/// The name of the effective user, or its number when it has none that fits into a header.
std::string effectiveUserName();

/// The value of PegasusAuthorization in the first request: Local "user".
std::string localAuthorization(const std::string& user);

/// The value that answers a challenge: Local "user:file:secret".
std::string localAuthorization(const std::string& user, const std::string& file,
                               const std::string& secret);

/// The file that the value of a WWW-Authenticate header names: PATH of Local "PATH". None when it
/// is of another scheme or malformed.
std::optional<std::string> challengeFile(std::string_view challenge);

/// The text of a secret file with its lines joined. None when the client must not read or send it:
/// the file has to lie directly in one of the directories, named exactly so, be a regular file of
/// one name only, of the server's or the effective user, of at most 4 KiB, and hold at least one
/// character and nothing but printable ASCII without double quotes.
std::optional<std::string> readLocalSecret(const std::string& file,
                                           const std::vector<std::string>& directories,
                                           uid_t serverUser);

}  // namespace Pegasus
