#pragma once

// Asking the service manager for its lists over D-Bus, never longer than a deadline.

#include <systemd/sd-bus.h>

#include <chrono>
#include <filesystem>
#include <string>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

struct SdBusLibrary;

class SystemBus {
  public:
    using Row = std::vector<std::string>;

    /// Nothing is connected before the first question. The deadline is one for all questions and
    /// begins now.
    SystemBus(std::filesystem::path socketPath, std::chrono::milliseconds timeLimit);
    ~SystemBus();
    SystemBus(const SystemBus&) = delete;
    SystemBus& operator=(const SystemBus&) = delete;

    /// What a method of org.freedesktop.systemd1.Manager without parameters returns: an array of
    /// structures whose members have the basic types `rowTypes`, texts (s, o) or numbers (u); the
    /// latter are left empty. Absent: no bus, no service manager on it, or no library to ask with.
    /// NeedsRoot: the bus refuses. TimedOut: the deadline has passed. Unreadable: anything else.
    Fact<std::vector<Row>> list(const char* method, const char* rowTypes);

  private:
    using Clock = std::chrono::steady_clock;

    /// Zero, or a negative error number.
    int connect();
    void disconnect();
    int send(const char* method, sd_bus_message*& reply);
    int waitFor(sd_bus_message* const& reply);
    Fact<std::vector<Row>> rowsOf(sd_bus_message* reply, const char* rowTypes) const;
    int readRow(sd_bus_message* reply, const char* rowTypes, Row& row) const;

    std::filesystem::path path;
    Clock::time_point deadline;
    const SdBusLibrary* library = nullptr;
    sd_bus* bus = nullptr;
};

}  // namespace cimomd
