#pragma once

// The answer to EnumerateInstances: VALUE.NAMEDINSTANCE after VALUE.NAMEDINSTANCE, as the providers
// give them.

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMName.h>

#include <memory>
#include <vector>

#include "protocol/Answer.h"
#include "providers/Provider.h"
#include "xml/CimXmlWriter.h"

namespace cimomd {

/// A provider with the effective class of its instances.
struct ProvidedClass {
    const Provider* provider = nullptr;
    Pegasus::CIMConstClass cimClass;
};

class InstancesAnswer : public Answer {
  public:
    /// The providers must outlive the answer.
    InstancesAnswer(Pegasus::CIMNamespaceName instanceNamespace,
                    std::vector<ProvidedClass> providedClasses,
                    Pegasus::ObjectXmlOptions xmlOptions);

    bool next(std::string& xml) override;

  private:
    bool openNextProvider();
    bool nextInstance(Pegasus::CIMInstance& instance);
    void complete(Pegasus::CIMInstance& instance) const;
    Pegasus::CIMObjectPath pathOf(const Pegasus::CIMInstance& instance) const;
    const ProvidedClass& current() const { return sources[position - 1]; }

    Pegasus::CIMNamespaceName nameSpace;
    std::vector<ProvidedClass> sources;
    Pegasus::ObjectXmlOptions options;
    /// One past the source that `stream` reads.
    std::size_t position = 0;
    std::unique_ptr<InstanceStream> stream;
    std::vector<Pegasus::CIMName> keys;
};

}  // namespace cimomd
