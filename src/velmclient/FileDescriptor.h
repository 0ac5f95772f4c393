// Owner of a file descriptor, and the way in which this library opens what it reads.
#pragma once

#include <cstddef>

#include <sys/types.h>

namespace Velm {

class FileDescriptor {
  public:
    // Owns nothing.
    FileDescriptor() = default;

    // Takes a descriptor over; a negative one, as a failed call returns it, is none.
    explicit FileDescriptor(int number) : number(number) {}

    ~FileDescriptor();
    FileDescriptor(FileDescriptor&& other) noexcept;
    FileDescriptor& operator=(FileDescriptor&& other) noexcept;

    // Opens a regular file for reading; never waits, whatever stands at the path. On failure the
    // result is not open and errno says why: EISDIR for a directory, EINVAL for anything else that
    // is no regular file.
    static FileDescriptor openRegularFile(const char* path);

    bool isOpen() const { return number >= 0; }
    int get() const { return number; }

    // Closes the descriptor. Returns 0 or the error number; the descriptor is gone in both cases.
    int close();

    // As read(2), but repeated when a signal interrupts it.
    ssize_t read(char* buffer, std::size_t size) const;

    // Writes all of the bytes. Returns 0 or the error number.
    int writeAll(const char* bytes, std::size_t size) const;

  private:
    int number = -1;
};

}  // namespace Velm
