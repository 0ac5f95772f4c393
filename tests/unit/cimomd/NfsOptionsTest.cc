#include "system/storage/NfsOptions.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

TEST(NfsOptions, ofAnOrdinaryMount) {
    const NfsOptions options = nfsOptionsOf(MountOptions(
        "rw,vers=4.2,rsize=1048576,wsize=524288,namlen=255,hard,proto=tcp,timeo=600,retrans=2,"
        "sec=sys,clientaddr=192.0.2.7,local_lock=none,addr=192.0.2.1"));
    EXPECT_EQ(options.version, std::string("4.2"));
    EXPECT_EQ(options.protocol, std::string("tcp"));
    EXPECT_EQ(options.isHard, true);
    EXPECT_EQ(options.retransmissions, 2);
    EXPECT_EQ(options.timeoutTenths, 600U);
    EXPECT_EQ(options.readBytes, 1048576U);
    EXPECT_EQ(options.writeBytes, 524288U);
    EXPECT_TRUE(options.cachesAttributes);
    EXPECT_EQ(options.port, std::nullopt);
    EXPECT_EQ(options.fileCacheMinSeconds, std::nullopt);
}

TEST(NfsOptions, ofAnUnusualMount) {
    const NfsOptions options = nfsOptionsOf(
        MountOptions("ro,soft,noac,port=20049,acregmin=1,acregmax=2,acdirmin=3,acdirmax=4"));
    EXPECT_EQ(options.isHard, false);
    EXPECT_FALSE(options.cachesAttributes);
    EXPECT_EQ(options.port, 20049U);
    EXPECT_EQ(options.fileCacheMinSeconds, 1);
    EXPECT_EQ(options.fileCacheMaxSeconds, 2);
    EXPECT_EQ(options.directoryCacheMinSeconds, 3);
    EXPECT_EQ(options.directoryCacheMaxSeconds, 4);
    EXPECT_EQ(nfsOptionsOf(MountOptions("softerr")).isHard, false);
}

TEST(NfsOptions, ofNonsense) {
    const NfsOptions options =
        nfsOptionsOf(MountOptions("retrans=65536,timeo=-1,rsize=,vers=,acregmin=x"));
    EXPECT_EQ(options.isHard, std::nullopt);
    EXPECT_EQ(options.retransmissions, std::nullopt);
    EXPECT_EQ(options.retransmissions.reason(), Absence::Filtered);
    EXPECT_EQ(options.timeoutTenths, std::nullopt);
    EXPECT_EQ(options.readBytes, std::nullopt);
    EXPECT_EQ(options.readBytes.reason(), Absence::Absent);
    EXPECT_EQ(options.version, std::nullopt);
    EXPECT_EQ(options.fileCacheMinSeconds, std::nullopt);
}

}  // namespace
}  // namespace cimomd
