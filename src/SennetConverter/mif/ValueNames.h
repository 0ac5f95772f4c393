#pragma once

// The names that the qualifiers Values and ValueMap (DSP0004) give to the numbers of a property.

#include <Pegasus/Client/CIMClient.h>

#include <list>
#include <unordered_map>

namespace Pegasus {

/// The names of one property's numbers.
class ValueNames {
  public:
    /// @param texts    the elements of Values
    /// @param numbers  the elements of ValueMap
    /// @param areMapped whether there is a ValueMap; without it a number is its own position
    ValueNames(const Array<String>& texts, const Array<String>& numbers, bool areMapped);

    /// The number's name, or the number in decimal when it has none.
    String nameOf(Uint64 number) const;

    /// Whether these are names made of the very same arrays, not merely of equal ones.
    bool areMadeOf(const Array<String>& otherTexts, const Array<String>& otherNumbers,
                   bool otherIsMapped) const;

  private:
    Array<String> texts;
    Array<String> numbers;
    bool isMapped;
    std::unordered_map<Uint64, Uint32> positions;
};

/// The names of the properties that were asked for lately: a table asks for those of its few
/// columns over and over.
class ValueNamesCache {
  public:
    /// The names for a property that has a qualifier Values, at position `values`. Valid until the
    /// next call.
    const ValueNames& of(const CIMProperty& property, Uint32 values);

  private:
    std::list<ValueNames> latest;
};

}  // namespace Pegasus
