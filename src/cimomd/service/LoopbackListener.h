#pragma once

// A listening TCP socket on the loopback.

#include <string>

#include "protocol/LoopbackAddress.h"

namespace cimomd {

class LoopbackListener {
  public:
    /// Raises std::runtime_error when the address is taken or may not be used.
    explicit LoopbackListener(const LoopbackAddress& address);
    ~LoopbackListener();
    LoopbackListener(const LoopbackListener&) = delete;
    LoopbackListener& operator=(const LoopbackListener&) = delete;

    int descriptor() const { return socket; }

    /// Where clients find it, for example "http://127.0.0.1:5988", with the port that was chosen.
    std::string url() const;

  private:
    int socket = -1;
};

}  // namespace cimomd
