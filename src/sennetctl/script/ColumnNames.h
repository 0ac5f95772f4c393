#pragma once

// Names of the columns of one table that every product takes as they are.

#include <Pegasus/Common/String.h>

#include <string>
#include <vector>

namespace sennetctl {

class ColumnNames {
  public:
    /// Takes a name that the table has already. Returns whether no other column has it, for any
    /// product.
    bool take(const std::string& name);

    /// Takes a name that no other column has: the readable one, shortened or numbered as need be.
    std::string choose(const std::string& readable);

  private:
    bool isFree(const std::string& name) const;

    std::vector<Pegasus::String> taken;  // as QVE with Lumo writes them
};

/// "MaxClockSpeed" as "Max Clock Speed", "DeviceID" as "Device ID".
std::string readableName(const std::string& name);

/// A text of at most `limit` octets; its longest words lose their ends first.
std::string withShorterWords(const std::string& text, std::size_t limit);

}  // namespace sennetctl
