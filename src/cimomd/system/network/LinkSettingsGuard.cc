#include "system/network/LinkSettingsGuard.h"

#include "system/GuardedChild.h"

namespace cimomd {
namespace {

struct Question {
    LinkSettingsGuard::Call call;
    const char* interfaceName;
};

void answerQuestion(const void* asked, int answers) {
    const Question& question = *static_cast<const Question*>(asked);
    DriverAnswer answer;
    question.call(question.interfaceName, answer);
    writeAnswer(answers, answer);
}

}  // namespace

LinkSettings LinkSettingsGuard::ask(const std::string& interfaceName) {
    const Question question{call, interfaceName.c_str()};
    DriverAnswer answer;
    const auto absence =
        askGuarded(silent, interfaceName, answerQuestion, &question, &answer, sizeof answer);
    if (absence)
        return {*absence, *absence};
    return linkSettingsOf(answer);
}

}  // namespace cimomd
