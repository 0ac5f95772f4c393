#include "report/AnswerRoom.h"

#include "report/CannotRun.h"

namespace sennetctl {

void AnswerRoom::take(std::size_t octets) {
    if (octets > leftOctets) {
        throw CannotRun("the answer is too large to show");
    }
    leftOctets -= octets;
}

}  // namespace sennetctl
