// Texts of made-up words.

#pragma once

#include <cstddef>
#include <string>

#include "bench/synthetic/Random.h"

namespace bench {

/// Words apart by blanks, `length` characters or a few more.
std::string words(Random& random, std::size_t length);

/// As a vendor's text: about `length` characters, of which a few have to be escaped in XML and a
/// few are outside ASCII.
std::string vendorText(Random& random, std::size_t length);

/// Sentences as of a schema's Description: of `length` characters or a few more.
std::string description(Random& random, std::size_t length);

}  // namespace bench
