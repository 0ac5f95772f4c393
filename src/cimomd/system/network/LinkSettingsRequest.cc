#include <linux/ethtool.h>
#include <linux/sockios.h>
#include <net/if.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstring>

#include "system/network/LinkSettings.h"

namespace cimomd {
namespace {

class ControlSocket {
  public:
    ControlSocket() : descriptor(::socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0)) {}
    ~ControlSocket() {
        if (descriptor >= 0)
            ::close(descriptor);
    }
    ControlSocket(const ControlSocket&) = delete;
    ControlSocket& operator=(const ControlSocket&) = delete;

    /// `question` is one of ethtool's structures and takes the answer; the errno value, 0 for none.
    int ask(const std::string& interfaceName, void* question) const {
        ifreq request{};
        if (interfaceName.size() >= sizeof request.ifr_name)
            return ENODEV;
        std::memcpy(request.ifr_name, interfaceName.data(), interfaceName.size());
        request.ifr_data = static_cast<char*>(question);
        return ::ioctl(descriptor, SIOCETHTOOL, &request) == 0 ? 0 : errno;
    }

  private:
    int descriptor;
};

Absence absenceOf(int error) {
    return error == EPERM || error == EACCES ? Absence::NeedsRoot : Absence::Absent;
}

/// One of ethtool's structures with room for what the kernel writes behind it.
template <typename Head, std::size_t tailBytes>
class Question {
  public:
    Head& head() { return *reinterpret_cast<Head*>(bytes.data()); }
    const char* tail() const { return reinterpret_cast<const char*>(bytes.data()) + sizeof(Head); }
    void* data() { return bytes.data(); }

  private:
    alignas(Head) std::array<unsigned char, sizeof(Head) + tailBytes> bytes{};
};

Fact<std::string> permanentAddress(const ControlSocket& socket, const std::string& interfaceName) {
    constexpr std::size_t kMaxAddressBytes = 32;
    Question<ethtool_perm_addr, kMaxAddressBytes> question;
    question.head().cmd = ETHTOOL_GPERMADDR;
    question.head().size = kMaxAddressBytes;
    if (const int error = socket.ask(interfaceName, question.data()))
        return absenceOf(error);
    if (question.head().size > kMaxAddressBytes)
        return Absence::Unreadable;
    return hardwareAddressText({question.tail(), question.head().size});
}

Fact<PortConnector> connector(const ControlSocket& socket, const std::string& interfaceName) {
    // Three bit masks of link modes, whose length in words is a signed byte.
    constexpr std::size_t kMaxMaskBytes = std::size_t{3} * INT8_MAX * sizeof(std::uint32_t);
    Question<ethtool_link_settings, kMaxMaskBytes> question;
    question.head().cmd = ETHTOOL_GLINKSETTINGS;
    if (const int error = socket.ask(interfaceName, question.data()))
        return absenceOf(error);
    // The first answer carries nothing but the number of words that a mask takes, negated.
    const int words = -question.head().link_mode_masks_nwords;
    if (words <= 0 || words > INT8_MAX)
        return Absence::Unreadable;
    question.head().cmd = ETHTOOL_GLINKSETTINGS;
    question.head().link_mode_masks_nwords = static_cast<std::int8_t>(words);
    if (const int error = socket.ask(interfaceName, question.data()))
        return absenceOf(error);
    return connectorOf(question.head().port);
}

}  // namespace

LinkSettings askLinkSettings(const std::string& interfaceName) {
    const ControlSocket socket;
    return {permanentAddress(socket, interfaceName), connector(socket, interfaceName)};
}

}  // namespace cimomd
