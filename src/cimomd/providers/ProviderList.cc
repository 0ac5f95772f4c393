#include "providers/ProviderList.h"

#include "providers/ComputerSystemProvider.h"
#include "providers/EthernetPortProvider.h"
#include "providers/LocalFileSystemProvider.h"
#include "providers/OperatingSystemProvider.h"
#include "providers/ProcessorProvider.h"

namespace cimomd {

ProviderList makeProviders(const SystemPaths& paths, const SystemCalls& calls) {
    ProviderList providers;
    providers.push_back(std::make_unique<ComputerSystemProvider>(paths));
    providers.push_back(std::make_unique<OperatingSystemProvider>(paths, calls));
    providers.push_back(std::make_unique<ProcessorProvider>(paths));
    providers.push_back(std::make_unique<LocalFileSystemProvider>(paths, calls));
    providers.push_back(std::make_unique<EthernetPortProvider>(paths));
    return providers;
}

}  // namespace cimomd
