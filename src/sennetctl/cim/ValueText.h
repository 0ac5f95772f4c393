#pragma once

// CIM values for people and for programs.

#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMValue.h>

#include <cstddef>
#include <string>

#include "SennetConverter/mif/ValueNames.h"
#include "report/AnswerRoom.h"
#include "report/Json.h"

namespace sennetctl {

/// Renders values; numbers of properties with Values (DSP0004) have names.
class ValueText {
  public:
    /// In octets. A column of a table in a pipe is as wide as its widest cell.
    static constexpr std::size_t kLongestShown = 65536;

    /// @param room  for all that is rendered; its CannotRun comes out of each function
    explicit ValueText(AnswerRoom& room) : room(room) {}

    /// For people: elements of an array are joined by ", ", null is an empty text.
    /// @param declared  the property in the class, for its names; null for none
    /// @param longest   a longer text is cut after so many octets and ends with "..."
    std::string shown(const Pegasus::CIMValue& value, const Pegasus::CIMProperty* declared,
                      std::size_t longest = kLongestShown);

    /// As a JSON value; with names {"value": ..., "text": ...}. Null is null.
    Json json(const Pegasus::CIMValue& value, const Pegasus::CIMProperty* declared);

  private:
    const Pegasus::ValueNames* namesFor(const Pegasus::CIMValue& value,
                                        const Pegasus::CIMProperty* declared);
    Json names(const Json& numbers, const Pegasus::ValueNames& known);
    void takeRoomFor(const Json& content);

    AnswerRoom& room;
    Pegasus::ValueNamesCache cache;
};

}  // namespace sennetctl
