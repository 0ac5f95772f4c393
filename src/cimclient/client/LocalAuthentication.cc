#include "client/LocalAuthentication.h"

#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>

#include "client/FileDescriptor.h"
#include "client/WireText.h"

namespace Pegasus {

namespace {

constexpr std::size_t kSecretLimit = 4096;
constexpr std::string_view kScheme = "Local";

// What may stand between the double quotes of a header value.
bool isQuotable(char c) {
    return c >= 0x20 && c <= 0x7E && c != '"';
}

bool isQuotable(std::string_view text) {
    return !text.empty() &&
           std::all_of(text.begin(), text.end(), [](char c) { return isQuotable(c); });
}

std::string quoted(const std::string& text) {
    return std::string(kScheme) + " \"" + text + "\"";
}

bool mayBeSent(int descriptor, uid_t serverUser) {
    struct stat status {};
    if (::fstat(descriptor, &status) != 0) {
        return false;
    }
    // A server that runs as root hands the file over to the user who is to read it.
    const bool trustedOwner = status.st_uid == serverUser || status.st_uid == ::geteuid();
    return S_ISREG(status.st_mode) && status.st_nlink == 1 && trustedOwner &&
           status.st_size <= static_cast<off_t>(kSecretLimit);
}

// None when the file cannot be read or is longer than the limit.
std::optional<std::string> contentOf(int descriptor) {
    std::string content;
    std::array<char, kSecretLimit + 1> buffer{};
    for (;;) {
        const ssize_t count = ::read(descriptor, buffer.data(), buffer.size());
        if (count == 0) {
            return content;
        }
        if (count < 0) {
            if (errno == EINTR) {
                continue;
            }
            return std::nullopt;
        }
        content.append(buffer.data(), static_cast<std::size_t>(count));
        if (content.size() > kSecretLimit) {
            return std::nullopt;
        }
    }
}

}  // namespace

std::string effectiveUserName() {
    const uid_t user = ::geteuid();
    std::array<char, 16384> buffer{};
    passwd entry{};
    passwd* found = nullptr;
    const int error = ::getpwuid_r(user, &entry, buffer.data(), buffer.size(), &found);
    if (error == 0 && found != nullptr && isQuotable(std::string_view(found->pw_name))) {
        return found->pw_name;
    }
    return std::to_string(user);
}

std::string localAuthorization(const std::string& user) {
    return quoted(user);
}

std::string localAuthorization(const std::string& user, const std::string& file,
                               const std::string& secret) {
    return quoted(user + ":" + file + ":" + secret);
}

std::optional<std::string> challengeFile(std::string_view challenge) {
    challenge = trimmed(challenge);
    if (!equalIgnoringCase(challenge.substr(0, kScheme.size()), kScheme)) {
        return std::nullopt;
    }
    const std::string_view rest = challenge.substr(kScheme.size());
    const std::string_view text = trimmed(rest);
    const bool separated = text.size() < rest.size();
    if (!separated || text.size() < 2 || text.front() != '"' || text.back() != '"') {
        return std::nullopt;
    }
    const std::string_view file = text.substr(1, text.size() - 2);
    return isQuotable(file) ? std::optional<std::string>(file) : std::nullopt;
}

std::optional<std::string> readLocalSecret(const std::string& file,
                                           const std::vector<std::string>& directories,
                                           uid_t serverUser) {
    const std::size_t slash = file.rfind('/');
    if (slash == std::string::npos) {
        return std::nullopt;
    }
    const std::string directory = file.substr(0, slash);
    const std::string name = file.substr(slash + 1);
    if (std::find(directories.begin(), directories.end(), directory) == directories.end() ||
        name.empty() || name == "." || name == "..") {
        return std::nullopt;
    }
    // O_NONBLOCK: a FIFO put there must not hold the client up.
    const FileDescriptor descriptor(
        ::open(file.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_NOCTTY | O_CLOEXEC));
    if (!descriptor.isOpen() || !mayBeSent(descriptor.get(), serverUser)) {
        return std::nullopt;
    }
    std::optional<std::string> secret = contentOf(descriptor.get());
    if (secret.has_value()) {
        std::erase_if(*secret, [](char c) { return c == '\n' || c == '\r'; });
    }
    return secret.has_value() && isQuotable(*secret) ? secret : std::nullopt;
}

}  // namespace Pegasus
