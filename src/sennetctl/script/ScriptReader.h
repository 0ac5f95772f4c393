#pragma once

// Reads an inventory script by the generator's rules and tells every line that these pass over in
// silence.

#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "report/Finding.h"
#include "script/ScriptModel.h"

namespace sennetctl {

class ScriptReader {
  public:
    /// Findings are appended to `findings`, which must outlive the reader.
    ScriptReader(const std::string& file, std::vector<Finding>& findings);

    /// To be called once, with the octets of the whole file.
    ScriptModel read(std::string_view octets);

  private:
    enum class Section { None, Default, Cim };

    void readLine(std::string_view line);
    void readHeader(std::string_view line);
    bool isReadable(std::string_view line);
    void readDefault(const std::string& line);
    void readCim(const std::string& line);
    void explainCim(const std::string& line, const std::vector<std::string>& tokens);
    void storeCim(const std::string& line, const std::vector<std::string>& tokens);
    void tellBlank(const ScriptText& entry, const std::vector<std::string>& tokens);
    void store(ScriptText& text, const std::string& line, const std::string& value,
               const std::string& what);
    void addToEntry(const ScriptText& entry, Severity severity, const std::string& message,
                    std::size_t column = 1);
    void tellEntries();
    void addWithoutEffect(const std::string& reason);
    void add(Severity severity, const std::string& message, std::size_t column = 1);

    std::vector<Finding>& findings;
    ScriptModel model;
    std::map<const ScriptText*, std::vector<Finding>>
        entryFindings;  // a later line takes them back
    Section section = Section::None;
    bool isHeaderLost = false;  // what is meant for the next section is in this one
    unsigned lineNumber = 0;
};

}  // namespace sennetctl
