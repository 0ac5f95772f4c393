#pragma once

// System calls that note which files were asked for with a deadline, and keep some of them back.

#include <algorithm>
#include <set>

#include "FixedSystemCalls.h"

namespace cimomd {

class WatchedSystemCalls : public FixedSystemCalls {
  public:
    std::vector<Fact<std::string>> textsInTime(
        TextSource source, const std::vector<std::filesystem::path>& files) const override {
        std::vector<Fact<std::string>> texts = SystemCalls::textsInTime(source, files);
        sources.insert(source);
        for (std::size_t i = 0; i < files.size(); ++i) {
            asked.push_back(files[i].string());
            if (files[i] == silent)
                texts[i] = Absence::TimedOut;
        }
        return texts;
    }

    /// Whether a file whose path ends so was asked for.
    bool wasAskedFor(std::string_view end) const {
        return std::any_of(asked.begin(), asked.end(), [end](const std::string& file) {
            return file.size() >= end.size() &&
                   file.compare(file.size() - end.size(), end.size(), end) == 0;
        });
    }

    /// A file that never answers.
    std::filesystem::path silent;
    mutable std::vector<std::string> asked;
    /// What the files were said to belong to.
    mutable std::set<TextSource> sources;
};

}  // namespace cimomd
