#pragma once

// The kinds of element that a qualifier may stand on (DSP0004, meta elements), as bits.

#include <cstdint>

namespace cimomd {

using QualifierScopes = std::uint32_t;

inline constexpr QualifierScopes kScopeClass = 1U << 0;
inline constexpr QualifierScopes kScopeAssociation = 1U << 1;
inline constexpr QualifierScopes kScopeIndication = 1U << 2;
inline constexpr QualifierScopes kScopeProperty = 1U << 3;
inline constexpr QualifierScopes kScopeReference = 1U << 4;
inline constexpr QualifierScopes kScopeMethod = 1U << 5;
inline constexpr QualifierScopes kScopeParameter = 1U << 6;
inline constexpr QualifierScopes kScopeSchema = 1U << 7;
inline constexpr QualifierScopes kScopeQualifier = 1U << 8;
inline constexpr QualifierScopes kScopeAny = (1U << 9) - 1;

}  // namespace cimomd
