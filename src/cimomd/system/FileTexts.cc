#include "system/FileTexts.h"

#include "files/TextFile.h"
#include "system/devices/DeviceFiles.h"

namespace cimomd {

FileTexts::FileTexts(TextSource source, const std::vector<std::filesystem::path>& files,
                     const SystemCalls& calls) {
    const std::vector<Fact<std::string>> read = calls.textsInTime(source, files);
    for (std::size_t i = 0; i < files.size(); ++i)
        texts.emplace(files[i], read[i]);
}

Fact<std::string> FileTexts::fact(const std::filesystem::path& file) const {
    const auto place = texts.find(file);
    return place == texts.end() ? Absence::Absent : factIn(place->second);
}

Fact<std::uint64_t> FileTexts::number(const std::filesystem::path& file) const {
    return numberIn(fact(file));
}

Fact<std::int64_t> FileTexts::signedNumber(const std::filesystem::path& file) const {
    return signedNumberIn(fact(file));
}

Fact<bool> FileTexts::switchState(const std::filesystem::path& file) const {
    return switchIn(number(file));
}

}  // namespace cimomd
