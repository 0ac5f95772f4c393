#pragma once

// Reading files whole, never more than a bound: kernel files report no size, and a link in a
// directory that others may write could lead anywhere.

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <string>

namespace cimomd {

enum class FileStatus { Read, Absent, Forbidden, Unreadable, TooLong };

struct FileContent {
    FileStatus status = FileStatus::Absent;
    /// Empty unless `status` is Read.
    std::string bytes;
};

/// The bytes of a regular file of at most `maxBytes`. Forbidden: no permission. Unreadable: no
/// regular file, or an error while reading. Absent: nothing has this name, also when it vanished
/// meanwhile.
FileContent readBoundedFile(const std::filesystem::path& path, std::size_t maxBytes);

/// The bytes of a regular file from `offset` on, at most `maxBytes` of them and none behind its
/// end; `status` is never TooLong.
FileContent readFilePart(const std::filesystem::path& path, std::uint64_t offset,
                         std::size_t maxBytes);

/// The same from the beginning on, without memory of its own: at most `capacity` bytes go to
/// `buffer`, their number to `length`, which is 0 unless the file was read. Safe between fork and
/// exec of a process with threads.
FileStatus readFileStart(const char* path, char* buffer, std::size_t capacity, std::size_t& length);

}  // namespace cimomd
