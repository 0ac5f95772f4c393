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
    writeAnswer(answers, &answer, sizeof answer);
}

}  // namespace

LinkSettings LinkSettingsGuard::ask(const std::string& interfaceName) {
    if (!silent.mayAsk(interfaceName))
        return {Absence::TimedOut, Absence::TimedOut};
    const Question question{call, interfaceName.c_str()};
    const GuardedChild child(silent, answerQuestion, &question);
    DriverAnswer answer;
    switch (child.read(&answer, sizeof answer)) {
        case GuardedChild::Reading::Silent:
            silent.note(interfaceName);
            return {Absence::TimedOut, Absence::TimedOut};
        case GuardedChild::Reading::Ended:
            return {Absence::Unreadable, Absence::Unreadable};
        case GuardedChild::Reading::Complete:
            break;
    }
    return linkSettingsOf(answer);
}

}  // namespace cimomd
