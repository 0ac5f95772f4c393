#include "system/SilentSources.h"

#include <sys/wait.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <thread>

namespace cimomd {
namespace {

using std::chrono::milliseconds;

constexpr milliseconds kTimeToDie{100};

/// Whether the child is gone, or none of ours.
bool isReaped(pid_t child) {
    const pid_t ended = ::waitpid(child, nullptr, WNOHANG);
    return ended == child || (ended < 0 && errno == ECHILD);
}

}  // namespace

bool SilentSources::mayAsk(const std::string& source) {
    const std::lock_guard lock(mutex);
    stuck.erase(std::remove_if(stuck.begin(), stuck.end(), isReaped), stuck.end());
    const auto now = Clock::now();
    for (auto entry = retryTimes.begin(); entry != retryTimes.end();)
        entry = entry->second <= now ? retryTimes.erase(entry) : std::next(entry);
    return retryTimes.count(source) == 0 &&
           std::max(retryTimes.size(), stuck.size()) < limits.maxSilent;
}

void SilentSources::note(const std::string& source) {
    const std::lock_guard lock(mutex);
    retryTimes[source] = Clock::now() + limits.retryAfter;
}

void SilentSources::end(pid_t child) {
    ::kill(child, SIGKILL);
    const auto giveUp = Clock::now() + kTimeToDie;
    while (!isReaped(child)) {
        if (Clock::now() >= giveUp) {
            const std::lock_guard lock(mutex);
            stuck.push_back(child);
            return;
        }
        std::this_thread::sleep_for(milliseconds(1));
    }
}

}  // namespace cimomd
