#include "providers/ProviderIndex.h"

#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {

ProviderIndex::ProviderIndex(const ProviderList& providers,
                             const Pegasus::CIMNamespaceName& servedNamespace)
    : served(servedNamespace) {
    for (const auto& provider : providers)
        byClass.emplace(lowerCase(provider->className()), provider.get());
}

const Provider* ProviderIndex::find(const Pegasus::CIMNamespaceName& nameSpace,
                                    const Pegasus::CIMName& className) const {
    if (!served.equal(nameSpace))
        return nullptr;
    const auto place = byClass.find(lowerCase(utf8Of(className.getString())));
    return place == byClass.end() ? nullptr : place->second;
}

}  // namespace cimomd
