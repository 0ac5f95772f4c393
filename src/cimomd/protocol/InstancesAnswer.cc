#include "protocol/InstancesAnswer.h"

#include <utility>

namespace cimomd {

InstancesAnswer::InstancesAnswer(InstanceCursor instances, Pegasus::ObjectXmlOptions xmlOptions)
    : cursor(std::move(instances)), options(std::move(xmlOptions)) {}

bool InstancesAnswer::next(std::string& xml) {
    Pegasus::CIMInstance instance;
    if (!cursor.next(instance))
        return false;
    Pegasus::appendNamedInstance(xml, instance, options);
    return true;
}

}  // namespace cimomd
