// Synthetic inventories as a CIM server words and breaks its CIM-XML (DSP0201): one element to a
// line, attributes apart by two blanks in places, nothing indented.

#pragma once

#include <string>
#include <string_view>

#include "bench/synthetic/SyntheticClass.h"
#include "bench/synthetic/SyntheticInstance.h"

namespace bench {

/// What stands before and behind the message identifier and the method's name up to the result, and
/// behind the result.
std::string answerOpening(std::string_view messageId, std::string_view method);
std::string_view answerEnd();

/// A CLASS with every qualifier that the schemas of real servers have, descriptions foremost.
std::string classXml(const SyntheticClass& synthetic, Random& random);

/// Appends a VALUE.NAMEDINSTANCE.
void appendInstanceXml(const SyntheticClass& synthetic, const InstanceTexts& texts,
                       std::string& xml);

}  // namespace bench
