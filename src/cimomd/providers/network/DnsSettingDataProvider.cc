#include "providers/network/DnsSettingDataProvider.h"

#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

namespace cimomd {

std::unique_ptr<InstanceStream> DnsSettingDataProvider::enumerate() const {
    const auto settings = readResolverSettings(paths);
    if (!settings)
        return std::make_unique<EmptyStream>(settings.reason());
    return std::make_unique<RecordStream<ResolverSettings>>(std::vector{*settings},
                                                            &DnsSettingDataProvider::publish);
}

ProvidedInstance DnsSettingDataProvider::publish(const ResolverSettings& settings) {
    InstanceBuilder builder(kClassName);
    builder.key("InstanceID", "Velmira:resolver")
        .label("Resolver")
        .texts("DNSServerAddresses", settings.servers)
        .text("DomainName", settings.domain)
        .texts("SearchDomains", settings.searchDomains);
    return builder.take();
}

}  // namespace cimomd
