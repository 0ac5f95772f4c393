#include "system/processor/CpuInfo.h"

#include <fmt/format.h>

#include <algorithm>
#include <charconv>
#include <map>

#include "files/TextFields.h"
#include "system/processor/ArmProcessorNames.h"

namespace cimomd {
namespace {

using Block = std::map<std::string_view, std::string_view>;

std::optional<std::string_view> find(const Block& block, std::string_view key) {
    const auto place = block.find(key);
    if (place == block.end() || place->second.empty())
        return std::nullopt;
    return place->second;
}

std::optional<std::string> textOf(const Block& block, std::initializer_list<const char*> keys) {
    for (const char* key : keys) {
        if (const auto value = find(block, key))
            return std::string(*value);
    }
    return std::nullopt;
}

std::optional<std::int64_t> numberOf(const Block& block, std::string_view key) {
    const auto value = find(block, key);
    return value ? parseSigned(*value) : std::nullopt;
}

std::optional<double> megahertzOf(const Block& block) {
    const auto text = find(block, "cpu MHz");
    double value = 0;
    if (!text)
        return std::nullopt;
    const char* end = text->data() + text->size();
    const auto [stop, error] = std::from_chars(text->data(), end, value);
    if (error != std::errc() || stop != end || !(value > 0 && value < 1e6))
        return std::nullopt;
    return value;
}

std::optional<std::string> modelOf(const Block& block) {
    if (auto name = textOf(block, {"model name", "cpu model", "cpu"}))
        return name;
    const auto implementer = find(block, "CPU implementer");
    const auto part = find(block, "CPU part");
    if (!implementer || !part)
        return std::nullopt;
    if (const auto name = armPartName(*implementer, *part))
        return std::string(*name);
    return fmt::format("ARM implementer {} part {}", *implementer, *part);
}

std::optional<std::string> vendorOf(const Block& block) {
    const auto implementer = find(block, "CPU implementer");
    const auto name = implementer ? armImplementerName(*implementer) : std::nullopt;
    return name ? std::optional<std::string>(*name) : textOf(block, {"vendor_id"});
}

std::optional<std::uint16_t> widthOf(const Block& block) {
    if (const auto architecture = numberOf(block, "CPU architecture"))
        return static_cast<std::uint16_t>(*architecture >= 8 ? 64 : 32);
    const auto flags = find(block, "flags");
    if (!flags)
        return std::nullopt;
    const std::vector<std::string_view> names = fieldsOf(*flags);
    const bool longMode = std::find(names.begin(), names.end(), "lm") != names.end();
    return static_cast<std::uint16_t>(longMode ? 64 : 32);
}

CpuInfo infoOf(const Block& block, std::uint64_t processor) {
    CpuInfo info;
    info.processor = processor;
    info.vendor = vendorOf(block);
    info.model = modelOf(block);
    info.stepping = textOf(block, {"stepping", "CPU revision", "revision"});
    info.currentMHz = megahertzOf(block);
    info.packageId = numberOf(block, "physical id");
    info.coreId = numberOf(block, "core id");
    info.width = widthOf(block);
    return info;
}

void finish(Block& block, std::vector<CpuInfo>& out) {
    const auto number = find(block, "processor");
    const auto processor = number ? parseUnsigned(*number) : std::nullopt;
    if (processor)
        out.push_back(infoOf(block, *processor));
    block.clear();
}

}  // namespace

std::vector<CpuInfo> parseCpuInfo(std::string_view text) {
    std::vector<CpuInfo> out;
    Block block;
    for (const std::string_view line : linesOf(text)) {
        if (const auto entry = keyValueOf(line, ':'))
            block.emplace(entry->key, entry->value);
        else
            finish(block, out);
    }
    finish(block, out);
    return out;
}

}  // namespace cimomd
