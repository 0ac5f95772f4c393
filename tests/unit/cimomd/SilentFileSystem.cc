#include "SilentFileSystem.h"

#include <fcntl.h>
#include <linux/fuse.h>
#include <poll.h>
#include <sys/eventfd.h>
#include <sys/mount.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstring>
#include <vector>

namespace cimomd {
namespace {

// FUSE_MIN_READ_BUFFER is less than what the kernel of today may ask for.
constexpr std::size_t kRequestBytes = std::size_t{1} << 20;

void answerInit(int connection, const fuse_in_header& request) {
    struct {
        fuse_out_header header;
        fuse_init_out body;
    } answer{};
    answer.header.len = sizeof answer;
    answer.header.unique = request.unique;
    answer.body.major = FUSE_KERNEL_VERSION;
    answer.body.minor = FUSE_KERNEL_MINOR_VERSION;
    answer.body.max_write = 4096;
    static_cast<void>(::write(connection, &answer, sizeof answer) == sizeof answer);
}

}  // namespace

SilentFileSystem::SilentFileSystem(unsigned owner) {
    connection = ::open("/dev/fuse", O_RDWR | O_CLOEXEC | O_NONBLOCK);
    if (connection < 0) {
        failure = std::string("/dev/fuse: ") + std::strerror(errno);
        return;
    }
    const std::string options = "fd=" + std::to_string(connection) +
                                ",rootmode=40000,user_id=" + std::to_string(owner) +
                                ",group_id=" + std::to_string(owner);
    if (::mount("silent", place.path().c_str(), "fuse.silent", MS_NODEV | MS_NOSUID,
                options.c_str()) != 0) {
        failure = std::string("mount: ") + std::strerror(errno);
        return;
    }
    stopRequest = ::eventfd(0, EFD_CLOEXEC);
    program = std::thread([this] { readAndAnswerOnlyTheFirst(); });
}

SilentFileSystem::~SilentFileSystem() {
    if (program.joinable()) {
        const std::uint64_t one = 1;
        static_cast<void>(::write(stopRequest, &one, sizeof one) == sizeof one);
        program.join();
        ::umount2(place.path().c_str(), MNT_DETACH);
    }
    // Closing the connection ends the waiting of all who asked.
    ::close(connection);
    ::close(stopRequest);
}

void SilentFileSystem::readAndAnswerOnlyTheFirst() const {
    std::vector<char> request(kRequestBytes);
    std::array<pollfd, 2> descriptors{{{connection, POLLIN, 0}, {stopRequest, POLLIN, 0}}};
    while (::poll(descriptors.data(), descriptors.size(), -1) > 0 && descriptors[1].revents == 0) {
        const ssize_t length = ::read(connection, request.data(), request.size());
        if (length < static_cast<ssize_t>(sizeof(fuse_in_header)))
            continue;
        fuse_in_header header{};
        std::memcpy(&header, request.data(), sizeof header);
        if (header.opcode == FUSE_INIT)
            answerInit(connection, header);
    }
}

}  // namespace cimomd
