// The syntax of key/value files (see PropertiesFile), apart from where their bytes come from.
#pragma once

#include <string>
#include <string_view>

#include "Velm/Properties.h"

namespace Velm {

class PropertiesParser {
  public:
    // Parses the bytes of a whole file; they must stay alive as long as this object.
    explicit PropertiesParser(std::string_view text);

    // The key/value set of the text. Every text is accepted.
    Properties parse();

  private:
    bool atEnd() const { return position >= text.size(); }
    std::string_view takeLine();
    std::string_view takeContinuedLine();

    std::string_view text;
    std::size_t position = 0;
    std::string joined;
};

}  // namespace Velm
