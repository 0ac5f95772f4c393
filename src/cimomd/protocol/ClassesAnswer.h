#pragma once

// The answer to GetClass and EnumerateClasses: CLASS after CLASS.

#include <vector>

#include "protocol/Answer.h"
#include "protocol/Model.h"
#include "xml/CimXmlWriter.h"

namespace cimomd {

class ClassesAnswer : public Answer {
  public:
    /// The model has all the classes in the namespace.
    ClassesAnswer(Model servedModel, Pegasus::CIMNamespaceName classNamespace,
                  std::vector<Pegasus::CIMName> classNames, Pegasus::ObjectXmlOptions xmlOptions);

    bool next(std::string& xml) override;

  private:
    Model model;
    Pegasus::CIMNamespaceName nameSpace;
    std::vector<Pegasus::CIMName> names;
    Pegasus::ObjectXmlOptions options;
    std::size_t position = 0;
};

}  // namespace cimomd
