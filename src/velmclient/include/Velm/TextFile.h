// A handle on a path: reads a text file line by line, or writes one that appears only when it is
// complete. Failures are reported to the system log and by the results, never by an exception;
// errno has the cause of the first failed step of a file.
// An object is used by one thread at a time.
#pragma once

#include <memory>
#include <string>

namespace Velm {

class LineReader;
class ReplacingFile;

class TextFile {
  public:
    // Remembers the path (copied); nothing is opened. A null path is an empty one.
    explicit TextFile(const char* path);

    // Closes a file open for reading. What was written since open(1) without a close() is thrown
    // away and a file that stood under the path before stays as it was.
    ~TextFile();

    TextFile(const TextFile&) = delete;
    TextFile& operator=(const TextFile&) = delete;

    // Whether anything (a file, a directory, ...) stands at the path, symbolic links followed.
    bool exists() const;

    // Makes a directory of the path, with the missing directories above it when `parents` is 1.
    // Returns 0 when the directory stands afterwards, also when it stood before, otherwise -1.
    int mkdir(int parents);

    // Points the handle at another path (copied). A file that is open stays open: what is written
    // to it still goes to the path it was opened under.
    void setFileName(const char* path);

    // Mode 0 opens for reading; only a regular file can be read. Mode 1 opens for writing: nothing
    // is seen under the path before close(), and only a regular file or a symbolic link (the link
    // itself, not its target) is replaced. A file that was open before is dropped as by the
    // destructor. Returns 0, or -1 on failure; then readLine gives -1 and what is written is lost.
    int open(int mode);

    // Puts the next line into `buffer`, without its end (LF or CR LF; a last line may have none)
    // and without a terminating NUL. At most `limit` bytes are stored, the rest of a longer line is
    // dropped. Returns the number of bytes stored (NUL bytes count as any other), 0 for an empty
    // line, -1 at the end of the file, on a read error, when nothing is open for reading, for a
    // null buffer and for a negative limit.
    int readLine(char* buffer, int limit);

    // Appends `length` bytes of `text`; no line end is added. Returns `length`, or -1 when nothing
    // is open for writing, a write failed (this one or one before) or the arguments are a null
    // text or a negative length. The bytes are buffered, so an error may show at close() only.
    int writeLine(const char* text, int length);

    // Ends reading, or makes what was written the file of the path it was opened under, with the
    // permissions of the file it replaces. When that or any write before failed, the previous file
    // stays and the result is -1; otherwise 0, also when nothing was open.
    int close();

    // Deletes the file of the path; a symbolic link itself goes, not its target. Returns 0 when no
    // such file is left, also when there was none, otherwise -1.
    int remove();

  private:
    std::string path;
    std::unique_ptr<LineReader> reader;
    std::unique_ptr<ReplacingFile> writer;
};

}  // namespace Velm
