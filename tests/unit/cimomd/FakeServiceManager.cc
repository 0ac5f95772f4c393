#include "FakeServiceManager.h"

#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <cstring>
#include <stdexcept>

namespace cimomd {
namespace {

constexpr int kPauseMilliseconds = 10;

int listenOn(const std::filesystem::path& path) {
    std::filesystem::create_directories(path.parent_path());
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    if (path.string().size() >= sizeof address.sun_path)
        throw std::runtime_error("the path of the socket is too long");
    std::strcpy(address.sun_path, path.c_str());
    const int descriptor = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (::bind(descriptor, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0 ||
        ::listen(descriptor, 5) != 0)
        throw std::runtime_error("cannot listen");
    return descriptor;
}

bool isReadable(int descriptor) {
    pollfd waiting{descriptor, POLLIN, 0};
    return ::poll(&waiting, 1, kPauseMilliseconds) > 0;
}

void appendUnits(sd_bus_message* reply, const std::vector<FakeServiceManager::Row>& units) {
    sd_bus_message_open_container(reply, 'a', "(ssssssouso)");
    for (const auto& unit : units)
        sd_bus_message_append(reply, "(ssssssouso)", unit[0].c_str(), unit[1].c_str(),
                              unit[2].c_str(), unit[3].c_str(), unit[4].c_str(), "", "/unit", 7U,
                              "", "/");
    sd_bus_message_close_container(reply);
}

void appendFiles(sd_bus_message* reply, const std::vector<FakeServiceManager::Row>& files) {
    sd_bus_message_open_container(reply, 'a', "(ss)");
    for (const auto& file : files)
        sd_bus_message_append(reply, "(ss)", file[0].c_str(), file[1].c_str());
    sd_bus_message_close_container(reply);
}

}  // namespace

FakeServiceManager::FakeServiceManager(const std::filesystem::path& socketPath, Manner listManner)
    : manner(listManner), listener(listenOn(socketPath)), server([this] { serve(); }) {}

FakeServiceManager::~FakeServiceManager() {
    isEnding = true;
    server.join();
    ::close(listener);
}

void FakeServiceManager::serve() {
    while (!isEnding) {
        if (isReadable(listener))
            serveConnection(::accept4(listener, nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK));
    }
}

void FakeServiceManager::serveConnection(int descriptor) {
    if (manner == Manner::SaysNothing) {
        while (!isEnding)
            ::poll(nullptr, 0, kPauseMilliseconds);
        ::close(descriptor);
        return;
    }
    sd_bus* bus = nullptr;
    sd_bus_new(&bus);
    sd_bus_set_fd(bus, descriptor, descriptor);
    sd_bus_set_server(bus, 1, sd_id128_t{{1}});
    const auto handle = [](sd_bus_message* call, void* self, sd_bus_error*) {
        return static_cast<FakeServiceManager*>(self)->answer(call);
    };
    sd_bus_add_filter(bus, nullptr, handle, this);
    int going = sd_bus_start(bus);
    while (going >= 0 && !isEnding && !isHangingUp) {
        going = sd_bus_process(bus, nullptr);
        if (going == 0)
            going = sd_bus_wait(bus, kPauseMilliseconds * 1000);
    }
    sd_bus_flush_close_unref(bus);
}

int FakeServiceManager::answer(sd_bus_message* call) {
    if (sd_bus_message_is_method_call(call, "org.freedesktop.DBus", "Hello") > 0) {
        sd_bus_reply_method_return(call, "s", ":1.7");
        return 1;
    }
    // What asks to start a service manager would not be answered like this by a real bus.
    if (sd_bus_message_get_auto_start(call) != 0 ||
        std::string("org.freedesktop.systemd1") != sd_bus_message_get_destination(call))
        return -EINVAL;
    switch (manner) {
        case Manner::Refuses:
            return sd_bus_reply_method_errorf(call, SD_BUS_ERROR_ACCESS_DENIED, "no");
        case Manner::IsMissing:
            return sd_bus_reply_method_errorf(call, SD_BUS_ERROR_SERVICE_UNKNOWN, "nobody");
        case Manner::AnswersNonsense:
            sd_bus_reply_method_return(call, "a(su)", 1, "ssh.service", 7U);
            return 1;
        case Manner::HangsUp:
            isHangingUp = true;
            return 1;
        default:
            return answerList(call);
    }
}

int FakeServiceManager::answerList(sd_bus_message* call) const {
    sd_bus_message* reply = nullptr;
    sd_bus_message_new_method_return(call, &reply);
    if (std::string("ListUnits") == sd_bus_message_get_member(call))
        appendUnits(reply, units);
    else
        appendFiles(reply, files);
    sd_bus_send(nullptr, reply, nullptr);
    sd_bus_message_unref(reply);
    return 1;
}

}  // namespace cimomd
