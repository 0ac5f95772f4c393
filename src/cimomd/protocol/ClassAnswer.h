#pragma once

// The answer to GetClass: one CLASS.

#include <Pegasus/Common/CIMClass.h>

#include "protocol/Answer.h"
#include "xml/CimXmlWriter.h"

namespace cimomd {

class ClassAnswer : public Answer {
  public:
    ClassAnswer(Pegasus::CIMConstClass answeredClass, Pegasus::ObjectXmlOptions xmlOptions);

    bool next(std::string& xml) override;

  private:
    Pegasus::CIMConstClass cimClass;
    Pegasus::ObjectXmlOptions options;
    bool done = false;
};

}  // namespace cimomd
