#pragma once

// `sennetctl mif html`: MIF files as a page for people.

#include <string>
#include <vector>

#include "report/Output.h"

namespace sennetctl {

struct HtmlOptions {
    std::vector<std::string> files;  ///< in the order of the page
    std::string directory;           ///< where the page goes
    std::string title = "Inventory";
    bool replace = false;  ///< takes the place of an earlier page
};

/// Writes the page inventory.html into the directory, which is made if it is missing, and prints
/// what was written. A file that cannot be read or is no MIF file is told, here and on the page,
/// and the status is then kCannotRun; of such files alone no page is made. Throws CannotRun when
/// the page is there already and not to be replaced, when it becomes too large, and when it cannot
/// be written; then nothing is changed.
int writeHtmlPage(const HtmlOptions& options, const Output& output);

}  // namespace sennetctl
