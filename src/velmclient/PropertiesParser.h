// What becomes of the entries of key/value files (see PropertiesFile).
#pragma once

#include <string_view>

#include "Velm/Properties.h"
#include "properties/PropertiesEntries.h"

namespace Velm {

class PropertiesParser {
  public:
    // Parses the bytes of a whole file; they must stay alive as long as this object.
    explicit PropertiesParser(std::string_view text) : entries(text) {}

    // The key/value set of the text, to be called once. Every text is accepted.
    Properties parse();

  private:
    PropertiesEntries entries;
};

}  // namespace Velm
