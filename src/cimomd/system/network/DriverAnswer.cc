#include "system/network/DriverAnswer.h"

#include <linux/ethtool.h>
#include <linux/sockios.h>
#include <net/if.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

namespace cimomd {
namespace {

class ControlSocket {
  public:
    explicit ControlSocket(const char* interfaceName)
        : descriptor(::socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0)), name(interfaceName) {}
    ~ControlSocket() {
        if (descriptor >= 0)
            ::close(descriptor);
    }
    ControlSocket(const ControlSocket&) = delete;
    ControlSocket& operator=(const ControlSocket&) = delete;

    /// `question` is one of ethtool's structures and takes the answer; the errno value, 0 for none.
    int ask(void* question) const {
        ifreq request{};
        const std::size_t length = ::strnlen(name, sizeof request.ifr_name);
        if (length == sizeof request.ifr_name)
            return ENODEV;
        std::memcpy(request.ifr_name, name, length);
        request.ifr_data = static_cast<char*>(question);
        return ::ioctl(descriptor, SIOCETHTOOL, &request) == 0 ? 0 : errno;
    }

  private:
    int descriptor;
    const char* name;
};

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

void askAddress(const ControlSocket& socket, DriverAnswer& answer) {
    Question<ethtool_perm_addr, DriverAnswer::kMaxAddressBytes> question;
    question.head().cmd = ETHTOOL_GPERMADDR;
    question.head().size = DriverAnswer::kMaxAddressBytes;
    answer.addressError = socket.ask(question.data());
    if (answer.addressError == 0 && question.head().size > answer.address.size())
        answer.addressError = EIO;
    if (answer.addressError != 0)
        return;
    answer.addressBytes = question.head().size;
    std::memcpy(answer.address.data(), question.tail(), answer.addressBytes);
}

void askPort(const ControlSocket& socket, DriverAnswer& answer) {
    // Three bit masks of link modes, whose length in words is a signed byte.
    constexpr std::size_t kMaxMaskBytes = std::size_t{3} * INT8_MAX * sizeof(std::uint32_t);
    Question<ethtool_link_settings, kMaxMaskBytes> question;
    question.head().cmd = ETHTOOL_GLINKSETTINGS;
    answer.portError = socket.ask(question.data());
    if (answer.portError != 0)
        return;
    // The first answer carries nothing but the number of words that a mask takes, negated.
    const int words = -question.head().link_mode_masks_nwords;
    if (words <= 0 || words > INT8_MAX) {
        answer.portError = EIO;
        return;
    }
    question.head().cmd = ETHTOOL_GLINKSETTINGS;
    question.head().link_mode_masks_nwords = static_cast<std::int8_t>(words);
    answer.portError = socket.ask(question.data());
    answer.port = question.head().port;
}

Absence absenceOf(int error) {
    if (error == EIO)
        return Absence::Unreadable;
    return error == EPERM || error == EACCES ? Absence::NeedsRoot : Absence::Absent;
}

}  // namespace

void askDriver(const char* interfaceName, DriverAnswer& answer) {
    const ControlSocket socket(interfaceName);
    askAddress(socket, answer);
    askPort(socket, answer);
}

LinkSettings linkSettingsOf(const DriverAnswer& answer) {
    LinkSettings settings;
    if (answer.addressError != 0)
        settings.permanentAddress = absenceOf(answer.addressError);
    else
        settings.permanentAddress =
            hardwareAddressText({answer.address.data(), answer.addressBytes});
    if (answer.portError != 0)
        settings.connector = absenceOf(answer.portError);
    else
        settings.connector = connectorOf(answer.port);
    return settings;
}

}  // namespace cimomd
