// The datetime of CIM (DSP0004, "Datetime type"): a time stamp or an interval.
#pragma once

#include <Pegasus/Common/String.h>

namespace Pegasus {

/// Keeps the text it is made of; there is nothing in it to change.
class CIMDateTime {
  public:
    /// The interval of no length, 00000000000000.000000:000.
    CIMDateTime();
    /// `text` is yyyymmddhhmmss.mmmmmmsutc (s a sign, utc minutes) or ddddddddhhmmss.mmmmmm:000;
    /// asterisks may stand for the last digits of the microseconds. Raises
    /// InvalidDateTimeFormatException for any other form, DateTimeOutOfRangeException for a month,
    /// day, hour, minute or second that cannot be.
    CIMDateTime(const String& text);

    /// The 25 characters as they were given.
    const String& toString() const { return text; }
    Boolean isInterval() const;

  private:
    String text;
};

/// Whether both have the same text: one moment in two time zones is not equal.
inline Boolean operator==(const CIMDateTime& a, const CIMDateTime& b) {
    return a.toString() == b.toString();
}

}  // namespace Pegasus
