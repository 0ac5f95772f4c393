#pragma once

// The answer to GetInstance: one INSTANCE.

#include "protocol/Answer.h"
#include "protocol/InstanceCursor.h"
#include "protocol/InstanceKeys.h"
#include "xml/CimXmlWriter.h"

namespace cimomd {

/// The instance is looked for when the answer is read: CIM_ERR_NOT_FOUND then when there is none.
class InstanceAnswer : public Answer {
  public:
    InstanceAnswer(InstanceCursor candidates, InstanceKeys wantedKeys,
                   Pegasus::ObjectXmlOptions xmlOptions);

    bool next(std::string& xml) override;

  private:
    Pegasus::CIMConstInstance find();

    InstanceCursor cursor;
    InstanceKeys keys;
    Pegasus::ObjectXmlOptions options;
    bool done = false;
};

}  // namespace cimomd
