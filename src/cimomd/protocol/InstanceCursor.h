#pragma once

// The instances of one or more classes, one after the other: for each class those that MOF files
// declare, then those of its provider.

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>

#include <memory>
#include <optional>
#include <vector>

#include "model/PropertyOrigins.h"
#include "protocol/Model.h"
#include "providers/InstanceStream.h"

namespace cimomd {

class InstanceCursor {
  public:
    /// Gives the instances of exactly these classes, all of which the model has in the namespace.
    InstanceCursor(Model servedModel, Pegasus::CIMNamespaceName instanceNamespace,
                   std::vector<Pegasus::CIMName> classNames);

    /// The next instance with its path and with the class of origin of its properties; false when
    /// there is none left. Raises Pegasus::CIMException with CIM_ERR_FAILED and the name of the
    /// class whose provider failed.
    bool next(Pegasus::CIMConstInstance& instance);

  private:
    bool openNextClass();
    void openProvider(const Provider& provider);
    bool nextOfClass(Pegasus::CIMConstInstance& instance);
    bool nextProvided(Pegasus::CIMInstance& instance);
    Pegasus::CIMObjectPath pathOf(const Pegasus::CIMConstInstance& instance) const;
    [[noreturn]] void fail(const std::string& reason) const;

    Model model;
    Pegasus::CIMNamespaceName nameSpace;
    std::vector<Pegasus::CIMName> classes;
    /// One past the class that is being read.
    std::size_t position = 0;
    Pegasus::CIMConstClass cimClass;
    /// Of that class, owned by the model.
    const std::vector<Pegasus::CIMConstInstance>* declared = nullptr;
    std::size_t declaredPosition = 0;
    /// The provider's instances, and what they need: those that were declared have it already.
    std::unique_ptr<InstanceStream> stream;
    std::vector<Pegasus::CIMName> keys;
    std::optional<Pegasus::PropertyOrigins> origins;
};

}  // namespace cimomd
