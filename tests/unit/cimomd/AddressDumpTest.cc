// The addresses of the machine that runs the tests, against what the C library says.

#include "system/network/AddressDump.h"

#include <gtest/gtest.h>
#include <ifaddrs.h>
#include <netinet/in.h>

#include <memory>
#include <set>

namespace cimomd {
namespace {

using NamedAddresses = std::multiset<std::string>;

std::optional<IpAddress> ipAddressOf(const sockaddr* address) {
    if (address != nullptr && address->sa_family == AF_INET) {
        const auto* v4 = reinterpret_cast<const sockaddr_in*>(address);
        return IpAddress::fromBytes({reinterpret_cast<const char*>(&v4->sin_addr), 4});
    }
    if (address != nullptr && address->sa_family == AF_INET6) {
        const auto* v6 = reinterpret_cast<const sockaddr_in6*>(address);
        return IpAddress::fromBytes({reinterpret_cast<const char*>(&v6->sin6_addr), 16});
    }
    return std::nullopt;
}

NamedAddresses addressesOfTheLibrary() {
    ifaddrs* first = nullptr;
    EXPECT_EQ(::getifaddrs(&first), 0);
    const std::unique_ptr<ifaddrs, decltype(&::freeifaddrs)> list(first, &::freeifaddrs);
    NamedAddresses out;
    for (const ifaddrs* entry = first; entry != nullptr; entry = entry->ifa_next) {
        // IPv4 entries carry a label, which is the interface's name with a suffix at most.
        const std::string label = entry->ifa_name;
        if (const auto address = ipAddressOf(entry->ifa_addr))
            out.insert(label.substr(0, label.find(':')) + " " + address->text());
    }
    return out;
}

TEST(AddressDump, findsWhatTheLibraryFinds) {
    const auto dumped = dumpAddresses();
    ASSERT_TRUE(dumped.has_value());
    NamedAddresses found;
    for (const InterfaceAddress& address : *dumped) {
        EXPECT_LE(address.prefixLength, address.local.bits());
        found.insert(address.interfaceName + " " + address.local.text());
    }
    EXPECT_EQ(found, addressesOfTheLibrary());
}

}  // namespace
}  // namespace cimomd
