#pragma once

// What a service manager such as systemd and a daemon say to each other: sockets handed over at
// the start (LISTEN_FDS) and messages about the state (NOTIFY_SOCKET). Both protocols are a few
// lines, a library for them would cost more at each start.

#include <string_view>
#include <vector>

namespace cimomd {

class ServiceManager {
  public:
    /// The listening sockets handed to this process, empty without any; they are not inherited
    /// further. Ask once. Raises std::runtime_error when one of them is no listening stream socket
    /// or can be reached from other machines.
    static std::vector<int> takeListeningSockets();

    /// Tells the state, for example "READY=1". Does nothing when nobody wants to know.
    static void notify(std::string_view state);
    /// That a reload begins; notify "READY=1" when it is over.
    static void notifyReloading();
};

}  // namespace cimomd
