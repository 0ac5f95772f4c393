#pragma once

// The rows of a script's table as they were written, for a second document that has the same.

#include <Pegasus/Client/CIMClient.h>

#include <deque>
#include <string>
#include <string_view>
#include <vector>

namespace Pegasus {

class CimInstanceLists;

/// Shared by two converters that render values alike. The first to write a table keeps its rows
/// here, the second writes these.
class TableRows {
  public:
    /// Forgets earlier rows; those added from now on show `instanceLists`.
    void start(const CimInstanceLists& instanceLists);
    void add(std::string_view row);

    /// Whether rows are kept, and show these very instances, not merely equal ones.
    bool show(const CimInstanceLists& instanceLists) const;

    /// The rows, several in each text. Forgets them.
    std::deque<std::string> take();

  private:
    std::vector<Array<CIMInstance>> shown;
    std::deque<std::string> texts;
};

}  // namespace Pegasus
