#include "protocol/InstanceAnswer.h"

#include <utility>

#include "protocol/RequestChecks.h"

namespace cimomd {

InstanceAnswer::InstanceAnswer(InstanceCursor candidates, InstanceKeys wantedKeys,
                               Pegasus::ObjectXmlOptions xmlOptions)
    : cursor(std::move(candidates)), keys(std::move(wantedKeys)), options(std::move(xmlOptions)) {}

bool InstanceAnswer::next(std::string& xml) {
    if (done)
        return false;
    Pegasus::appendInstance(xml, find(), options);
    xml += '\n';
    done = true;
    return true;
}

Pegasus::CIMConstInstance InstanceAnswer::find() {
    Pegasus::CIMConstInstance instance;
    while (cursor.next(instance)) {
        if (keys.match(instance.getPath()))
            return instance;
    }
    failOperation(Pegasus::CIM_ERR_NOT_FOUND, "there is no instance with these keys");
}

}  // namespace cimomd
