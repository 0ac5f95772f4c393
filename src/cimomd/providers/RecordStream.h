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

    /// `publish` makes the instance of one record; it is kept as long as the stream.
    RecordStream(std::vector<Record> sourceRecords, Publish publishRecord)
        : records(std::move(sourceRecords)), publish(std::move(publishRecord)) {}

    bool next(ProvidedInstance& out) override {
        if (position == records.size())
            return false;
        out = publish(records[position++]);
        return true;
    }

  private:
    std::vector<Record> records;
    Publish publish;
    std::size_t position = 0;
};

}  // namespace cimomd
