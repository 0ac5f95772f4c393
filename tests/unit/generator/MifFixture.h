// What the tests of the converters that write MIF files share: whatever such a file holds besides,
// an importer has to be able to read it.

#pragma once

#include <initializer_list>
#include <optional>
#include <string>
#include <vector>

#include "ConverterFixture.h"
#include "mifreader/Tolerance.h"

namespace generatortest {

class MifFixture : public ConverterFixture {
  protected:
    /// Every file that a test takes is read, to the letter but for the tolerances of the dialect.
    explicit MifFixture(Mif::Tolerances theDialect) : dialect(theDialect) {}

    /// Allows more in this test's files. Without any one of these they must be refused.
    void tolerate(std::initializer_list<Mif::Tolerance> more);

    /// From here on the file is broken, and refused with exactly this: "line:column: message".
    void expectUnreadable(const std::string& refusal) { expectedRefusal = refusal; }

    /// The bytes of the file, after reading it.
    std::string output() const override;

  private:
    /// Those of the dialect and the further ones, but for one that is left out.
    Mif::Tolerances allBut(std::optional<Mif::Tolerance> left) const;

    Mif::Tolerances dialect;
    std::vector<Mif::Tolerance> extra;
    std::string expectedRefusal = "accepted";
};

}  // namespace generatortest
