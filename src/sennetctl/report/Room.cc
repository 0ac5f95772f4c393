#include "report/Room.h"

#include "report/CannotRun.h"

namespace sennetctl {

void Room::take(std::size_t octets) {
    if (octets > leftOctets) {
        throw CannotRun(refusal);
    }
    leftOctets -= octets;
}

}  // namespace sennetctl
