#pragma once

// What a command is doing, told on a terminal while it works.

#include <string>

#include "report/Output.h"

namespace sennetctl {

/// One line of standard error that is written over and taken away at the end.
class Progress {
  public:
    /// The output must outlive it.
    explicit Progress(const Output& theOutput) : output(theOutput) {}
    ~Progress() { show({}); }
    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    /// Shows the text in place of the one before; nothing where standard error is no terminal.
    void show(const std::string& text) const;

  private:
    const Output& output;
};

}  // namespace sennetctl
