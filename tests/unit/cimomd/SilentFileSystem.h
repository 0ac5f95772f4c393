#pragma once

// A FUSE file system whose program reads the question for its size and never answers: whoever asks
// hangs and cannot be killed until this object goes. Only its owner may ask: others are told
// nothing by the kernel itself.

#include <string>
#include <thread>

#include "support/TempDirectory.h"

namespace cimomd {

class SilentFileSystem {
  public:
    explicit SilentFileSystem(unsigned owner = 0);
    ~SilentFileSystem();
    SilentFileSystem(const SilentFileSystem&) = delete;
    SilentFileSystem& operator=(const SilentFileSystem&) = delete;

    /// Empty when it is mounted, else why it is not.
    const std::string& obstacle() const { return failure; }
    std::string mountPoint() const { return place.path(); }

  private:
    void readAndAnswerOnlyTheFirst() const;

    support::TempDirectory place;
    std::string failure;
    int connection = -1;
    int stopRequest = -1;
    std::thread program;
};

}  // namespace cimomd
