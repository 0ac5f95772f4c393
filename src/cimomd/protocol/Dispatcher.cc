#include "protocol/Dispatcher.h"

#include <fmt/format.h>

#include "protocol/RequestChecks.h"
#include "protocol/operations/EnumerateClassNames.h"
#include "protocol/operations/EnumerateClasses.h"
#include "protocol/operations/EnumerateInstanceNames.h"
#include "protocol/operations/EnumerateInstances.h"
#include "protocol/operations/GetClass.h"
#include "protocol/operations/GetInstance.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {

Dispatcher::Dispatcher(const CurrentRepository& currentClasses, const ProviderIndex& providerIndex)
    : repository(currentClasses), providers(providerIndex) {
    operations.push_back(std::make_unique<GetClass>());
    operations.push_back(std::make_unique<EnumerateClasses>());
    operations.push_back(std::make_unique<EnumerateClassNames>());
    operations.push_back(std::make_unique<GetInstance>());
    operations.push_back(std::make_unique<EnumerateInstances>());
    operations.push_back(std::make_unique<EnumerateInstanceNames>());
}

std::unique_ptr<Answer> Dispatcher::dispatch(const Pegasus::CimRequest& request) const {
    const Operation& operation = operationFor(request);
    const Model model{repository.get(), &providers};
    if (!model.classes->hasNamespace(request.nameSpace))
        failOperation(
            Pegasus::CIM_ERR_INVALID_NAMESPACE,
            fmt::format("there is no namespace {}", utf8Of(request.nameSpace.getString())));
    return operation.start(request, model);
}

const Operation& Dispatcher::operationFor(const Pegasus::CimRequest& request) const {
    if (request.isExtrinsic)
        failOperation(Pegasus::CIM_ERR_NOT_SUPPORTED,
                      fmt::format("methods are not executed here: {}", request.method));
    for (const auto& operation : operations) {
        if (equalsIgnoringCase(operation->name(), request.method))
            return *operation;
    }
    failOperation(Pegasus::CIM_ERR_NOT_SUPPORTED,
                  fmt::format("the operation {} is not supported", request.method));
}

}  // namespace cimomd
