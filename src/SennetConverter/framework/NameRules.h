#pragma once

// What becomes of titles and property names before a product's own rules.

#include <Pegasus/Common/String.h>
#include <Velm/Properties.h>

namespace Pegasus {

/// The longest names of the databases of QVE, and of its Lumo database.
inline constexpr unsigned int kLongestName = 30;
inline constexpr unsigned int kLongestLumoName = 18;

/// Display text of a property: what the resource properties have under "section.property" (or
/// "property" when the section is empty) with blanks in the name as "_", else the name itself;
/// trimmed.
String translatedPropertyName(const Velm::Properties& texts, const String& section,
                              const String& propertyName);

/// What the resource properties have under "title." and the title with blanks as "_", else the
/// title so written; untrimmed.
String translatedTitle(const Velm::Properties& texts, const String& title);

}  // namespace Pegasus
