#include "providers/ProviderList.h"
#include "providers/MissingValueProvider.h"

#include "providers/computer/ComputerSystemProvider.h"
#include "providers/network/EthernetPortProvider.h"
#include "providers/processor/ProcessorProvider.h"
#include "providers/software/OperatingSystemProvider.h"
#include "providers/storage/LocalFileSystemProvider.h"

namespace cimomd {

ProviderList makeProviders(const SystemPaths& paths, const SystemCalls& calls) {
    ProviderList providers;
    providers.push_back(std::make_unique<ComputerSystemProvider>(paths));
    providers.push_back(std::make_unique<OperatingSystemProvider>(paths, calls));
    providers.push_back(std::make_unique<ProcessorProvider>(paths));
    providers.push_back(std::make_unique<LocalFileSystemProvider>(paths, calls));
    providers.push_back(std::make_unique<EthernetPortProvider>(paths));
    providers.push_back(std::make_unique<MissingValueProvider>(providers));
    return providers;
}

}  // namespace cimomd
