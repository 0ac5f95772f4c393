#include "protocol/LoopbackAddress.h"

#include <arpa/inet.h>
#include <gtest/gtest.h>

#include <cstring>

namespace cimomd {
namespace {

TEST(LoopbackAddress, readsAddressesOfThisMachine) {
    const auto address = LoopbackAddress::parse("127.0.0.1:5988");
    ASSERT_TRUE(address);
    sockaddr_in ipv4{};
    std::memcpy(&ipv4, &address->address, sizeof ipv4);
    EXPECT_EQ(ipv4.sin_family, AF_INET);
    EXPECT_EQ(ntohl(ipv4.sin_addr.s_addr), 0x7F000001U);
    EXPECT_EQ(ntohs(ipv4.sin_port), 5988);
    for (const char* text : {"localhost:0", "LocalHost:65535", "127.1.2.3:1", "[::1]:5988"}) {
        const auto other = LoopbackAddress::parse(text);
        ASSERT_TRUE(other) << text;
        EXPECT_TRUE(LoopbackAddress::holds(other->address)) << text;
    }
}

TEST(LoopbackAddress, refusesAllOthers) {
    for (const char* text : {"", "127.0.0.1", "127.0.0.1:", "127.0.0.1:65536", "127.0.0.1:-1",
                             "127.0.0.1:1x", "0.0.0.0:1", "128.0.0.1:1", "127.1:1", "[::]:1",
                             "::1:1", "[::1]", "localhost", "example.org:1", ":1"})
        EXPECT_FALSE(LoopbackAddress::parse(text)) << text;
}

TEST(LoopbackAddress, knowsSocketsThatOthersReach) {
    sockaddr_storage any{};
    any.ss_family = AF_INET;
    EXPECT_FALSE(LoopbackAddress::holds(any));
    any.ss_family = AF_INET6;
    EXPECT_FALSE(LoopbackAddress::holds(any));
}

}  // namespace
}  // namespace cimomd
