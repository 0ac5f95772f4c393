#include "system/network/ResolverSettings.h"

#include <algorithm>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/network/IpAddress.h"

namespace cimomd {
namespace {

bool isAddress(std::string_view text) {
    // An address that is only valid on one link has that link's name behind it.
    const std::size_t zone = text.find('%');
    const auto address = IpAddress::parse(text.substr(0, zone));
    return address && (zone == std::string_view::npos || address->isLinkLocal());
}

bool isStub(const std::string& server) {
    return server == "127.0.0.53" || server == "127.0.0.54";
}

/// The root domain stands for "no domain".
std::vector<std::string> domainsOf(const std::vector<std::string_view>& fields) {
    std::vector<std::string> out;
    for (std::size_t i = 1; i < fields.size(); ++i) {
        if (fields[i] != ".")
            out.emplace_back(fields[i]);
    }
    return out;
}

Fact<std::vector<std::string>> unlessEmpty(std::vector<std::string> found) {
    if (found.empty())
        return Absence::Absent;
    return found;
}

Fact<std::vector<std::string>> withoutStub(const std::vector<std::string>& servers) {
    std::vector<std::string> real;
    std::copy_if(servers.begin(), servers.end(), std::back_inserter(real),
                 [](const std::string& server) { return !isStub(server); });
    if (real.empty() && !servers.empty())
        return Absence::Filtered;
    return unlessEmpty(std::move(real));
}

}  // namespace

ResolverSettings parseResolverSettings(std::string_view text) {
    std::vector<std::string> servers;
    std::vector<std::string> domains;
    for (const std::string_view line : linesOf(text)) {
        // Key words begin a line; what stands behind blanks, '#' or ';' is no setting.
        const std::vector<std::string_view> fields = fieldsOf(line.substr(0, line.find('\r')));
        if (fields.size() < 2 || fields[0].data() != line.data())
            continue;
        if (fields[0] == "nameserver" && isAddress(fields[1]))
            servers.emplace_back(fields[1]);
        else if (fields[0] == "domain")
            domains = domainsOf({fields[0], fields[1]});
        else if (fields[0] == "search")
            domains = domainsOf(fields);
    }
    ResolverSettings out;
    out.servers = withoutStub(servers);
    if (!domains.empty())
        out.domain = domains.front();
    out.searchDomains = unlessEmpty(std::move(domains));
    return out;
}

Fact<ResolverSettings> readResolverSettings(const SystemPaths& paths) {
    const Fact<std::string> text = readText(paths.resolver());
    if (!text)
        return text.reason();
    ResolverSettings out = parseResolverSettings(*text);
    if (!out.servers && out.servers.reason() == Absence::Filtered) {
        if (const auto behindStub = readText(paths.resolverBehindStub())) {
            const auto servers = parseResolverSettings(*behindStub).servers;
            if (servers)
                out.servers = servers;
        }
    }
    return out;
}

}  // namespace cimomd
