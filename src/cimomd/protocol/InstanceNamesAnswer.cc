#include "protocol/InstanceNamesAnswer.h"

#include <utility>

#include "model/ObjectXml.h"

namespace cimomd {

InstanceNamesAnswer::InstanceNamesAnswer(InstanceCursor instances) : cursor(std::move(instances)) {}

bool InstanceNamesAnswer::next(std::string& xml) {
    Pegasus::CIMConstInstance instance;
    if (!cursor.next(instance))
        return false;
    Pegasus::appendInstanceName(xml, instance.getPath());
    xml += '\n';
    return true;
}

}  // namespace cimomd
