#pragma once

// The system calls of the machine this runs on.

#include "system/SystemCalls.h"

namespace cimomd {

class LiveSystemCalls : public SystemCalls {
  public:
    std::int64_t now() const override;
    int utcOffsetMinutes(std::int64_t time) const override;
    std::optional<FileSystemSize> fileSystemSize(const std::string& mountPoint) const override;
    std::optional<std::string> machine() const override;
};

}  // namespace cimomd
