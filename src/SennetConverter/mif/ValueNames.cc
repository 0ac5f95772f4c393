#include "SennetConverter/mif/ValueNames.h"

#include <algorithm>
#include <charconv>
#include <string>
#include <string_view>

#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

namespace {

constexpr std::size_t kMostCached = 64;

// The strings of a qualifier; none when its value is no array of strings or null.
Array<String> qualifierTexts(const CIMValue& value) {
    Array<String> texts;
    if (value.getType() == CIMTYPE_STRING && value.isArray()) {
        value.get(texts);
    }
    return texts;
}

// The number whose plain decimal form the text is; false for any other text.
bool parseDecimal(const String& text, Uint64& number) {
    const CString utf8 = text.getCString();
    const std::string_view digits(utf8);
    const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), number);
    return result.ec == std::errc() && digits == std::to_string(number);
}

}  // namespace

ValueNames::ValueNames(const Array<String>& theTexts, const Array<String>& theNumbers,
                       bool areMapped)
    : texts(theTexts), numbers(theNumbers), isMapped(areMapped) {
    const Array<String>& mapped = theNumbers;
    for (Uint32 i = 0; i < mapped.size(); ++i) {
        Uint64 number = 0;
        if (parseDecimal(mapped[i], number)) {
            positions.emplace(number, i);
        }
    }
}

String ValueNames::nameOf(Uint64 number) const {
    Uint64 position = number;
    if (isMapped) {
        const auto found = positions.find(number);
        position = found != positions.end() ? found->second : PEG_NOT_FOUND;
    }
    return position < texts.size() ? texts[static_cast<Uint32>(position)]
                                   : SennetUtilities::toUnsignedDecimal(number);
}

bool ValueNames::areMadeOf(const Array<String>& otherTexts, const Array<String>& otherNumbers,
                           bool otherIsMapped) const {
    return isMapped == otherIsMapped && texts.getData() == otherTexts.getData() &&
           numbers.getData() == otherNumbers.getData();
}

const ValueNames& ValueNamesCache::of(const CIMProperty& property, Uint32 values) {
    static const CIMName kValueMap("ValueMap");
    const CIMConstProperty& read = property;
    const Array<String> texts = qualifierTexts(read.getQualifier(values).getValue());
    Array<String> numbers;
    bool isMapped = false;
    const Uint32 map = read.findQualifier(kValueMap);
    if (map != PEG_NOT_FOUND) {
        const CIMValue value = read.getQualifier(map).getValue();
        isMapped = value.getType() == CIMTYPE_STRING;
        numbers = qualifierTexts(value);
    }
    const auto known = std::find_if(latest.begin(), latest.end(), [&](const ValueNames& names) {
        return names.areMadeOf(texts, numbers, isMapped);
    });
    if (known != latest.end()) {
        return *known;
    }
    if (latest.size() == kMostCached) {
        latest.pop_back();
    }
    return latest.emplace_front(texts, numbers, isMapped);
}

}  // namespace Pegasus
