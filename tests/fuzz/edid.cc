// Any bytes as what a monitor tells of itself: values a monitor can have, and an instance of them.
// Few bytes of chance have the right sum, so that the last one is also tried with it corrected.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>

#include "Require.h"
#include "providers/devices/DesktopMonitorProvider.h"
#include "system/devices/Edid.h"

namespace {

constexpr std::size_t kBlockBytes = 128;
constexpr std::size_t kDescriptors = 4;
constexpr std::size_t kTextCharacters = 13;

void checkValues(const cimomd::Edid& edid) {
    require(!edid.makerCode || edid.makerCode->size() == 3);
    require(!edid.year || (*edid.year >= 1994 && *edid.year <= 2245));
    require(!edid.week || (*edid.week >= 1 && *edid.week <= 54));
    require(!edid.widthPixels || (*edid.widthPixels >= 1 && *edid.widthPixels <= 4095));
    require(!edid.heightPixels || (*edid.heightPixels >= 1 && *edid.heightPixels <= 8190));
    require(!edid.widthMillimetres || *edid.widthMillimetres <= 2560);
    require(!edid.heightMillimetres || *edid.heightMillimetres <= 2560);
    require(edid.texts.size() <= kDescriptors);
    for (const std::string& text : edid.texts) {
        require(!text.empty() && text.size() <= kTextCharacters);
    }
}

void check(const std::string& bytes) {
    const auto edid = cimomd::parseEdid(bytes);
    if (!edid) {
        return;
    }
    checkValues(*edid);
    cimomd::DesktopMonitorProvider::publish("host", {"card0-DP-1", true, *edid});
}

std::string withRightSum(std::string bytes) {
    bytes.resize(kBlockBytes);
    std::fill_n(bytes.begin(), 8, '\xFF');
    bytes[0] = bytes[7] = bytes.back() = '\0';
    unsigned sum = 0;
    for (const char byte : bytes) {
        sum += static_cast<unsigned char>(byte);
    }
    bytes.back() = static_cast<char>(256 - sum % 256);
    return bytes;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(reinterpret_cast<const char*>(data), size);
    check(bytes);
    const std::string corrected = withRightSum(bytes);
    require(cimomd::parseEdid(corrected).has_value());
    check(corrected);
    return 0;
}
