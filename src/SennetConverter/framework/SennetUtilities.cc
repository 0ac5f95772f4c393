#include "SennetConverter/framework/SennetUtilities.h"

#include <charconv>
#include <cstdlib>

namespace Pegasus {

namespace {

constexpr unsigned int kShorteningMargin = 5;
constexpr unsigned int kHashMargin = 8;
constexpr Sint32 kHashValues = 36 * 36 * 36;
constexpr int kMaxDigits = 4;

struct ReservedWord {
    const char* word;
    const char* replacement;
};

constexpr ReservedWord kReservedWords[] = {
    {"index", "indx"},
    {"size", "siz_"},
    {"resource", "resourc_"},
    {"level", "level_"},
};

Uint32 hashDigit(Uint16 character) {
    if (character >= 'a' && character <= 'z') {
        return character - 'a' + 10U;
    }
    if (character >= 'A' && character <= 'Z') {
        return character - 'A' + 10U;
    }
    if (character >= '0' && character <= '9') {
        return static_cast<Uint32>(character - '0');
    }
    return static_cast<Uint32>(-1);
}

// One to three base-36 digits without sign.
String hashSuffix(const String& name) {
    Uint32 hash = 0;
    for (Uint32 i = 0; i < name.size(); ++i) {
        hash = hash * 16 + hashDigit(name[i]);
    }
    const auto sum = static_cast<Sint32>(hash + name.size());
    char digits[kMaxDigits + 2];
    SennetUtilities::itoa(sum % kHashValues, digits, 36);
    return String(digits[0] == '-' ? digits + 1 : digits);
}

bool startsWith(const String& text, const String& prefix) {
    if (text.size() < prefix.size()) {
        return false;
    }
    for (Uint32 i = 0; i < prefix.size(); ++i) {
        if (!(text[i] == prefix[i])) {
            return false;
        }
    }
    return true;
}

bool isWhiteSpace(Uint16 character) {
    return character == ' ' || character == '\r' || character == '\t' || character == '\n';
}

template <typename Integer>
String decimalText(Integer number) {
    char digits[24];
    const char* const end = std::to_chars(digits, digits + sizeof digits, number).ptr;
    return String(digits, static_cast<Uint32>(end - digits));
}

void dropLast(String& text, char character) {
    if (text.size() > 0 && Uint16(text[text.size() - 1]) == Uint16(character)) {
        text.remove(text.size() - 1);
    }
}

}  // namespace

String SennetUtilities::convertString(String word) {
    String lower(word);
    lower.toLower();
    int match = -1;
    for (int i = 0; i < numSubstituteKeys; ++i) {
        if (startsWith(lower, substituteKeysArray[i])) {
            match = i;
        }
    }
    return match < 0 ? word : substituteValuesArray[match];
}

String SennetUtilities::substituteValues(String name) {
    String result;
    String remainder(name);
    for (Uint32 underscore = remainder.find('_'); underscore != PEG_NOT_FOUND;
         underscore = remainder.find('_')) {
        if (underscore > 0) {
            result.append(convertString(remainder.subString(0, underscore)));
            result.append(Char16('_'));
        }
        remainder = remainder.subString(underscore + 1);
    }
    result.append(convertString(remainder));
    if (result.size() > 0) {
        dropLast(result, '_');
        return result;
    }
    dropLast(name, '_');
    return name;
}

String SennetUtilities::hashString(String name, unsigned int maxLength) {
    if (name.size() > maxLength - kShorteningMargin) {
        const String suffix = hashSuffix(name);
        const unsigned int kept = maxLength - kHashMargin;
        name = (kept < name.size() ? name.subString(0, kept) : name) + suffix;
    }
    return replaceAll(name, ' ', '_');
}

String SennetUtilities::formatPropertyName4quvelle(String name, unsigned int maxLength) {
    for (const ReservedWord& reserved : kReservedWords) {
        if (String::equalNoCase(name, reserved.word)) {
            name = reserved.replacement;
            break;
        }
    }
    for (const char character : {' ', '(', ')'}) {
        name = replaceAll(name, character, '_');
    }
    return name.size() > maxLength ? name.subString(0, maxLength) : name;
}

void SennetUtilities::itoa(int value, char* buffer, int radix) {
    const auto base = static_cast<unsigned int>(radix);
    unsigned int rest = value < 0 ? 0U - static_cast<unsigned int>(value) : value;
    int digits = 1;
    for (unsigned int left = rest / base; left > 0 && digits < kMaxDigits; left /= base) {
        ++digits;
    }
    if (value < 0) {
        *buffer++ = '-';
    }
    buffer[digits] = '\0';
    for (int place = digits - 1; place >= 0; --place) {
        buffer[place] = "0123456789abcdefghijklmnopqrstuvwxyz"[rest % base];
        rest /= base;
    }
}

String SennetUtilities::toDecimal(Sint64 number) {
    return decimalText(number);
}

String SennetUtilities::toUnsignedDecimal(Uint64 number) {
    return decimalText(number);
}

String SennetUtilities::limitLength(const String& length) {
    constexpr long kLargest = 255;
    return std::strtol(length.getCString(), nullptr, 10) > kLargest ? String("255") : length;
}

String SennetUtilities::replaceAll(String text, char from, char to) {
    for (Uint32 i = text.find(Char16(from)); i != PEG_NOT_FOUND;
         i = text.find(i + 1, Char16(from))) {
        text[i] = Char16(to);
    }
    return text;
}

String SennetUtilities::trim(const String& text) {
    Uint32 begin = 0;
    Uint32 end = text.size();
    while (begin < end && isWhiteSpace(text[begin])) {
        ++begin;
    }
    while (end > begin && isWhiteSpace(text[end - 1])) {
        --end;
    }
    return text.subString(begin, end - begin);
}

String SennetUtilities::makeUnique(const String& name, const String& suffix,
                                   Array<String>& usedNames) {
    String unique(name);
    for (Uint32 i = 0; i < usedNames.size(); ++i) {
        if (String::equal(usedNames[i], name)) {
            unique.append(suffix);
            break;
        }
    }
    usedNames.append(unique);
    return unique;
}

}  // namespace Pegasus
