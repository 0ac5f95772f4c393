#pragma once

// A stream's way to a descriptor that remembers why it ended, which std::cout forgets.

#include <streambuf>
#include <vector>

namespace sennetctl {

class DescriptorBuffer : public std::streambuf {
  public:
    /// The descriptor stays the caller's. Nothing is written after a write that failed.
    explicit DescriptorBuffer(int theDescriptor);
    ~DescriptorBuffer() override;
    DescriptorBuffer(const DescriptorBuffer&) = delete;
    DescriptorBuffer& operator=(const DescriptorBuffer&) = delete;

    /// The error number of the write that failed; 0 when none did.
    int error() const { return firstError; }

  protected:
    int_type overflow(int_type character) override;
    int sync() override;

  private:
    bool writeOut();

    int descriptor;
    int firstError = 0;
    std::vector<char> pending;
};

}  // namespace sennetctl
