#pragma once

#include <vector>

namespace Pegasus {

class CimConverter;

/// The converters of a run, in the order in which they are called. Owns those it holds.
class CimConverterList {
  public:
    CimConverterList() = default;
    CimConverterList(const CimConverterList&) = delete;
    CimConverterList& operator=(const CimConverterList&) = delete;

    /// Deletes the converters still held, first to last.
    ~CimConverterList();

    /// Appends and takes over a converter made with new; a null pointer takes a place too.
    void addConverter(CimConverter* converter);

    int getNumberOfConverters() const;

    /// Converter at index; null when there is none.
    CimConverter* getConverter(int index) const;

    /// Forgets the converters; whoever holds them owns them now.
    void clear();

    /// Deletes the converters, first to last.
    void clearAndDelete();

  private:
    std::vector<CimConverter*> converters;
};

}  // namespace Pegasus
