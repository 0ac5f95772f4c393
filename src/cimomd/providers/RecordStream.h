#pragma once

// Instances made one by one from records that were read before.

#include <functional>
#include <utility>
#include <vector>

#include "providers/InstanceStream.h"

namespace cimomd {

template <typename Record>
class RecordStream : public InstanceStream {
  public:
    using Publish = std::function<ProvidedInstance(const Record&)>;

    /// `publish` makes the instance of one record; it is kept as long as the stream. `whyNotAll`
    /// tells that there may be more records, and what is in the way of finding them.
    RecordStream(std::vector<Record> sourceRecords, Publish publishRecord,
                 std::optional<Absence> whyNotAll = std::nullopt)
        : records(std::move(sourceRecords)),
          publish(std::move(publishRecord)),
          incompleteness(whyNotAll) {}

    bool next(ProvidedInstance& out) override {
        if (position == records.size())
            return false;
        out = publish(records[position++]);
        return true;
    }

    std::optional<Absence> absence() const override { return incompleteness; }

  private:
    std::vector<Record> records;
    Publish publish;
    std::optional<Absence> incompleteness;
    std::size_t position = 0;
};

}  // namespace cimomd
