#pragma once

// The answer to EnumerateInstances: VALUE.NAMEDINSTANCE after VALUE.NAMEDINSTANCE.

#include "protocol/Answer.h"
#include "protocol/InstanceCursor.h"
#include "xml/CimXmlWriter.h"

namespace cimomd {

class InstancesAnswer : public Answer {
  public:
    InstancesAnswer(InstanceCursor instances, Pegasus::ObjectXmlOptions xmlOptions);

    bool next(std::string& xml) override;

  private:
    InstanceCursor cursor;
    Pegasus::InstanceWriter writer;
};

}  // namespace cimomd
