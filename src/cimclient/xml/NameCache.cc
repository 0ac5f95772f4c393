#include "xml/NameCache.h"

#include "xml/ScalarParser.h"

namespace Pegasus {

const CIMName* NameCache::find(std::string_view utf8) {
    const auto known = names.find(utf8);
    if (known != names.end()) {
        return &known->second;
    }
    const String text = makeString(utf8);
    if (!CIMName::legal(text)) {
        return nullptr;
    }
    return &names.emplace(utf8, CIMName(text)).first->second;
}

}  // namespace Pegasus
