#pragma once

// Instances one after the other, so that an answer needs the memory of one of them only.

#include <optional>

#include "providers/ProvidedInstance.h"

namespace cimomd {

class InstanceStream {
  public:
    virtual ~InstanceStream() = default;

    /// Puts the next instance into `out`; false when there is none left. Raises ProviderError when
    /// the source fails midway.
    virtual bool next(ProvidedInstance& out) = 0;

    /// Why there are no instances, or not all, when something is in the way of finding them. To be
    /// asked at the end.
    virtual std::optional<Absence> absence() const { return std::nullopt; }

  protected:
    InstanceStream() = default;
    InstanceStream(const InstanceStream&) = default;
    InstanceStream& operator=(const InstanceStream&) = default;
};

/// No instances, for a reason.
class EmptyStream : public InstanceStream {
  public:
    explicit EmptyStream(Absence why) : reason(why) {}

    bool next(ProvidedInstance&) override { return false; }
    std::optional<Absence> absence() const override { return reason; }

  private:
    Absence reason;
};

}  // namespace cimomd
