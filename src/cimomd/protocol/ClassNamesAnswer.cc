#include "protocol/ClassNamesAnswer.h"

#include <utility>

#include "model/ObjectXml.h"

namespace cimomd {

ClassNamesAnswer::ClassNamesAnswer(std::vector<Pegasus::CIMName> classNames)
    : names(std::move(classNames)) {}

bool ClassNamesAnswer::next(std::string& xml) {
    if (position == names.size())
        return false;
    Pegasus::appendClassName(xml, names[position++]);
    xml += '\n';
    return true;
}

}  // namespace cimomd
