#pragma once

// How many connections at Unix sockets each user has, so that no user has them all.

#include <sys/types.h>

#include <cstddef>
#include <map>
#include <mutex>
#include <optional>

namespace cimomd {

/// May be used from several threads at once. Root, the server's own user and the network have no
/// share of their own.
class UserShares {
  public:
    explicit UserShares(std::size_t connectionsPerUser) : share(connectionsPerUser) {}

    /// The user at the other end, when a share is all it may have.
    static std::optional<uid_t> limitedUser(int connectedSocket);

    /// Counts a connection; false, and nothing is counted, when the user has a whole share.
    bool take(std::optional<uid_t> user);
    void giveBack(std::optional<uid_t> user);

  private:
    const std::size_t share;
    std::mutex guard;
    std::map<uid_t, std::size_t> connections;
};

}  // namespace cimomd
