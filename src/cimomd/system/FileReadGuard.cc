#include "system/FileReadGuard.h"

#include <array>
#include <cstdint>

#include "files/TextFile.h"
#include "system/GuardedChild.h"

namespace cimomd {
namespace {

struct Question {
    FileReadGuard::Call call;
    const char* const* paths;
    std::size_t count;
};

/// Comes before the bytes of a file.
struct Head {
    FileStatus status = FileStatus::Absent;
    std::uint32_t length = 0;
};

void sendFiles(const void* asked, int answers) {
    const Question& question = *static_cast<const Question*>(asked);
    std::array<char, kMaxGuardedBytes> buffer;
    for (std::size_t i = 0; i < question.count; ++i) {
        Head head;
        std::size_t length = 0;
        head.status = question.call(question.paths[i], buffer.data(), buffer.size(), length);
        head.length = static_cast<std::uint32_t>(length);
        if (!writeAnswer(answers, head) || !writeAnswer(answers, buffer.data(), length))
            return;
    }
}

/// Puts the next file of the child into `text`.
GuardedChild::Reading receive(const GuardedChild& child, Fact<std::string>& text) {
    Head head;
    const auto reading = child.read(&head, sizeof head);
    if (reading != GuardedChild::Reading::Complete)
        return reading;
    std::string bytes(head.length, '\0');
    const auto rest = child.read(bytes.data(), bytes.size());
    if (rest == GuardedChild::Reading::Complete && head.status == FileStatus::Read)
        text = std::move(bytes);
    else if (rest == GuardedChild::Reading::Complete)
        text = absenceOf(head.status);
    return rest;
}

}  // namespace

std::vector<Fact<std::string>> FileReadGuard::read(
    const std::vector<std::filesystem::path>& files) {
    Texts texts(files.size(), Absence::TimedOut);
    for (std::size_t next = 0; next < files.size();) {
        const std::vector<std::size_t> wanted = askable(files, next);
        if (wanted.empty())
            break;
        next = readOn(files, wanted, texts);
    }
    return texts;
}

/// The places of those files from `first` on that may be asked for.
std::vector<std::size_t> FileReadGuard::askable(const std::vector<std::filesystem::path>& files,
                                                std::size_t first) {
    std::vector<std::size_t> wanted;
    for (std::size_t i = first; i < files.size(); ++i) {
        if (silent.mayAsk(files[i].parent_path().string()))
            wanted.push_back(i);
    }
    return wanted;
}

/// Lets one child read; the place behind the last file that it was asked for.
std::size_t FileReadGuard::readOn(const std::vector<std::filesystem::path>& files,
                                  const std::vector<std::size_t>& wanted, Texts& texts) {
    std::vector<const char*> paths;
    paths.reserve(wanted.size());
    for (const std::size_t place : wanted)
        paths.push_back(files[place].c_str());
    const Question question{call, paths.data(), paths.size()};
    const GuardedChild child(silent, sendFiles, &question);
    for (const std::size_t place : wanted) {
        const auto reading = receive(child, texts[place]);
        if (reading == GuardedChild::Reading::Complete)
            continue;
        if (reading == GuardedChild::Reading::Ended) {
            texts[place] = Absence::Unreadable;
            continue;
        }
        silent.note(files[place].parent_path().string());
        return place + 1;
    }
    return files.size();
}

}  // namespace cimomd
