#include "mof/MofWords.h"

#include <array>

#include "text/Utf8.h"

namespace cimomd {
namespace {

struct NamedType {
    std::string_view name;
    Pegasus::CIMType type;
};

constexpr std::array<NamedType, 14> kTypes{{
    {"boolean", Pegasus::CIMTYPE_BOOLEAN},
    {"uint8", Pegasus::CIMTYPE_UINT8},
    {"sint8", Pegasus::CIMTYPE_SINT8},
    {"uint16", Pegasus::CIMTYPE_UINT16},
    {"sint16", Pegasus::CIMTYPE_SINT16},
    {"uint32", Pegasus::CIMTYPE_UINT32},
    {"sint32", Pegasus::CIMTYPE_SINT32},
    {"uint64", Pegasus::CIMTYPE_UINT64},
    {"sint64", Pegasus::CIMTYPE_SINT64},
    {"real32", Pegasus::CIMTYPE_REAL32},
    {"real64", Pegasus::CIMTYPE_REAL64},
    {"char16", Pegasus::CIMTYPE_CHAR16},
    {"string", Pegasus::CIMTYPE_STRING},
    {"datetime", Pegasus::CIMTYPE_DATETIME},
}};

struct NamedScope {
    std::string_view name;
    QualifierScopes scope;
};

constexpr std::array<NamedScope, 10> kScopes{{
    {"class", kScopeClass},
    {"association", kScopeAssociation},
    {"indication", kScopeIndication},
    {"property", kScopeProperty},
    {"reference", kScopeReference},
    {"method", kScopeMethod},
    {"parameter", kScopeParameter},
    {"schema", kScopeSchema},
    {"qualifier", kScopeQualifier},
    {"any", kScopeAny},
}};

struct NamedFlavor {
    std::string_view name;
    FlavorWord word;
};

constexpr std::array<NamedFlavor, 7> kFlavors{{
    {"EnableOverride", FlavorWord::EnableOverride},
    {"DisableOverride", FlavorWord::DisableOverride},
    {"ToSubclass", FlavorWord::ToSubclass},
    {"Restricted", FlavorWord::Restricted},
    {"Translatable", FlavorWord::Translatable},
    {"ToInstance", FlavorWord::Ignored},
    {"Amended", FlavorWord::Ignored},
}};

/// The entry of that name in one of the tables above, or null.
template <typename Table>
auto findNamed(const Table& table, std::string_view name) -> const typename Table::value_type* {
    for (const auto& entry : table) {
        if (equalsIgnoringCase(entry.name, name))
            return &entry;
    }
    return nullptr;
}

}  // namespace

std::optional<Pegasus::CIMType> typeNamed(std::string_view word) {
    const NamedType* found = findNamed(kTypes, word);
    return found == nullptr ? std::nullopt : std::optional(found->type);
}

std::optional<QualifierScopes> scopeNamed(std::string_view word) {
    const NamedScope* found = findNamed(kScopes, word);
    return found == nullptr ? std::nullopt : std::optional(found->scope);
}

std::optional<FlavorWord> flavorNamed(std::string_view word) {
    const NamedFlavor* found = findNamed(kFlavors, word);
    return found == nullptr ? std::nullopt : std::optional(found->word);
}

}  // namespace cimomd
