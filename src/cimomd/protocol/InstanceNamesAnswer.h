#pragma once

// The answer to EnumerateInstanceNames: INSTANCENAME after INSTANCENAME.

#include "protocol/Answer.h"
#include "protocol/InstanceCursor.h"

namespace cimomd {

class InstanceNamesAnswer : public Answer {
  public:
    explicit InstanceNamesAnswer(InstanceCursor instances);

    bool next(std::string& xml) override;

  private:
    InstanceCursor cursor;
};

}  // namespace cimomd
