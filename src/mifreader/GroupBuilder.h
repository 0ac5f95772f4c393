#pragma once

// Puts a group together from its statements and attributes.

#include <cstdint>
#include <set>
#include <string>
#include <vector>

#include "mifreader/Document.h"
#include "mifreader/Tolerance.h"

namespace Mif {

// An Id as it stands in the file.
struct Number {
    std::uint64_t value = 0;
    Position position;
};

class GroupBuilder {
  public:
    GroupBuilder(Position theStart, Tolerances theTolerances)
        : start(theStart), tolerances(theTolerances) {}

    Group group;

    // Throws Error when the group has an attribute of this Id or name.
    void add(Attribute attribute);
    void setKey(std::vector<Number> numbers) { key = std::move(numbers); }

    // The whole group, its attributes in ascending order of their Ids. Throws Error when it has
    // no attribute, or when the key names one that is not there or names one twice.
    Group finish();

  private:
    void resolveKey();
    void countRequired();

    Position start;
    Tolerances tolerances;
    std::vector<Number> key;
    std::set<std::uint64_t> ids;
    std::set<std::string> names;
};

}  // namespace Mif
