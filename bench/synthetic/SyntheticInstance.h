// The values of one instance of a synthetic inventory.

#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "bench/synthetic/Random.h"
#include "bench/synthetic/SyntheticClass.h"

namespace bench {

/// For each property of the class, in its order, the texts of its value, of which a scalar has one.
/// Not escaped. Numbers are as CIM-XML writes them.
using InstanceTexts = std::vector<std::vector<std::string>>;

/// Makes instance `number`, whose key no other number of the class has.
InstanceTexts makeInstance(const SyntheticClass& synthetic, std::size_t number, Random& random);

}  // namespace bench
