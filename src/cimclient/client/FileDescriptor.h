// A file descriptor that is closed at the end of its life.

#pragma once

#include <utility>

namespace Pegasus {

class FileDescriptor {
  public:
    FileDescriptor() = default;
    /// Takes the descriptor over; a negative number stands for none.
    explicit FileDescriptor(int number) : number(number) {}
    ~FileDescriptor() { reset(); }
    FileDescriptor(FileDescriptor&& other) noexcept : number(std::exchange(other.number, -1)) {}
    FileDescriptor& operator=(FileDescriptor&& other) noexcept;
    FileDescriptor(const FileDescriptor&) = delete;
    FileDescriptor& operator=(const FileDescriptor&) = delete;

    /// -1 when there is none.
    int get() const { return number; }
    bool isOpen() const { return number >= 0; }
    void reset();
    /// Gives the descriptor up without closing it.
    int release() { return std::exchange(number, -1); }

  private:
    int number = -1;
};

}  // namespace Pegasus
