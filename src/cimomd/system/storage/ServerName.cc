#include "system/storage/ServerName.h"

namespace cimomd {
namespace {

Fact<std::string> orNothing(std::string_view name) {
    const bool isName = !name.empty() && name.find('/') == std::string_view::npos;
    return isName ? Fact<std::string>(std::string(name)) : Fact<std::string>();
}

std::string_view withoutUser(std::string_view source) {
    const std::size_t at = source.substr(0, source.find_first_of(":/")).rfind('@');
    return at == std::string_view::npos ? source : source.substr(at + 1);
}

}  // namespace

Fact<std::string> serverNameOf(const Mount& mount) {
    std::string_view source = mount.source;
    if (source.substr(0, 2) == "//") {
        source.remove_prefix(2);
        return orNothing(source.substr(0, source.find('/')));
    }
    source = withoutUser(source);
    if (source.substr(0, 1) == "[") {
        const std::size_t end = source.find("]:");
        return end == std::string_view::npos ? Fact<std::string>()
                                             : orNothing(source.substr(1, end - 1));
    }
    // An address of IPv6 without brackets has colons itself: the directory begins with a slash.
    const std::size_t directory = source.find(":/");
    const std::size_t end = directory != std::string_view::npos ? directory : source.find(':');
    return end == std::string_view::npos ? Fact<std::string>() : orNothing(source.substr(0, end));
}

}  // namespace cimomd
