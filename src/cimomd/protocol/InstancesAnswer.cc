#include "protocol/InstancesAnswer.h"

#include <utility>

namespace cimomd {

InstancesAnswer::InstancesAnswer(InstanceCursor instances, Pegasus::ObjectXmlOptions xmlOptions)
    : cursor(std::move(instances)), writer(std::move(xmlOptions)) {}

bool InstancesAnswer::next(std::string& xml) {
    Pegasus::CIMConstInstance instance;
    if (!cursor.next(instance))
        return false;
    Pegasus::appendNamedInstance(xml, instance, writer);
    return true;
}

}  // namespace cimomd
