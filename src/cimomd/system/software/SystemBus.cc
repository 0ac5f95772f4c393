#include "system/software/SystemBus.h"

#include <fmt/format.h>

#include <cerrno>
#include <string_view>

#include "files/FileTime.h"
#include "files/TextFile.h"
#include "system/software/SdBusLibrary.h"

namespace cimomd {
namespace {

constexpr std::size_t kMaxRows = 100000;

bool isPlainInAddress(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') ||
           std::string_view("-_/.").find(c) != std::string_view::npos;
}

/// A D-Bus address, in which most characters are written as their codes.
std::string addressOf(const std::filesystem::path& path) {
    std::string address = "unix:path=";
    for (const char c : path.string())
        address += isPlainInAddress(c) ? std::string(1, c)
                                       : fmt::format("%{:02x}", static_cast<unsigned char>(c));
    return address;
}

Absence absenceOfErrorNumber(int error) {
    if (error == ETIMEDOUT)
        return Absence::TimedOut;
    // Nobody listens on the socket that is still there.
    if (error == ECONNREFUSED)
        return Absence::Absent;
    return absenceOf(std::error_code(error, std::generic_category()));
}

Absence absenceOfErrorName(std::string_view name) {
    if (name == SD_BUS_ERROR_SERVICE_UNKNOWN || name == SD_BUS_ERROR_NAME_HAS_NO_OWNER)
        return Absence::Absent;
    if (name == SD_BUS_ERROR_ACCESS_DENIED)
        return Absence::NeedsRoot;
    if (name == SD_BUS_ERROR_TIMEOUT)
        return Absence::TimedOut;
    return Absence::Unreadable;
}

}  // namespace

SystemBus::SystemBus(std::filesystem::path socketPath, std::chrono::milliseconds timeLimit)
    : path(std::move(socketPath)), deadline(Clock::now() + timeLimit) {}

SystemBus::~SystemBus() {
    disconnect();
}

void SystemBus::disconnect() {
    if (bus != nullptr)
        library->closeUnref(bus);
    bus = nullptr;
}

int SystemBus::connect() {
    if (bus != nullptr)
        return 0;
    int error = library->busNew(&bus);
    if (error >= 0)
        error = library->setAddress(bus, addressOf(path).c_str());
    if (error >= 0)
        error = library->setBusClient(bus, 1);
    return error >= 0 ? library->start(bus) : error;
}

int SystemBus::waitFor(sd_bus_message* const& reply) {
    // Not sd_bus_call: that waits for the bus to accept the connection as long as the bus likes.
    while (reply == nullptr) {
        const auto left =
            std::chrono::duration_cast<std::chrono::microseconds>(deadline - Clock::now()).count();
        if (left <= 0)
            return -ETIMEDOUT;
        int done = library->process(bus, nullptr);
        if (done == 0)
            done = library->wait(bus, static_cast<std::uint64_t>(left));
        if (done < 0 && done != -EINTR)
            return done;
    }
    return 0;
}

int SystemBus::send(const char* method, sd_bus_message*& reply) {
    sd_bus_message* call = nullptr;
    int error = library->messageNewMethodCall(bus, &call, "org.freedesktop.systemd1",
                                              "/org/freedesktop/systemd1",
                                              "org.freedesktop.systemd1.Manager", method);
    if (error < 0)
        return error;
    // A machine that runs another service manager must not be told to start this one.
    library->messageSetAutoStart(call, 0);
    const auto keep = [](sd_bus_message* message, void* place, sd_bus_error*) {
        *static_cast<sd_bus_message**>(place) = SdBusLibrary::get()->messageRef(message);
        return 1;
    };
    error = library->callAsync(bus, nullptr, call, keep, &reply, UINT64_MAX);
    library->messageUnref(call);
    return error;
}

Fact<std::vector<SystemBus::Row>> SystemBus::list(const char* method, const char* rowTypes) {
    if (const auto socketTime = modificationTimeOf(path); !socketTime)
        return socketTime.reason();
    library = SdBusLibrary::get();
    if (library == nullptr)
        return Absence::Absent;
    sd_bus_message* reply = nullptr;
    int error = connect();
    if (error >= 0)
        error = send(method, reply);
    if (error >= 0)
        error = waitFor(reply);
    if (error < 0) {
        // An answer that comes later has no place to go any more.
        disconnect();
        return absenceOfErrorNumber(-error);
    }
    Fact<std::vector<Row>> rows = rowsOf(reply, rowTypes);
    library->messageUnref(reply);
    return rows;
}

Fact<std::vector<SystemBus::Row>> SystemBus::rowsOf(sd_bus_message* reply,
                                                    const char* rowTypes) const {
    if (const sd_bus_error* error = library->messageGetError(reply); error != nullptr)
        return absenceOfErrorName(error->name);
    const std::string structure = fmt::format("({})", rowTypes);
    if (library->messageEnterContainer(reply, SD_BUS_TYPE_ARRAY, structure.c_str()) < 0)
        return Absence::Unreadable;
    std::vector<Row> rows;
    int found = library->messageEnterContainer(reply, SD_BUS_TYPE_STRUCT, rowTypes);
    while (found > 0 && rows.size() < kMaxRows) {
        found = readRow(reply, rowTypes, rows.emplace_back());
        if (found >= 0)
            found = library->messageExitContainer(reply);
        if (found >= 0)
            found = library->messageEnterContainer(reply, SD_BUS_TYPE_STRUCT, rowTypes);
    }
    if (found < 0)
        return Absence::Unreadable;
    return rows;
}

int SystemBus::readRow(sd_bus_message* reply, const char* rowTypes, Row& row) const {
    for (const char* type = rowTypes; *type != '\0'; ++type) {
        const char* text = "";
        std::uint32_t number = 0;
        void* place =
            *type == SD_BUS_TYPE_UINT32 ? static_cast<void*>(&number) : static_cast<void*>(&text);
        const int error = library->messageReadBasic(reply, *type, place);
        if (error < 0)
            return error;
        row.emplace_back(text);
    }
    return 0;
}

}  // namespace cimomd
