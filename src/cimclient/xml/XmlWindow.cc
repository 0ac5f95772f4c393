#include "xml/XmlWindow.h"

#include <cstring>
#include <string>

namespace Pegasus {

namespace {

constexpr std::size_t kInitialCapacity = std::size_t{64} * 1024;

std::string hexadecimal(std::uint8_t octet) {
    constexpr std::string_view kDigits = "0123456789ABCDEF";
    return {kDigits[octet >> 4U], kDigits[octet & 0xFU]};
}

}  // namespace

XmlWindow::XmlWindow(ByteSource& source)
    : source(source), capacity(kInitialCapacity), buffer(new char[capacity + 1]) {
    buffer[0] = '\0';
}

bool XmlWindow::extend(std::size_t keepFrom, std::size_t& removed) {
    removed = makeRoom(keepFrom);
    const std::size_t before = filled;
    while (filled == before) {
        if (fault != OctetCheck::Verdict::Good) {
            throwFault();
        }
        if (ended) {
            return false;
        }
        std::memcpy(buffer.get() + filled, carry.data(), carrySize);
        const std::size_t offered = capacity - filled - carrySize;
        accept(source.read(buffer.get() + filled + carrySize, offered));
    }
    return true;
}

// Gives the source at least one octet of room beside the carried ones, and much of it where that is
// cheap. Octets move only after a quarter of the capacity or more was read since the last move, so
// the work stays in proportion to the document however small the pieces are.
std::size_t XmlWindow::makeRoom(std::size_t keepFrom) {
    const std::size_t room = capacity - filled;
    const std::size_t kept = filled - keepFrom;
    if (room >= capacity / 2 || (kept > capacity / 4 && room > carry.size())) {
        return 0;
    }
    std::memmove(buffer.get(), buffer.get() + keepFrom, kept);
    filled = kept;
    base += keepFrom;
    if (kept > capacity / 2) {
        grow();
    }
    buffer[filled] = '\0';
    return keepFrom;
}

void XmlWindow::grow() {
    capacity *= 2;
    std::unique_ptr<char[]> larger(new char[capacity + 1]);
    std::memcpy(larger.get(), buffer.get(), filled);
    buffer = std::move(larger);
}

void XmlWindow::accept(std::size_t received) {
    if (received == 0) {
        ended = true;
        if (carrySize != 0) {
            fault = OctetCheck::Verdict::InvalidUtf8;
            faultOctet = static_cast<std::uint8_t>(carry[0]);
        }
    } else {
        const std::string_view fresh(buffer.get() + filled, carrySize + received);
        const OctetCheck check = checkOctets(fresh);
        const std::string_view rest = fresh.substr(check.goodSize);
        carrySize = 0;
        if (check.verdict == OctetCheck::Verdict::Incomplete) {
            carrySize = rest.copy(carry.data(), carry.size());
        } else if (check.verdict != OctetCheck::Verdict::Good) {
            fault = check.verdict;
            faultOctet = static_cast<std::uint8_t>(rest.front());
        }
        filled += check.goodSize;
    }
    buffer[filled] = '\0';
}

void XmlWindow::throwFault() const {
    const std::uint64_t offset = base + filled;
    const std::string place = "; at byte " + std::to_string(offset);
    if (fault == OctetCheck::Verdict::ForbiddenCharacter) {
        throw XmlError{XmlError::Kind::Syntax, offset,
                       "a character that XML does not allow begins with octet " +
                           hexadecimal(faultOctet) + place};
    }
    if (offset == 0 && faultOctet >= 0xFE) {
        throw XmlError{XmlError::Kind::Syntax, offset,
                       "the text begins as UTF-16 does; expected UTF-8" + place};
    }
    throw XmlError{XmlError::Kind::InvalidUtf8, offset,
                   "octet " + hexadecimal(faultOctet) + " is not UTF-8 here" + place};
}

}  // namespace Pegasus
