#include "script/PropertiesLint.h"

#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <iterator>
#include <map>
#include <optional>
#include <system_error>

#include "properties/PropertiesEntries.h"
#include "report/Text.h"
#include "report/WholeFile.h"
#include "script/OutputCheck.h"
#include "script/ScriptText.h"
#include "script/ServiceCheck.h"
#include "utf8/Utf8.h"

namespace sennetctl {

namespace {

using Velm::PropertiesEntry;

constexpr std::string_view kTitle = "title.";
constexpr std::string_view kSize = ".Size";

bool isUtf8(std::string_view text) {
    for (std::size_t i = 0; i < text.size();) {
        const std::size_t length = utf8::characterLength(text.substr(i));
        if (length == 0) {
            return false;
        }
        i += length;
    }
    return true;
}

bool hasBlank(std::string_view text) {
    return text.find_first_of(" \t") != std::string_view::npos;
}

/// What somebody probably did not mean by a path, which is taken to the letter. Empty ones stand
/// for the default.
std::vector<std::string> pathFaults(const std::string& path) {
    std::vector<std::string> faults;
    std::string meant = path;
    const auto strip = [&](const std::string& text, const char* reason) {
        if (text != meant) {
            meant = text;
            faults.push_back(std::string(reason) + " to the path: write " + meant);
        }
    };
    strip(meant.substr(0, std::min(meant.find(" #"), meant.find("\t#"))),
          "a comment has a line of its own, here it belongs");
    strip(trimmed(meant), "blanks at its ends belong");
    const std::size_t first = meant.find_first_not_of("\"'");
    if (first != std::string::npos) {
        strip(meant.substr(first, meant.find_last_not_of("\"'") - first + 1), "quotes belong");
    }
    // What is told last is all of it.
    if (faults.size() > 1) {
        faults.erase(faults.begin(), faults.end() - 1);
    }
    if (!meant.empty() && meant[0] != '/') {
        faults.emplace_back(
            "a relative path: sennet takes it from the directory that it is started in");
    }
    return faults;
}

class PropertiesLint {
  public:
    PropertiesLint(const std::string& theFile, std::vector<Finding>& theFindings)
        : file(theFile), findings(theFindings) {}

    /// What holds for every such file; `check` is called with each entry that has a key and that no
    /// later one replaces.
    template <typename Check>
    void run(std::string_view octets, Check check) {
        if (octets.substr(0, 2) == "\xFE\xFF" || octets.substr(0, 2) == "\xFF\xFE") {
            add(Severity::Error, 1, 1,
                "UTF-16, of which sennet understands nothing: save it as "
                "UTF-8");
            return;
        }
        const std::map<std::string, PropertiesEntry> last = Velm::lastEntriesIn(octets);
        Velm::PropertiesEntries entries(octets);
        while (const std::optional<PropertiesEntry> entry = entries.next()) {
            const bool isReplaced = entry->line < last.at(entry->key).line;
            if (!isReplaced) {
                noteEncoding(*entry);
            }
            if (entry->key.empty()) {
                add(Severity::Warning, entry->line, entry->keyColumn,
                    "line without effect: it has no key");
                continue;
            }
            tellReplaced(*entry);
            if (!isReplaced) {
                check(*entry);
            }
        }
        tellEncoding();
    }

    void checkPlace(const PropertiesEntry& entry) {
        static constexpr const char* kKeys[] = {
            "sennet.directory",  "sennet.resources", "mif.directory",
            "mif.directory.SMS", "mif.directory.LD", "mif.directory.CA",
            "mif.directory.QVE", "sql.directory",    "sql.directory.QVE"};
        if (std::find(std::begin(kKeys), std::end(kKeys), entry.key) == std::end(kKeys)) {
            atKey(entry, "line without effect: unknown key " + entry.key);
        } else if (!entry.hasSeparator) {
            atKey(entry, "no '=' behind the key, so the default is taken");
        } else {
            for (const std::string& fault : pathFaults(entry.value)) {
                add(Severity::Warning, entry.line, entry.valueColumn, fault);
            }
        }
    }

    void checkText(const PropertiesEntry& entry) {
        if (const char* fault = faultOf(entry.key)) {
            atKey(entry, std::string("line without effect: ") + fault);
        } else if (!entry.hasSeparator) {
            atKey(entry, "no '=' behind the key, so an empty text is written");
        } else if (isSize(entry.key)) {
            checkSize(entry);
        } else if (trimmed(entry.value).empty()) {
            add(Severity::Warning, entry.line, entry.valueColumn, "an empty text is written");
        }
    }

  private:
    static auto dotsIn(std::string_view key) { return std::count(key.begin(), key.end(), '.'); }

    /// A property may be called Size, too.
    static bool isSize(std::string_view key) {
        return key.substr(0, kTitle.size()) != kTitle && dotsIn(key) == 2 &&
               key.substr(key.rfind('.')) == kSize;
    }

    /// Why sennet never looks for the key; null when it may.
    static const char* faultOf(std::string_view key) {
        const std::string_view beginning = key.substr(0, kTitle.size());
        if (beginning == kTitle) {
            return hasBlank(key) ? "the key has _ for each blank of the title" : nullptr;
        }
        if (sameIgnoringCase(beginning, kTitle)) {
            return "the key begins with title. in small letters";
        }
        if (dotsIn(key) == 2 && !isSize(key) &&
            sameIgnoringCase(key.substr(key.rfind('.')), kSize)) {
            return "the key ends in .Size with a capital S";
        }
        if (hasBlank(key) || dotsIn(key) != (isSize(key) ? 2 : 1)) {
            return "a key is title.TITLE, CLASS.PROPERTY or CLASS.PROPERTY.Size";
        }
        return nullptr;
    }

    void checkSize(const PropertiesEntry& entry) {
        constexpr std::size_t kMostDigits = 18;  // below 64 bits
        constexpr long kLargest = 255;
        const std::string size = trimmed(entry.value);
        const bool isNumber = !size.empty() && size.size() <= kMostDigits &&
                              size.find_first_not_of("0123456789") == std::string::npos;
        const long number = isNumber ? std::strtol(size.c_str(), nullptr, 10) : 0;
        if (number == 0) {
            add(Severity::Error, entry.line, entry.valueColumn,
                "the size '" + size + "' is written as it is: readers refuse a MIF file with " +
                    "String(" + size + "), and databases the table");
        } else if (size[0] == '0') {
            add(Severity::Warning, entry.line, entry.valueColumn,
                "the size " + size + " is written as it is, and octal in a MIF file: write " +
                    std::to_string(number));
        } else if (number > kLargest) {
            add(Severity::Warning, entry.line, entry.valueColumn,
                "the size " + size + " is more than is used: texts end at 255 characters");
        }
    }

    void tellReplaced(const PropertiesEntry& entry) {
        const auto [known, isNew] = lineOfKey.try_emplace(entry.key, entry.line);
        if (!isNew) {
            // To append is a way to change a shipped file.
            add(Severity::Note, entry.line, entry.keyColumn,
                "replaces " + entry.key + " of line " + std::to_string(known->second));
            known->second = entry.line;
        }
    }

    void noteEncoding(const PropertiesEntry& entry) {
        const bool isValueWrong = !isUtf8(entry.value);
        if (isUtf8(entry.key) && !isValueWrong) {
            return;
        }
        if (++wrongEntries == 1) {
            firstWrong = {file, entry.line, isValueWrong ? entry.valueColumn : entry.keyColumn,
                          Severity::Warning, ""};
        }
    }

    // A file in another encoding has them all over.
    void tellEncoding() {
        if (wrongEntries > 0) {
            firstWrong.message =
                "octets that are not UTF-8: sennet takes each for U+FFFD" +
                (wrongEntries > 1 ? ", here and in " + counted(wrongEntries - 1, "later line")
                                  : std::string());
            findings.push_back(firstWrong);
        }
    }

    void atKey(const PropertiesEntry& entry, const std::string& message) {
        add(Severity::Warning, entry.line, entry.keyColumn, message);
    }

    // A file of another kind may have a fault in each of some million lines.
    void add(Severity severity, unsigned line, unsigned column, const std::string& message) {
        constexpr std::size_t kMostFindings = 1000;
        if (count < kMostFindings) {
            findings.push_back({file, line, column, severity, message});
        } else if (count == kMostFindings) {
            findings.push_back({file, line, column, Severity::Warning,
                                "from here on the file has faults that are not told"});
        }
        ++count;
    }

    const std::string& file;
    std::vector<Finding>& findings;
    std::map<std::string, unsigned> lineOfKey;
    std::size_t count = 0;  // of findings
    std::size_t wrongEntries = 0;
    Finding firstWrong;
};

/// None when the file cannot be read; then that is told.
std::optional<std::string> octetsOf(const std::string& file, const std::string& consequence,
                                    std::vector<Finding>& findings) {
    try {
        return readWholeFile(file);
    } catch (const CannotRun& failure) {
        const std::string reason = std::string(failure.what()).substr(file.size() + 2);
        findings.push_back({file, 0, 0, Severity::Error, reason + ": " + consequence});
        return std::nullopt;
    }
}

}  // namespace

void checkConfiguration(const Places& places, std::vector<Finding>& findings) {
    std::error_code error;
    if (!places.isConfigured && !std::filesystem::exists(places.configuration, error) && !error) {
        return;
    }
    if (const std::optional<std::string> octets =
            octetsOf(places.configuration, "sennet takes its default places", findings)) {
        checkConfigurationText(places.configuration, *octets, findings);
        checkOutputDirectories(places.configuration, *octets, findings);
        // Only root reads all that the service's rules depend on; and what VELM_CONFIG names is not
        // the service's configuration.
        if (::geteuid() == 0 && !places.isConfigured) {
            checkServiceOutput(places.configuration, *octets, askServiceRules, findings);
        }
    }
}

std::optional<std::string> checkResources(const Places& places, std::vector<Finding>& findings) {
    std::optional<std::string> octets = octetsOf(
        places.resources, "sennet shows titles and properties as the scripts have them", findings);
    if (octets) {
        checkResourcesText(places.resources, *octets, findings);
    }
    return octets;
}

void checkConfigurationText(const std::string& file, std::string_view octets,
                            std::vector<Finding>& findings) {
    PropertiesLint lint(file, findings);
    lint.run(octets, [&](const PropertiesEntry& entry) { lint.checkPlace(entry); });
}

void checkResourcesText(const std::string& file, std::string_view octets,
                        std::vector<Finding>& findings) {
    PropertiesLint lint(file, findings);
    lint.run(octets, [&](const PropertiesEntry& entry) { lint.checkText(entry); });
}

}  // namespace sennetctl
