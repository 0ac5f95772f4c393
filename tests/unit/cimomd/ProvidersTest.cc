// Every provider on recorded machines: an ordinary one, an odd one, and one that gives nothing.

#include <gtest/gtest.h>

#include <algorithm>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"
#include "providers/ProviderList.h"

namespace cimomd {
namespace {

class ProvidersTest : public testing::Test {
  protected:
    ProvidersTest() { tree.file("proc/sys/kernel/hostname", "node7\n"); }

    RecordedTree tree;
    FixedSystemCalls calls;
};

TEST_F(ProvidersTest, serveWhatTheSchemaDeclares) {
    tree.file("proc/cpuinfo", "processor: 0\n")
        .file("proc/self/mountinfo",
              "1 0 8:1 / / rw - ext4 /dev/sda1 rw\n"
              "2 1 0:41 / /home rw - nfs4 nas:/home rw\n"
              "3 1 0:42 / /win rw - cifs //files/win rw\n")
        .directory("sys/block/sda")
        .directory("sys/block/sr0")
        .directory("sys/block/dm-0/dm")
        .file("sys/class/block/sda1/partition", "1\n")
        .file("sys/class/net/eth0/type", "1\n")
        .directory("sys/class/net/eth0/device");
    tree.file("proc/1/stat", "1 (init) S 0 1 1 0 -1 4194560 1 2 3 4 5 6 7 8 20 0 1 0 100 0 0")
        .file("etc/passwd", "root:x:0:0:root:/root:/bin/bash\n")
        .file("etc/group", "root:x:0:\n");
    for (const auto& provider : makeProviders(tree.paths(), calls)) {
        // Hardware that this machine lacks has tests of its own.
        if (!all(provider->enumerate()).empty())
            expectServesItsClass(*provider);
    }
}

}  // namespace
}  // namespace cimomd
