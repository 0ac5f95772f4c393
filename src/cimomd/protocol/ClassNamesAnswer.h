#pragma once

// The answer to EnumerateClassNames: CLASSNAME after CLASSNAME.

#include <Pegasus/Common/CIMName.h>

#include <vector>

#include "protocol/Answer.h"

namespace cimomd {

class ClassNamesAnswer : public Answer {
  public:
    explicit ClassNamesAnswer(std::vector<Pegasus::CIMName> classNames);

    bool next(std::string& xml) override;

  private:
    std::vector<Pegasus::CIMName> names;
    std::size_t position = 0;
};

}  // namespace cimomd
