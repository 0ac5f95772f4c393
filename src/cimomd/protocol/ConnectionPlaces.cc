#include "protocol/ConnectionPlaces.h"

#include <algorithm>

namespace cimomd {
namespace {

constexpr std::size_t kReservedPart = 8;
constexpr std::size_t kSharePart = 2;

std::size_t reservedOf(std::size_t places) {
    return places < 2 ? 0 : std::max<std::size_t>(places / kReservedPart, 1);
}

}  // namespace

ConnectionPlaces::ConnectionPlaces(std::size_t count)
    : places(count),
      placesOfOthers(count - reservedOf(count)),
      share(std::max<std::size_t>(count / kSharePart, 1)) {}

bool ConnectionPlaces::take(const Peer& peer) {
    const std::lock_guard lock(guard);
    if (!hasFor(peer))
        return false;
    if (peer.user)
        ++ofUser[*peer.user];
    ++all;
    others += peer.isTrusted ? 0 : 1;
    return true;
}

void ConnectionPlaces::giveBack(const Peer& peer) {
    const std::lock_guard lock(guard);
    --all;
    others -= peer.isTrusted ? 0 : 1;
    if (!peer.user)
        return;
    const auto place = ofUser.find(*peer.user);
    if (place != ofUser.end() && --place->second == 0)
        ofUser.erase(place);
}

std::size_t ConnectionPlaces::taken() const {
    const std::lock_guard lock(guard);
    return all;
}

bool ConnectionPlaces::hasAny() const {
    const std::lock_guard lock(guard);
    return hasFor({true, {}});
}

bool ConnectionPlaces::hasForUnknown() const {
    const std::lock_guard lock(guard);
    return hasFor({});
}

bool ConnectionPlaces::hasFor(const Peer& peer) const {
    if (all >= places || (!peer.isTrusted && others >= placesOfOthers))
        return false;
    const auto place = peer.user ? ofUser.find(*peer.user) : ofUser.end();
    return place == ofUser.end() || place->second < share;
}

}  // namespace cimomd
