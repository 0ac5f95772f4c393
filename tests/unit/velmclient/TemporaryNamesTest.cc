// A run that is killed cannot remove its temporary files; the next one does, and nothing else.
#include "velmclient/TemporaryNames.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <string>

#include "support/TempDirectory.h"
#include "velmclient/FileDescriptor.h"
#include "velmclient/ReplacingFile.h"

namespace Velm {
namespace {

using support::TempDirectory;
using testing::ElementsAre;
using testing::UnorderedElementsAre;

constexpr const char* kAbandoned = ".velm-0123456789abcdef.tmp";

FileDescriptor lockedFile(const std::string& path) {
    FileDescriptor file(::open(path.c_str(), O_RDWR | O_CLOEXEC));
    EXPECT_EQ(::flock(file.get(), LOCK_EX | LOCK_NB), 0);
    return file;
}

void replace(const std::string& path, ReplacingFile::Temporary temporary) {
    ReplacingFile file(path, temporary);
    ASSERT_TRUE(file.open());
    ASSERT_TRUE(file.write("new"));
    ASSERT_TRUE(file.commit());
}

TEST(TemporaryNames, AreToldFromOthers) {
    EXPECT_TRUE(isTemporaryName(kAbandoned));
    EXPECT_TRUE(isTemporaryName(randomTemporaryName()));
    for (const char* other :
         {"", "a", ".velm-.tmp", ".velm-0123456789abcde.tmp", ".velm-0123456789abcdef0.tmp",
          ".velm-0123456789ABCDEF.tmp", ".velm-0123456789abcdeg.tmp", ".velm-0123456789abcdef.tmq",
          "xvelm-0123456789abcdef.tmp", ".velm-0123456789abcdef.tmp.tmp"}) {
        EXPECT_FALSE(isTemporaryName(other)) << other;
    }
}

TEST(TemporaryNames, TheNextFileRemovesWhatAKilledRunLeft) {
    for (const auto temporary :
         {ReplacingFile::Temporary::kHidden, ReplacingFile::Temporary::kNamelessWherePossible}) {
        const TempDirectory directory;
        directory.write(kAbandoned, "half");
        replace(directory.path("a"), temporary);
        EXPECT_THAT(directory.names(), ElementsAre("a"));
        EXPECT_EQ(directory.read("a"), "new");
    }
}

// Another user may make as many as he likes; looking at all of them for each output file once held
// a run up for minutes.
TEST(TemporaryNames, NotMoreAreLookedAtThanARunCanBear) {
    const TempDirectory directory;
    for (int number = 0; number < 4200; ++number) {
        char name[32];
        std::snprintf(name, sizeof name, ".velm-%016d.tmp", number);
        directory.write(name, "");
    }
    replace(directory.path("a"), ReplacingFile::Temporary::kHidden);
    EXPECT_GE(directory.names().size(), 4200U - 4096 + 1);
    EXPECT_LT(directory.names().size(), 4200U);
    replace(directory.path("a"), ReplacingFile::Temporary::kHidden);
    EXPECT_THAT(directory.names(), ElementsAre("a"));
}

TEST(TemporaryNames, AFileThatIsBeingWrittenStays) {
    const TempDirectory directory;
    ReplacingFile writing(directory.path("b"), ReplacingFile::Temporary::kHidden);
    ASSERT_TRUE(writing.open());
    ASSERT_TRUE(writing.write("slowly"));
    replace(directory.path("a"), ReplacingFile::Temporary::kHidden);
    EXPECT_TRUE(writing.commit());
    EXPECT_THAT(directory.names(), UnorderedElementsAre("a", "b"));
    EXPECT_EQ(directory.read("b"), "slowly");
}

TEST(TemporaryNames, AFileThatSomebodyHasLockedStays) {
    const TempDirectory directory;
    directory.write(kAbandoned, "held");
    const FileDescriptor held = lockedFile(directory.path(kAbandoned));
    replace(directory.path("a"), ReplacingFile::Temporary::kHidden);
    EXPECT_THAT(directory.names(), UnorderedElementsAre("a", kAbandoned));
}

TEST(TemporaryNames, WhatIsNoTemporaryFileStays) {
    const TempDirectory directory;
    const std::string folder = ".velm-00000000000000d1.tmp";
    const std::string fifo = ".velm-00000000000000f1.tmp";
    const std::string link = ".velm-00000000000000a1.tmp";
    const std::string linkedTwice = ".velm-00000000000000a2.tmp";
    directory.write("target", "somebody's");
    ASSERT_EQ(::mkdir(directory.path(folder).c_str(), 0700), 0);
    ASSERT_EQ(::mkfifo(directory.path(fifo).c_str(), 0600), 0);
    ASSERT_EQ(::symlink(directory.path("target").c_str(), directory.path(link).c_str()), 0);
    ASSERT_EQ(::link(directory.path("target").c_str(), directory.path(linkedTwice).c_str()), 0);
    directory.write(".velm-1.tmp", "another name");
    replace(directory.path("a"), ReplacingFile::Temporary::kHidden);
    EXPECT_THAT(directory.names(), UnorderedElementsAre("a", "target", ".velm-1.tmp", folder, fifo,
                                                        link, linkedTwice));
}

TEST(TemporaryNames, AFileOfAnotherUserStays) {
    if (::geteuid() != 0) {
        GTEST_SKIP() << "giving a file away needs root";
    }
    const TempDirectory directory;
    directory.write(kAbandoned, "somebody's");
    ASSERT_EQ(::chown(directory.path(kAbandoned).c_str(), 65534, 65534), 0);
    replace(directory.path("a"), ReplacingFile::Temporary::kHidden);
    EXPECT_THAT(directory.names(), UnorderedElementsAre("a", kAbandoned));
}

TEST(TemporaryNames, ANewFileOfSomebodyWhoTakesItForAbandonedIsNotKept) {
    const TempDirectory directory;
    directory.write(kAbandoned, "");
    const FileDescriptor mine(::open(directory.path(kAbandoned).c_str(), O_WRONLY | O_CLOEXEC));
    {
        const FileDescriptor theirs = lockedFile(directory.path(kAbandoned));
        EXPECT_FALSE(lockTemporaryFile(mine.get()));
    }
    ASSERT_EQ(::unlink(directory.path(kAbandoned).c_str()), 0);
    EXPECT_FALSE(lockTemporaryFile(mine.get()));
}

}  // namespace
}  // namespace Velm
