#include "system/storage/UdevRecord.h"

#include <gtest/gtest.h>

#include "RecordedTree.h"

namespace cimomd {
namespace {

TEST(UdevRecord, readsTheLinesOfProperties) {
    const UdevRecord record(
        "S:disk/by-id/ata-X\nI:2141\nE:ID_SERIAL_SHORT=S3Z8NB0K\nE:EMPTY=\nE:nonsense\nE:A=b=c\n");
    EXPECT_EQ(record.property("ID_SERIAL_SHORT"), std::string("S3Z8NB0K"));
    EXPECT_EQ(record.property("A"), std::string("b=c"));
    EXPECT_FALSE(record.property("EMPTY"));
    EXPECT_FALSE(record.property("nonsense"));
    EXPECT_FALSE(record.property("disk/by-id/ata-X"));
}

TEST(UdevRecord, prefersTheExactText) {
    const UdevRecord exact("E:ID_MODEL=A_b_C\nE:ID_MODEL_ENC=A\\x20b_C\\x20\\x20\\x20\n");
    EXPECT_EQ(exact.text("ID_MODEL"), std::string("A b_C"));
    EXPECT_EQ(UdevRecord("E:ID_MODEL=A_b_C\n").text("ID_MODEL"), std::string("A b C"));
    EXPECT_FALSE(UdevRecord("").text("ID_MODEL"));
}

TEST(UdevRecord, keepsWhatIsNoEscape) {
    EXPECT_EQ(UdevRecord("E:M_ENC=a\\x2\n").text("M"), std::string("a\\x2"));
    EXPECT_EQ(UdevRecord("E:M_ENC=\\xzz\\\n").text("M"), std::string("\\xzz\\"));
}

TEST(UdevRecord, isFoundByTheNumbersOfTheDevice) {
    RecordedTree tree;
    tree.file("sys/block/sda/dev", "8:0\n")
        .file("sys/block/sdb/dev", "8:16\n")
        .file("sys/block/odd/dev", "../../../etc/x\n")
        .file("run/udev/data/b8:0", "E:ID_MODEL=M\n")
        .file("etc/x", "E:ID_MODEL=wrong\n");
    const auto modelOf = [&tree](const char* device) {
        return readUdevRecord(tree.root / "run/udev/data", tree.root / "sys/block" / device)
            .text("ID_MODEL");
    };
    EXPECT_EQ(modelOf("sda"), std::string("M"));
    EXPECT_FALSE(modelOf("sdb"));
    EXPECT_FALSE(modelOf("odd"));
    EXPECT_FALSE(modelOf("none"));
}

}  // namespace
}  // namespace cimomd
