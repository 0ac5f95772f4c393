#pragma once

// The rows of a script's table as they were written, for a second document that has the same.

#include <Pegasus/Client/CIMClient.h>

#include <cstddef>
#include <deque>
#include <string>
#include <string_view>
#include <vector>

namespace Pegasus {

class CimInstanceLists;
class SennetConverter;

/// Shared by two converters that render values alike. The first to write a table keeps its rows
/// here, the second writes these. A converter never gets back what it wrote itself: that was for
/// another script.
class TableRows {
  public:
    static constexpr std::size_t kMostOctets = std::size_t{16} << 20;

    /// Forgets earlier rows; those added from now on are written by `author` and show
    /// `instanceLists`.
    void start(const CimInstanceLists& instanceLists, const SennetConverter& author);
    /// Beyond kMostOctets none of the table's rows are kept.
    void add(std::string_view row);

    /// Whether rows are kept that another than `reader` wrote, and that show these very instances,
    /// not merely equal ones.
    bool show(const CimInstanceLists& instanceLists, const SennetConverter& reader) const;

    /// The rows, several in each text. Forgets them.
    std::deque<std::string> take();

  private:
    // To be compared only.
    const SennetConverter* author = nullptr;
    std::vector<Array<CIMInstance>> shown;
    std::deque<std::string> texts;
    std::size_t octets = 0;
};

}  // namespace Pegasus
