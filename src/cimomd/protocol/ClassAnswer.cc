#include "protocol/ClassAnswer.h"

#include <utility>

namespace cimomd {

ClassAnswer::ClassAnswer(Pegasus::CIMConstClass answeredClass, Pegasus::ObjectXmlOptions xmlOptions)
    : cimClass(std::move(answeredClass)), options(std::move(xmlOptions)) {}

bool ClassAnswer::next(std::string& xml) {
    if (done)
        return false;
    Pegasus::appendClass(xml, cimClass, options);
    done = true;
    return true;
}

}  // namespace cimomd
