#pragma once

// The room for connections, and who may have how much of it: no user has it all, and root finds a
// place whatever the others do.

#include <sys/types.h>

#include <cstddef>
#include <map>
#include <mutex>

#include "protocol/Peer.h"

namespace cimomd {

/// May be used from several threads at once. An eighth of the places, of two or more at least one,
/// is kept for trusted peers; any other user gets half of all places at most.
class ConnectionPlaces {
  public:
    explicit ConnectionPlaces(std::size_t count);

    /// Takes a place; false, and nothing is taken, when there is none for this peer.
    bool take(const Peer& peer);
    void giveBack(const Peer& peer);

    std::size_t taken() const;
    /// Whether a trusted peer would get a place.
    bool hasAny() const;
    /// Whether a peer whose user is not known would get one.
    bool hasForUnknown() const;

  private:
    bool hasFor(const Peer& peer) const;

    const std::size_t places;
    const std::size_t placesOfOthers;
    const std::size_t share;
    mutable std::mutex guard;
    std::size_t all = 0;
    std::size_t others = 0;
    std::map<uid_t, std::size_t> ofUser;
};

}  // namespace cimomd
