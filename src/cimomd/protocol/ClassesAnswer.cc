#include "protocol/ClassesAnswer.h"

#include <utility>

#include "protocol/MethodXml.h"

namespace cimomd {

ClassesAnswer::ClassesAnswer(Model servedModel, Pegasus::CIMNamespaceName classNamespace,
                             std::vector<Pegasus::CIMName> classNames,
                             Pegasus::ObjectXmlOptions xmlOptions)
    : model(std::move(servedModel)),
      nameSpace(std::move(classNamespace)),
      names(std::move(classNames)),
      options(std::move(xmlOptions)) {}

bool ClassesAnswer::next(std::string& xml) {
    if (position == names.size())
        return false;
    const Pegasus::CIMName& name = names[position++];
    Pegasus::beginClassElement(xml, *model.classes->findClass(nameSpace, name), options);
    appendMethods(xml, model.classes->methodsOf(nameSpace, name), options);
    Pegasus::endClassElement(xml);
    xml += '\n';
    return true;
}

}  // namespace cimomd
