#pragma once

// One page of HTML that shows the tables of MIF files. It needs no other file and no network, and
// is read without script; a little of it searches and sorts. A content security policy (CSP Level
// 3) allows this script and style sheet and nothing else, so that no text of a file can do more
// than be read.

#include <cstddef>
#include <ctime>
#include <string>

#include "mif/MifTables.h"
#include "report/Failure.h"

namespace sennetctl {

class InventoryPage {
  public:
    /// The title in UTF-8.
    explicit InventoryPage(std::string theTitle) : title(std::move(theTitle)) {}

    /// What is added from now on stands below a heading of this name, a machine's for instance.
    void beginGroup(const std::string& name);

    /// Appends a file's tables.
    /// @param file      its name for people
    /// @param modified  when it was written
    /// Throws CannotRun when the page becomes larger than kLargestPageOctets.
    void add(const std::string& file, std::time_t modified, const MifContent& content);

    /// Says on the page that a file, by its name for people, is missing there, and why.
    void addMissing(const Failure& failure);

    /// The whole page.
    std::string text() const;

    std::size_t files() const { return fileCount; }
    std::size_t tables() const { return tableCount; }
    std::size_t rows() const { return rowCount; }

  private:
    void beginPart(const std::string& id, const std::string& name, const std::string& count,
                   int level);
    void addTable(const MifTable& table, const std::string& origin, int level);

    std::string title;
    std::string links;     // items of the list of tables
    std::string sections;  // the tables
    std::string missing;   // items of the list of files that are not shown
    std::size_t groupCount = 0;
    std::size_t fileCount = 0;
    std::size_t tableCount = 0;
    std::size_t rowCount = 0;
};

}  // namespace sennetctl
