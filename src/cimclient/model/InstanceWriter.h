// Writes INSTANCE elements (DSP0201) one after the other.
//
// The markup around the values is the same in all instances of one shape, and is most of what is
// written: it is made once and then copied.
#pragma once

#include <Pegasus/Common/CIMInstance.h>

#include <memory>
#include <string>
#include <vector>

#include "InstanceShape.h"
#include "ObjectXml.h"
#include "PackedProperties.h"

namespace Pegasus {

class InstanceWriter {
  public:
    explicit InstanceWriter(ObjectXmlOptions instanceOptions)
        : options(std::move(instanceOptions)) {}

    /// Appends INSTANCE with its properties. The instance must be initialized.
    void append(std::string& xml, const CIMConstInstance& instance);

  private:
    /// A property that is written: what stands before its value and behind it.
    struct Frame {
        Uint32 index;
        std::string begin;
        std::string end;
    };

    void appendPacked(std::string& xml, const CIMConstInstance& instance,
                      const PackedProperties& properties);
    void makeFrames(const CIMConstInstance& instance);

    ObjectXmlOptions options;
    /// What the frames are for.
    std::shared_ptr<const InstanceShape> shape;
    std::vector<Frame> frames;
};

}  // namespace Pegasus
