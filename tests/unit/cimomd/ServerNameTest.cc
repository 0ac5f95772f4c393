#include "system/storage/ServerName.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

std::string serverIn(const std::string& source) {
    Mount mount;
    mount.source = source;
    return serverNameOf(mount).value_or("nothing");
}

TEST(ServerName, standsInTheSource) {
    EXPECT_EQ(serverIn("nas.example.org:/export/home"), "nas.example.org");
    EXPECT_EQ(serverIn("192.0.2.1:/"), "192.0.2.1");
    EXPECT_EQ(serverIn("[2001:db8::1]:/export"), "2001:db8::1");
    EXPECT_EQ(serverIn("2001:db8::1:/export"), "2001:db8::1");
    EXPECT_EQ(serverIn("//files/public"), "files");
    EXPECT_EQ(serverIn("//files"), "files");
    EXPECT_EQ(serverIn("mia@shell.example.org:"), "shell.example.org");
    EXPECT_EQ(serverIn("mia@shell.example.org:docs"), "shell.example.org");
    EXPECT_EQ(serverIn("nas:/home/a@b"), "nas");
}

TEST(ServerName, isNotGuessed) {
    for (const char* source : {"", "hostshare", "/dev/sdb1", ":", ":/x", "//", "///x", "[", "[]:/x",
                               "[2001:db8::1]", "@", "/srv:/x", "@:"})
        EXPECT_EQ(serverIn(source), "nothing") << source;
}

}  // namespace
}  // namespace cimomd
