#include "system/devices/Edid.h"

#include <cstdlib>

#include "system/computer/FirmwareText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

constexpr std::size_t kBlockBytes = 128;
constexpr std::string_view kHead("\x00\xFF\xFF\xFF\xFF\xFF\xFF\x00", 8);

// Places in the block.
constexpr std::size_t kMaker = 8;
constexpr std::size_t kProduct = 10;
constexpr std::size_t kSerial = 12;
constexpr std::size_t kWeek = 16;
constexpr std::size_t kYear = 17;
constexpr std::size_t kRevision = 19;
constexpr std::size_t kInput = 20;
constexpr std::size_t kWidthCentimetres = 21;
constexpr std::size_t kHeightCentimetres = 22;
constexpr std::size_t kFeatures = 24;
constexpr std::size_t kFirstDescriptor = 54;
constexpr std::size_t kDescriptorBytes = 18;
constexpr std::size_t kDescriptors = 4;

// Kinds of descriptors that are no timing.
constexpr unsigned kNameDescriptor = 0xFC;
constexpr unsigned kRangeDescriptor = 0xFD;
constexpr unsigned kTextDescriptor = 0xFE;
constexpr unsigned kSerialDescriptor = 0xFF;
constexpr std::size_t kDescriptorText = 5;

constexpr std::uint8_t kLastWeek = 54;
// In the place of the week: the year is the model's.
constexpr unsigned kModelYearMark = 255;
constexpr unsigned kFirstYear = 1990;
// The first structure was published in 1994; years before it are fields nobody filled in.
constexpr unsigned kLeastYearByte = 4;
// Some makers write 1, 1, 1, 1 where a serial number belongs.
constexpr std::uint32_t kNoSerialNumber = 0x01010101;

unsigned byteAt(std::string_view bytes, std::size_t place) {
    return static_cast<unsigned char>(bytes[place]);
}

bool isWholeBlock(std::string_view bytes) {
    if (bytes.size() < kBlockBytes || bytes.substr(0, kHead.size()) != kHead)
        return false;
    unsigned sum = 0;
    for (std::size_t i = 0; i < kBlockBytes; ++i)
        sum += byteAt(bytes, i);
    return sum % 256 == 0;
}

/// Three letters of five bits each, A being 1.
Fact<std::string> makerCodeOf(std::string_view block) {
    const unsigned packed = byteAt(block, kMaker) << 8 | byteAt(block, kMaker + 1);
    std::string code;
    for (const unsigned shift : {10U, 5U, 0U}) {
        const unsigned letter = packed >> shift & 0x1F;
        if (letter == 0 || letter > 26)
            return Absence::Filtered;
        code += static_cast<char>('A' + letter - 1);
    }
    return code;
}

Fact<std::string> serialNumberOf(std::string_view block) {
    std::uint32_t number = 0;
    for (std::size_t i = 4; i-- > 0;)
        number = number << 8 | byteAt(block, kSerial + i);
    if (number == 0)
        return Absence::Absent;
    if (number == kNoSerialNumber)
        return Absence::Filtered;
    return withoutPlaceholder(std::to_string(number));
}

Fact<std::uint8_t> weekOf(std::string_view block) {
    const unsigned week = byteAt(block, kWeek);
    if (week == 0 || week > kLastWeek)
        return Absence::Absent;
    return static_cast<std::uint8_t>(week);
}

bool hasModelYear(std::string_view block) {
    return byteAt(block, kWeek) == kModelYearMark;
}

Fact<std::uint16_t> yearOf(std::string_view block) {
    const unsigned year = byteAt(block, kYear);
    if (year < kLeastYearByte)
        return Absence::Filtered;
    return static_cast<std::uint16_t>(kFirstYear + year);
}

Fact<bool> colourOf(std::string_view block) {
    const bool isDigital = (byteAt(block, kInput) & 0x80) != 0;
    // Digital ones of structure 1.4 have their colour encodings in the place of the type.
    if (isDigital && byteAt(block, kRevision) >= 4)
        return true;
    const unsigned type = byteAt(block, kFeatures) >> 3 & 3;
    if (type == 3)
        return Absence::Absent;
    return type != 0;
}

/// The text of a descriptor: up to 13 characters, a line feed before the end, then blanks.
std::string textOf(std::string_view descriptor) {
    const std::string_view text = descriptor.substr(kDescriptorText);
    return std::string(trimmed(text.substr(0, text.find('\n'))));
}

bool hasRange(std::string_view descriptor) {
    const unsigned offsets = byteAt(descriptor, 4);
    const auto differs = [descriptor](std::size_t place, unsigned bits) {
        const unsigned least = byteAt(descriptor, place) + ((bits & 3) == 3 ? 255 : 0);
        const unsigned most = byteAt(descriptor, place + 1) + ((bits & 2) != 0 ? 255 : 0);
        return least < most;
    };
    return differs(5, offsets) || differs(7, offsets >> 2);
}

void readOtherDescriptor(Edid& out, std::string_view descriptor) {
    switch (byteAt(descriptor, 3)) {
        case kNameDescriptor:
            out.name = withoutPlaceholder(textOf(descriptor));
            break;
        case kSerialDescriptor:
            if (const auto serial = withoutPlaceholder(textOf(descriptor)))
                out.serialNumber = serial;
            break;
        case kTextDescriptor:
            if (const auto text = withoutPlaceholder(textOf(descriptor)))
                out.texts.push_back(*text);
            break;
        case kRangeDescriptor:
            out.hasFrequencyRange = hasRange(descriptor);
            break;
        default:
            break;
    }
}

/// The timing's size when it agrees with the rounded one: else it is a ratio of the sides.
Fact<std::uint32_t> millimetresOf(unsigned timingMillimetres, unsigned centimetres) {
    if (centimetres == 0)
        return Absence::Absent;
    const int rounded = static_cast<int>(centimetres) * 10;
    if (std::abs(static_cast<int>(timingMillimetres) - rounded) <= 10)
        return timingMillimetres;
    return static_cast<std::uint32_t>(rounded);
}

void readPreferredTiming(Edid& out, std::string_view timing) {
    const unsigned width = byteAt(timing, 2) | (byteAt(timing, 4) & 0xF0) << 4;
    const unsigned fieldHeight = byteAt(timing, 5) | (byteAt(timing, 7) & 0xF0) << 4;
    const bool isInterlaced = (byteAt(timing, 17) & 0x80) != 0;
    if (width == 0 || fieldHeight == 0)
        return;
    out.widthPixels = width;
    out.heightPixels = isInterlaced ? 2 * fieldHeight : fieldHeight;
}

void readSize(Edid& out, std::string_view block, std::string_view timing) {
    const unsigned width = byteAt(block, kWidthCentimetres);
    const unsigned height = byteAt(block, kHeightCentimetres);
    // With one of them 0 the other is the ratio of the sides.
    if (width == 0 || height == 0)
        return;
    out.widthMillimetres =
        millimetresOf(byteAt(timing, 12) | (byteAt(timing, 14) & 0xF0) << 4, width);
    out.heightMillimetres =
        millimetresOf(byteAt(timing, 13) | (byteAt(timing, 14) & 0x0F) << 8, height);
}

bool isTiming(std::string_view descriptor) {
    return byteAt(descriptor, 0) != 0 || byteAt(descriptor, 1) != 0;
}

void readDescriptors(Edid& out, std::string_view block) {
    for (std::size_t i = 0; i < kDescriptors; ++i) {
        const std::string_view descriptor =
            block.substr(kFirstDescriptor + i * kDescriptorBytes, kDescriptorBytes);
        if (!isTiming(descriptor))
            readOtherDescriptor(out, descriptor);
        else if (i == 0)
            readPreferredTiming(out, descriptor);
    }
}

}  // namespace

std::optional<Edid> parseEdid(std::string_view bytes) {
    if (!isWholeBlock(bytes))
        return std::nullopt;
    const std::string_view block = bytes.substr(0, kBlockBytes);
    Edid out;
    out.makerCode = makerCodeOf(block);
    out.productCode =
        static_cast<std::uint16_t>(byteAt(block, kProduct) | byteAt(block, kProduct + 1) << 8);
    out.serialNumber = serialNumberOf(block);
    (hasModelYear(block) ? out.modelYear : out.year) = yearOf(block);
    out.week = weekOf(block);
    out.isColour = colourOf(block);
    readSize(out, block, block.substr(kFirstDescriptor, kDescriptorBytes));
    readDescriptors(out, block);
    return out;
}

}  // namespace cimomd
