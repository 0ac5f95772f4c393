#include "system/network/ResolverSettings.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

using Texts = std::vector<std::string>;

TEST(ResolverSettings, readsServersAndDomains) {
    const auto settings = parseResolverSettings(
        "# nameserver 192.0.2.99\n"
        "; search not.example\n"
        "nameserver 192.0.2.53\n"
        "nameserver\t2001:db8::53   # behind a blank\n"
        "nameserver fe80::1%eth0\n"
        "search corp.example lab.example\n"
        "options ndots:2\n");
    EXPECT_EQ(settings.servers, (Texts{"192.0.2.53", "2001:db8::53", "fe80::1%eth0"}));
    EXPECT_EQ(settings.domain, "corp.example");
    EXPECT_EQ(settings.searchDomains, (Texts{"corp.example", "lab.example"}));
}

TEST(ResolverSettings, takesTheLastOfDomainAndSearch) {
    EXPECT_EQ(parseResolverSettings("search a.example b.example\ndomain c.example\n").searchDomains,
              Texts{"c.example"});
    EXPECT_EQ(parseResolverSettings("domain c.example\nsearch a.example b.example\n").domain,
              "a.example");
    EXPECT_EQ(parseResolverSettings("search .\n").domain, std::nullopt);
    EXPECT_EQ(parseResolverSettings("search .\n").searchDomains, std::nullopt);
}

TEST(ResolverSettings, dropsServersThatAreNoAddresses) {
    const auto settings = parseResolverSettings(
        "nameserver\nnameserver ns.example\nnameserver 192.0.2.1%eth0\n nameserver 192.0.2.2\n"
        "nameserver 2001:db8::1%eth0\nNAMESERVER 192.0.2.3\n");
    EXPECT_EQ(settings.servers, std::nullopt);
    EXPECT_EQ(settings.servers.reason(), Absence::Absent);
}

TEST(ResolverSettings, filtersTheStub) {
    EXPECT_EQ(parseResolverSettings("nameserver 127.0.0.53\n").servers.reason(), Absence::Filtered);
    EXPECT_EQ(parseResolverSettings("nameserver 127.0.0.54\nnameserver 192.0.2.1\r\n").servers,
              Texts{"192.0.2.1"});
    EXPECT_EQ(parseResolverSettings("nameserver 127.0.0.1\n").servers, Texts{"127.0.0.1"});
}

TEST(ResolverSettings, looksBehindTheStub) {
    RecordedTree tree;
    EXPECT_EQ(readResolverSettings(tree.paths()).reason(), Absence::Absent);
    tree.file("etc/resolv.conf", "nameserver 127.0.0.53\nsearch a.example\n");
    EXPECT_EQ(readResolverSettings(tree.paths())->servers.reason(), Absence::Filtered);
    tree.file("run/systemd/resolve/resolv.conf", "# none yet\n");
    EXPECT_EQ(readResolverSettings(tree.paths())->servers.reason(), Absence::Filtered);
    tree.file("run/systemd/resolve/resolv.conf", "nameserver 192.0.2.1\nsearch b.example\n");
    EXPECT_EQ(readResolverSettings(tree.paths())->servers, Texts{"192.0.2.1"});
    EXPECT_EQ(readResolverSettings(tree.paths())->domain, "a.example");
}

}  // namespace
}  // namespace cimomd
