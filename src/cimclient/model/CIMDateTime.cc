#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/Exception.h>

#include <algorithm>
#include <array>

namespace Pegasus {

namespace {

constexpr Uint32 kLength = 25;
constexpr Uint32 kDot = 14;
constexpr Uint32 kMicroseconds = 15;
constexpr Uint32 kSign = 21;
constexpr Uint32 kUtcOffset = 22;

Boolean isDigit(Char16 character) {
    return character >= '0' && character <= '9';
}

Boolean areDigits(const String& text, Uint32 from, Uint32 to) {
    const Char16* const data = text.getChar16Data();
    return std::all_of(data + from, data + to, isDigit);
}

/// Digits, then nothing but asterisks.
Boolean areMicroseconds(const String& text) {
    const Char16* const end = text.getChar16Data() + kSign;
    const Char16* const firstNoDigit =
        std::find_if_not(text.getChar16Data() + kMicroseconds, end, isDigit);
    return std::all_of(firstNoDigit, end, [](Char16 character) { return character == '*'; });
}

Boolean isWellFormed(const String& text) {
    if (text.size() != kLength || !areDigits(text, 0, kDot) || text[kDot] != '.' ||
        !areMicroseconds(text) || !areDigits(text, kUtcOffset, kLength))
        return false;
    const Uint16 sign = text[kSign];
    if (sign == ':')
        return text.subString(kUtcOffset) == "000";
    return sign == '+' || sign == '-';
}

Uint32 numberAt(const String& text, Uint32 from, Uint32 digits) {
    Uint32 number = 0;
    for (Uint32 i = from; i < from + digits; ++i)
        number = number * 10 + (text[i] - '0');
    return number;
}

Uint32 daysIn(Uint32 year, Uint32 month) {
    static constexpr std::array<Uint32, 12> kDays = {31, 28, 31, 30, 31, 30,
                                                     31, 31, 30, 31, 30, 31};
    const Boolean leapYear = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
    return month == 2 && leapYear ? 29 : kDays[month - 1];
}

void requireRange(const String& text, const char* field, Uint32 number, Uint32 smallest,
                  Uint32 largest) {
    if (number < smallest || number > largest)
        throw DateTimeOutOfRangeException("The " + String(field) + " of the datetime \"" + text +
                                          "\" is out of range");
}

void requireDate(const String& text) {
    const Uint32 year = numberAt(text, 0, 4);
    const Uint32 month = numberAt(text, 4, 2);
    requireRange(text, "month", month, 1, 12);
    requireRange(text, "day", numberAt(text, 6, 2), 1, daysIn(year, month));
}

void requireTimeOfDay(const String& text) {
    requireRange(text, "hour", numberAt(text, 8, 2), 0, 23);
    requireRange(text, "minute", numberAt(text, 10, 2), 0, 59);
    requireRange(text, "second", numberAt(text, 12, 2), 0, 59);
}

}  // namespace

CIMDateTime::CIMDateTime() {
    static const String kZeroInterval("00000000000000.000000:000");
    text = kZeroInterval;
}

CIMDateTime::CIMDateTime(const String& text) : text(text) {
    if (!isWellFormed(text))
        throw InvalidDateTimeFormatException(
            "\"" + text +
            "\" is not a datetime: expected yyyymmddhhmmss.mmmmmmsutc or "
            "ddddddddhhmmss.mmmmmm:000");
    if (!isInterval())
        requireDate(text);
    requireTimeOfDay(text);
}

Boolean CIMDateTime::isInterval() const {
    return text.getChar16Data()[kSign] == ':';
}

}  // namespace Pegasus
