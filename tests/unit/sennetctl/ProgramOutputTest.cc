#include "script/ProgramOutput.h"

#include <gtest/gtest.h>

#include "support/ScopedEnvironment.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

constexpr unsigned kSeconds = 60;

TEST(ProgramOutputTest, WhatAProgramWrites) {
    EXPECT_EQ(outputOf({"sh", "-c", "echo \"$0\"; echo bad >&2", "a b"}, kSeconds), "a b\n");
    EXPECT_EQ(outputOf({"sh", "-c", "read line && echo \"$line\" || echo none"}, kSeconds),
              "none\n");
    EXPECT_EQ(outputOf({"sh", "-c", "exit 3"}, kSeconds), "");
}

TEST(ProgramOutputTest, ThereIsNoSuchProgram) {
    const support::TempDirectory directory;
    const support::ScopedEnvironment path("PATH", directory.path(""));
    EXPECT_EQ(outputOf({"sh", "-c", "echo x"}, kSeconds), "");
}

TEST(ProgramOutputTest, AProgramThatHangsOrDoesNotEnd) {
    EXPECT_EQ(outputOf({"sh", "-c", "echo x; exec sleep 1000"}, 1), "");
    EXPECT_LE(outputOf({"sh", "-c", "while :; do echo 0123456789; done"}, kSeconds).size(), 70000U);
}

}  // namespace
}  // namespace sennetctl
