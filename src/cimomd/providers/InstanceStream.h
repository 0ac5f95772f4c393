#pragma once

// Instances one after the other, so that an answer needs the memory of one of them only.

#include <Pegasus/Common/CIMInstance.h>

namespace cimomd {

class InstanceStream {
  public:
    virtual ~InstanceStream() = default;

    /// Puts the next instance, without a path, into `out`; false when there is none left. Raises
    /// ProviderError when the source fails midway.
    virtual bool next(Pegasus::CIMInstance& out) = 0;

  protected:
    InstanceStream() = default;
    InstanceStream(const InstanceStream&) = default;
    InstanceStream& operator=(const InstanceStream&) = default;
};

}  // namespace cimomd
