#include "system/SystemCalls.h"

#include "files/TextFile.h"

namespace cimomd {

std::vector<Fact<std::string>> SystemCalls::textsInTime(
    TextSource /*source*/, const std::vector<std::filesystem::path>& files) const {
    std::vector<Fact<std::string>> texts;
    texts.reserve(files.size());
    for (const std::filesystem::path& file : files) {
        FileContent content = readFilePart(file, 0, kMaxGuardedBytes);
        texts.push_back(content.status == FileStatus::Read
                            ? Fact<std::string>(std::move(content.bytes))
                            : Fact<std::string>(absenceOf(content.status)));
    }
    return texts;
}

}  // namespace cimomd
