// Stream sockets in the file system.

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace bench {

/// Owns a descriptor. All throw std::runtime_error when the system refuses.
class LocalSocket {
  public:
    static LocalSocket connectTo(const std::string& path);
    static LocalSocket listenAt(const std::string& path);

    LocalSocket(LocalSocket&& other) noexcept;
    LocalSocket& operator=(LocalSocket&&) = delete;
    ~LocalSocket();

    LocalSocket accept() const;
    /// False when the peer has gone.
    bool send(std::string_view bytes) const;
    /// 0 at the end, also when the peer has gone.
    std::size_t receive(char* buffer, std::size_t capacity) const;

  private:
    explicit LocalSocket(int descriptor);

    int descriptor;
};

}  // namespace bench
