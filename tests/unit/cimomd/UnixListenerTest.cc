#include "service/UnixListener.h"

#include <dlfcn.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <functional>
#include <stdexcept>
#include <utility>

#include "RecordedTree.h"

namespace cimomd {
namespace {

/// What somebody else does as soon as a socket has been bound.
std::function<void()>& afterBind() {
    static std::function<void()> deed;
    return deed;
}

}  // namespace
}  // namespace cimomd

/// Stands before that of the C library.
extern "C" int bind(int descriptor, const sockaddr* address, socklen_t length) noexcept {
    const auto original =
        reinterpret_cast<int (*)(int, const sockaddr*, socklen_t)>(::dlsym(RTLD_NEXT, "bind"));
    const int result = original(descriptor, address, length);
    if (const auto deed = std::exchange(cimomd::afterBind(), nullptr))
        deed();
    return result;
}

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

/// The mode of a file of 0644 after a socket was to be made while `deed` puts it in its place.
mode_t modeAfter(const std::filesystem::path& file, const std::string& path,
                 const SocketAccess& access, std::function<void()> deed) {
    EXPECT_EQ(::chmod(file.c_str(), 0644), 0);
    afterBind() = std::move(deed);
    EXPECT_THROW(UnixListener(path, access), std::runtime_error);
    EXPECT_FALSE(afterBind());
    struct stat status {};
    EXPECT_EQ(::stat(file.c_str(), &status), 0);
    return status.st_mode & 07777;
}

TEST(UnixListener, leavesWhatIsPutInTheSocketsPlace) {
    RecordedTree tree;
    const std::filesystem::path file = tree.root / "file";
    const std::string path = (tree.root / "s").string();
    for (const SocketAccess& access : {SocketAccess{0666, {}}, SocketAccess{0660, ::getegid()}}) {
        tree.file("file", "precious");
        std::filesystem::remove(path);
        EXPECT_EQ(modeAfter(file, path, access,
                            [&] {
                                std::filesystem::remove(path);
                                std::filesystem::create_symlink(file, path);
                            }),
                  0644U);
        std::filesystem::remove(path);
        EXPECT_EQ(modeAfter(file, path, access,
                            [&] {
                                std::filesystem::remove(path);
                                std::filesystem::create_hard_link(file, path);
                            }),
                  0644U);
    }
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
