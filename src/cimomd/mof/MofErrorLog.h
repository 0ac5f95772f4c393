#pragma once

// Collects the mistakes of one compilation, so that all of them can be told at once.

#include <string>
#include <string_view>
#include <vector>

#include "mof/MofError.h"

namespace cimomd {

class MofErrorLog {
  public:
    /// A file that is no MOF at all would have one mistake in each line.
    static constexpr std::size_t kMaxErrors = 100;

    /// Keeps a mistake in `file`. Raises MofErrors when there are more than kMaxErrors.
    void add(std::string_view file, MofPosition position, std::string_view found,
             std::string_view expected);
    void add(std::string_view file, const MofError& error);

    std::size_t count() const { return entries.size(); }

    /// Raises MofErrors when there is any mistake: file by file, each from its beginning to its
    /// end.
    void raiseIfAny() const;

  private:
    struct Entry {
        std::size_t fileIndex;
        MofError error;
    };

    std::size_t indexOf(std::string_view file);
    [[noreturn]] void raise(bool isCut) const;

    /// In the order of their first mistakes.
    std::vector<std::string> files;
    std::vector<Entry> entries;
};

}  // namespace cimomd
