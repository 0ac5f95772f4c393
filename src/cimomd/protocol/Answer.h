#pragma once

// What an operation returns, element by element.

#include <string>

namespace cimomd {

class Answer {
  public:
    virtual ~Answer() = default;

    /// Appends the next element of IRETURNVALUE to `xml`; false, with `xml` as it was, when there
    /// is none left. Raises Pegasus::CIMException when the operation fails, also midway.
    virtual bool next(std::string& xml) = 0;

  protected:
    Answer() = default;
    Answer(const Answer&) = default;
    Answer& operator=(const Answer&) = default;
};

}  // namespace cimomd
