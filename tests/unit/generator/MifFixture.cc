#include "MifFixture.h"

#include "support/mif/Refusal.h"

namespace generatortest {

void MifFixture::tolerate(std::initializer_list<Mif::Tolerance> more) {
    extra.assign(more);
}

std::string MifFixture::output() const {
    std::string text = ConverterFixture::output();
    EXPECT_EQ(Mif::refusal(text, allBut(std::nullopt)), expectedRefusal) << text;
    for (const Mif::Tolerance one : extra) {
        EXPECT_NE(Mif::refusal(text, allBut(one)), expectedRefusal)
            << "tolerance " << static_cast<int>(one) << " is not needed";
    }
    return text;
}

Mif::Tolerances MifFixture::allBut(std::optional<Mif::Tolerance> left) const {
    Mif::Tolerances result = dialect;
    for (const Mif::Tolerance one : extra) {
        if (one != left) {
            result.add(one);
        }
    }
    return result;
}

}  // namespace generatortest
