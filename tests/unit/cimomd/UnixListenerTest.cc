#include "service/UnixListener.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <stdexcept>

#include "RecordedTree.h"

namespace cimomd {
namespace {

bool isThere(const std::filesystem::path& path) {
    return std::filesystem::exists(std::filesystem::symlink_status(path));
}

TEST(UnixListener, makesAPrivateSocketAndRemovesIt) {
    RecordedTree tree;
    const std::string path = (tree.root / "s").string();
    {
        const UnixListener listener(path);
        struct stat status {};
        ASSERT_EQ(::lstat(path.c_str(), &status), 0);
        EXPECT_TRUE(S_ISSOCK(status.st_mode));
        EXPECT_EQ(status.st_mode & 07777, 0600U);
    }
    EXPECT_FALSE(isThere(path));
}

TEST(UnixListener, letsInWhoTheModeAndTheGroupLetIn) {
    RecordedTree tree;
    const std::string path = (tree.root / "s").string();
    const UnixListener listener(path, SocketAccess{0660, ::getegid()});
    struct stat status {};
    ASSERT_EQ(::lstat(path.c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777, 0660U);
    EXPECT_EQ(status.st_gid, ::getegid());
}

TEST(UnixListener, replacesASocketThatNobodyServes) {
    RecordedTree tree;
    const std::string path = (tree.root / "s").string();
    {
        const UnixListener listener(path);
        std::filesystem::rename(path, path + ".kept");
    }
    std::filesystem::rename(path + ".kept", path);
    EXPECT_NO_THROW(UnixListener{path});
}

TEST(UnixListener, leavesWhatOthersOwn) {
    RecordedTree tree;
    tree.file("file", "precious");
    EXPECT_THROW(UnixListener((tree.root / "file").string()), std::runtime_error);
    EXPECT_TRUE(isThere(tree.root / "file"));
    const std::string path = (tree.root / "s").string();
    const UnixListener first(path);
    EXPECT_THROW(UnixListener{path}, std::runtime_error);
    EXPECT_TRUE(isThere(path));
}

TEST(UnixListener, doesNotRemoveASuccessorsSocket) {
    RecordedTree tree;
    const std::string path = (tree.root / "s").string();
    {
        const UnixListener listener(path);
        std::filesystem::rename(path, path + ".old");
        tree.file("s", "another's");
    }
    EXPECT_TRUE(isThere(path));
}

TEST(UnixListener, refusesPathsItCannotUse) {
    RecordedTree tree;
    EXPECT_THROW(UnixListener((tree.root / std::string(108, 'x')).string()), std::runtime_error);
    EXPECT_THROW(UnixListener((tree.root / "none" / "s").string()), std::runtime_error);
    EXPECT_THROW(UnixListener(""), std::runtime_error);
}

}  // namespace
}  // namespace cimomd
