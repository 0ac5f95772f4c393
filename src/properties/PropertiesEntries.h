// The syntax of key/value files (see Velm::PropertiesFile), apart from where their bytes come from
// and from what becomes of the keys.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <string_view>

namespace Velm {

struct PropertiesEntry {
    std::string key;
    std::string value;
    // Counted from 1, the columns in bytes; a value on another line than its key has the key's.
    unsigned line = 0;
    unsigned keyColumn = 0;
    unsigned valueColumn = 0;
    bool hasSeparator = false;  // without one the value is empty
};

class PropertiesEntries {
  public:
    // Reads the bytes of a whole file; they must stay alive as long as this object.
    explicit PropertiesEntries(std::string_view text);

    // The entries of the text in their order, then nothing. Every text is accepted.
    std::optional<PropertiesEntry> next();

  private:
    struct FirstLine {
        unsigned number = 0;
        unsigned column = 0;        // where its text begins
        std::size_t valuesEnd = 0;  // a value that begins before it, counted from there, is on it
    };

    bool atEnd() const { return position >= text.size(); }
    std::string_view takeLine();
    std::string_view takeContinuedLine();
    PropertiesEntry entryOf(std::string_view line) const;

    std::string_view text;
    std::size_t position = 0;
    std::string joined;
    unsigned lineNumber = 0;
    FirstLine firstLine;  // of the entry
};

// The entries of the text that count, which are the last ones of their keys.
std::map<std::string, PropertiesEntry> lastEntriesIn(std::string_view text);

}  // namespace Velm
