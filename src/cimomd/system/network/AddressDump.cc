#include "system/network/AddressDump.h"

#include <libmnl/libmnl.h>
#include <linux/rtnetlink.h>
#include <net/if.h>
#include <sys/socket.h>
#include <sys/time.h>

#include <array>
#include <cerrno>
#include <limits>
#include <map>
#include <memory>

namespace cimomd {
namespace {

constexpr std::size_t kMaxAddresses = 100000;
constexpr time_t kAnswerSeconds = 2;
constexpr int kMaxAttempts = 3;

// The dump's sequence number; the socket serves this one only.
constexpr unsigned kSequence = 1;

struct CloseSocket {
    void operator()(mnl_socket* socket) const { mnl_socket_close(socket); }
};
using Socket = std::unique_ptr<mnl_socket, CloseSocket>;

using Attributes = std::array<const nlattr*, IFA_MAX + 1>;

class AddressCollector {
  public:
    std::vector<InterfaceAddress> addresses;

    /// For mnl_cb_run; `self` is a collector.
    static int take(const nlmsghdr* message, void* self) {
        static_cast<AddressCollector*>(self)->take(*message);
        return MNL_CB_OK;
    }

  private:
    void take(const nlmsghdr& message) {
        if (message.nlmsg_type != RTM_NEWADDR || addresses.size() == kMaxAddresses ||
            mnl_nlmsg_get_payload_len(&message) < sizeof(ifaddrmsg))
            return;
        const auto& head = *static_cast<const ifaddrmsg*>(mnl_nlmsg_get_payload(&message));
        Attributes attributes{};
        mnl_attr_parse(&message, sizeof head, &AddressCollector::keep, &attributes);
        const auto address = ipAddress(attributes[IFA_ADDRESS]);
        const auto local = ipAddress(attributes[IFA_LOCAL]);
        const std::string& name = interfaceName(head.ifa_index);
        // IPv6 has the local address in IFA_ADDRESS unless there is a peer.
        if ((!address && !local) || name.empty())
            return;
        InterfaceAddress out{name, local ? *local : *address, {}, head.ifa_prefixlen, 0, {}, 0};
        if (local && address && *local != *address)
            out.peer = address;
        out.flags = flagsOf(head, attributes);
        out.validSeconds = validSeconds(attributes[IFA_CACHEINFO]);
        out.origin = originOf(attributes[IFA_PROTO]);
        addresses.push_back(std::move(out));
    }

    static int keep(const nlattr* attribute, void* attributes) {
        const std::uint16_t type = mnl_attr_get_type(attribute);
        if (mnl_attr_type_valid(attribute, IFA_MAX) > 0)
            (*static_cast<Attributes*>(attributes))[type] = attribute;
        return MNL_CB_OK;
    }

    static std::optional<IpAddress> ipAddress(const nlattr* attribute) {
        if (attribute == nullptr)
            return std::nullopt;
        return IpAddress::fromBytes({static_cast<const char*>(mnl_attr_get_payload(attribute)),
                                     mnl_attr_get_payload_len(attribute)});
    }

    static std::uint32_t flagsOf(const ifaddrmsg& head, const Attributes& attributes) {
        const nlattr* wide = attributes[IFA_FLAGS];
        if (wide == nullptr || mnl_attr_get_payload_len(wide) < sizeof(std::uint32_t))
            return head.ifa_flags;
        return mnl_attr_get_u32(wide);
    }

    static std::optional<std::uint32_t> validSeconds(const nlattr* attribute) {
        if (attribute == nullptr || mnl_attr_get_payload_len(attribute) < sizeof(ifa_cacheinfo))
            return std::nullopt;
        const auto& times = *static_cast<const ifa_cacheinfo*>(mnl_attr_get_payload(attribute));
        if (times.ifa_valid == std::numeric_limits<std::uint32_t>::max())
            return std::nullopt;
        return times.ifa_valid;
    }

    /// Kernels before 5.18 do not send it.
    static std::uint8_t originOf(const nlattr* attribute) {
        if (attribute == nullptr || mnl_attr_get_payload_len(attribute) < sizeof(std::uint8_t))
            return IFAPROT_UNSPEC;
        return mnl_attr_get_u8(attribute);
    }

    const std::string& interfaceName(unsigned index) {
        const auto [place, isNew] = names.try_emplace(index);
        std::array<char, IF_NAMESIZE> buffer{};
        if (isNew && ::if_indextoname(index, buffer.data()) != nullptr)
            place->second = buffer.data();
        return place->second;
    }

    std::map<unsigned, std::string> names;
};

Socket openSocket() {
    Socket socket(mnl_socket_open2(NETLINK_ROUTE, SOCK_CLOEXEC));
    if (socket == nullptr || mnl_socket_bind(socket.get(), 0, MNL_SOCKET_AUTOPID) != 0)
        return nullptr;
    const timeval patience{kAnswerSeconds, 0};
    ::setsockopt(mnl_socket_get_fd(socket.get()), SOL_SOCKET, SO_RCVTIMEO, &patience,
                 sizeof patience);
    return socket;
}

bool sendRequest(const mnl_socket* socket) {
    alignas(nlmsghdr) std::array<char, 128> buffer{};
    nlmsghdr* message = mnl_nlmsg_put_header(buffer.data());
    message->nlmsg_type = RTM_GETADDR;
    message->nlmsg_flags = NLM_F_REQUEST | NLM_F_DUMP;
    message->nlmsg_seq = kSequence;
    auto* head = static_cast<ifaddrmsg*>(mnl_nlmsg_put_extra_header(message, sizeof(ifaddrmsg)));
    head->ifa_family = AF_UNSPEC;
    return mnl_socket_sendto(socket, message, message->nlmsg_len) >= 0;
}

/// The errno value that ended the dump, 0 for its proper end.
int receiveAnswer(const mnl_socket* socket, AddressCollector& collector) {
    std::vector<char> buffer(std::size_t{32} << 10);
    const unsigned port = mnl_socket_get_portid(socket);
    while (true) {
        const ssize_t length = mnl_socket_recvfrom(socket, buffer.data(), buffer.size());
        if (length <= 0)
            return length == 0 ? EIO : errno;
        const int status = mnl_cb_run(buffer.data(), static_cast<std::size_t>(length), kSequence,
                                      port, &AddressCollector::take, &collector);
        if (status <= MNL_CB_STOP)
            return status == MNL_CB_STOP ? 0 : errno;
    }
}

}  // namespace

Fact<std::vector<InterfaceAddress>> dumpAddresses() {
    // Addresses that change during the dump break it off with EINTR.
    int error = EINTR;
    for (int attempt = 0; attempt < kMaxAttempts && error == EINTR; ++attempt) {
        const Socket socket = openSocket();
        if (socket == nullptr || !sendRequest(socket.get()))
            return Absence::Unreadable;
        AddressCollector collector;
        error = receiveAnswer(socket.get(), collector);
        if (error == 0)
            return std::move(collector.addresses);
    }
    return error == EAGAIN ? Absence::TimedOut : Absence::Unreadable;
}

}  // namespace cimomd
