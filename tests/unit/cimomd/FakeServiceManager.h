#pragma once

// A system bus with a service manager on it, as far as one client can tell.

#include <systemd/sd-bus.h>

#include <atomic>
#include <filesystem>
#include <map>
#include <string>
#include <thread>
#include <vector>

namespace cimomd {

class FakeServiceManager {
  public:
    using Row = std::vector<std::string>;
    enum class Manner { Answers, Refuses, IsMissing, AnswersNonsense, SaysNothing, HangsUp };

    FakeServiceManager(const std::filesystem::path& socketPath, Manner listManner);
    ~FakeServiceManager();
    FakeServiceManager(const FakeServiceManager&) = delete;
    FakeServiceManager& operator=(const FakeServiceManager&) = delete;

    // To be filled before anybody connects.
    /// name, description, load state, active state, sub state
    std::vector<Row> units;
    /// path, state
    std::vector<Row> files;

  private:
    void serve();
    void serveConnection(int descriptor);
    int answer(sd_bus_message* call);
    int answerList(sd_bus_message* call) const;

    Manner manner;
    int listener = -1;
    std::atomic<bool> isEnding = false;
    bool isHangingUp = false;
    std::thread server;
};

}  // namespace cimomd
