// The rules that make names, beside a second and plain writing of each.

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "FuzzBytes.h"
#include "Require.h"
#include "SennetConverter/framework/SennetUtilities.h"

namespace {

using namespace Pegasus;

// Word, abbreviation, word, abbreviation, ...
constexpr std::string_view kAbbreviations =
    "activation ACTIV address ADDR administrator ADMIN architecture ARCH available AVAIL block BLK "
    "bridge BRG change CHG component COMP config CFG connections CONX console CONS controller "
    "CNTRL "
    "conventional CONV coprocessor COPROC description DESCRIP device DEV directory DIR "
    "distribution DIST drive DRV driver DRV drivers DRVS faxmodem FMODEM filepack FPACK "
    "filesystem FILESYS floppydrive FLPY_DRV harddisk HDISK hardware HWARE history HIST "
    "installation INSTL installed INST internet INET interrupt INT kernel KRNL language LANG "
    "lastscan LSCAN logicaldrive LOG_DRV memory MEM netware NWARE network NET number NUM "
    "platform PLTFRM profile PRFL relationship REL resolution RES restrict RSTRT rwoptical RWOPT "
    "security SEC serial SER serialnumber SERNUM service SVC signature SIG software SW start ST "
    "support SUPP system SYS systems SYS version VER video VID virtual VIRT volume VOL "
    "volumelabel VOLLABEL";

using Text = std::u16string;

Text textOf(const String& string) {
    Text text;
    for (Uint32 i = 0; i < string.size(); ++i) {
        text += static_cast<char16_t>(Uint16{string[i]});
    }
    return text;
}

Text wide(std::string_view ascii) {
    return Text(ascii.begin(), ascii.end());
}

std::vector<Text> split(const Text& text, char16_t separator) {
    std::vector<Text> parts(1);
    for (const char16_t c : text) {
        if (c == separator) {
            parts.emplace_back();
        } else {
            parts.back() += c;
        }
    }
    return parts;
}

Text lower(Text text) {
    for (char16_t& c : text) {
        c = c >= 'A' && c <= 'Z' ? static_cast<char16_t>(c + 'a' - 'A') : c;
    }
    return text;
}

Text replaced(Text text, std::u16string_view characters) {
    for (char16_t& c : text) {
        c = characters.find(c) != std::u16string_view::npos ? u'_' : c;
    }
    return text;
}

// The longest word that the name begins with.
Text abbreviated(const Text& name) {
    static const std::vector<Text> words = split(wide(kAbbreviations), ' ');
    std::size_t longest = 0;
    Text result = name;
    for (std::size_t i = 0; i < words.size(); i += 2) {
        if (lower(name).starts_with(words[i]) && words[i].size() > longest) {
            longest = words[i].size();
            result = words[i + 1];
        }
    }
    return result;
}

Text allAbbreviated(const Text& name) {
    Text result;
    for (const Text& word : split(name, '_')) {
        if (!word.empty()) {
            result += (result.empty() ? u"" : u"_") + abbreviated(word);
        }
    }
    if (result.empty() && !name.empty()) {
        result = name.substr(0, name.size() - 1);
    }
    return result;
}

std::uint32_t digit(char16_t c) {
    static const Text digits = u"0123456789abcdefghijklmnopqrstuvwxyz";
    return static_cast<std::uint32_t>(digits.find(lower(Text(1, c))));
}

Text inBase36(unsigned number) {
    Text digits;
    do {
        digits.insert(0, 1, u"0123456789abcdefghijklmnopqrstuvwxyz"[number % 36]);
        number /= 36;
    } while (number != 0);
    return digits;
}

Text hashed(const Text& name, unsigned maxLength) {
    if (maxLength < 5 || name.size() + 5 <= maxLength) {
        return replaced(name, u" ");
    }
    std::uint32_t hash = 0;
    for (const char16_t c : name) {
        hash = (hash << 4) + digit(c);
    }
    const auto sum = static_cast<std::int32_t>(hash + name.size());
    const std::int64_t remainder = std::int64_t{sum} % 46656;
    // Below 8 the kept length wraps, as an unsigned difference does, and all is kept.
    const std::size_t kept = maxLength < 8 ? name.size() : maxLength - 8;
    return replaced(name.substr(0, kept) + inBase36(static_cast<unsigned>(std::abs(remainder))),
                    u" ");
}

Text columnName(const Text& name, unsigned maxLength) {
    Text result = name;
    if (lower(name) == u"index") {
        result = u"indx";
    } else if (lower(name) == u"size") {
        result = u"siz_";
    } else if (lower(name) == u"resource") {
        result = u"resourc_";
    } else if (lower(name) == u"level") {
        result = u"level_";
    }
    return replaced(result, u" ()").substr(0, maxLength);
}

Text trimmed(Text text) {
    const std::u16string_view blanks = u" \r\t\n";
    while (!text.empty() && blanks.find(text.front()) != std::u16string_view::npos) {
        text.erase(0, 1);
    }
    while (!text.empty() && blanks.find(text.back()) != std::u16string_view::npos) {
        text.pop_back();
    }
    return text;
}

// Sign and the lowest four digits.
std::string inRadix(std::int64_t number, int radix) {
    std::string digits;
    for (std::int64_t rest = std::abs(number); digits.size() < 4; rest /= radix) {
        digits.insert(0, 1, "0123456789abcdefghijklmnopqrstuvwxyz"[rest % radix]);
        if (rest < radix) {
            break;
        }
    }
    return (number < 0 ? "-" : "") + digits;
}

void compareNames(const String& name, unsigned maxLength) {
    const Text text = textOf(name);
    require(textOf(SennetUtilities::convertString(name)) == abbreviated(text));
    require(textOf(SennetUtilities::substituteValues(name)) == allAbbreviated(text));
    require(textOf(SennetUtilities::hashString(name, maxLength)) == hashed(text, maxLength));
    require(textOf(SennetUtilities::formatPropertyName4quvelle(name, maxLength)) ==
            columnName(text, maxLength));
    require(textOf(SennetUtilities::trim(name)) == trimmed(text));
}

void compareNumbers(int number, int radix) {
    char buffer[6];
    SennetUtilities::itoa(number, buffer, radix);
    require(buffer == inRadix(number, radix));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    FuzzBytes bytes(data, size);
    compareNumbers(bytes.number<int>(), 2 + static_cast<int>(bytes.below(35)));
    const unsigned maxLength = bytes.below(64);
    const std::string_view text = bytes.text(255);
    String name;
    try {
        name = String(text.data(), static_cast<Uint32>(text.size()));
    } catch (const Exception&) {
        return 0;
    }
    compareNames(name, maxLength);
    return 0;
}
