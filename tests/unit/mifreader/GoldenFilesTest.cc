// The expected outputs of the generator, read strictly: each product's files leave the grammar in
// the places named here and nowhere else.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "support/Files.h"
#include "support/mif/Dialect.h"
#include "support/mif/Refusal.h"

namespace {

namespace fs = std::filesystem;
using namespace Mif;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;

std::vector<fs::path> expectedFiles(const std::string& product) {
    std::vector<fs::path> files;
    for (const auto& folder : fs::directory_iterator(fs::path(TEST_SOURCE_DIR) / "golden")) {
        const fs::path expected = folder.path() / "expected" / product;
        if (!fs::is_directory(expected)) {
            continue;
        }
        for (const auto& file : fs::directory_iterator(expected)) {
            if (file.path().extension() == ".mif") {
                files.push_back(file.path());
            }
        }
    }
    return files;
}

/// A reference is cut to 32 characters once escaped. The one of the workstation loses its closing
/// quote by that, and the quote that ends the literal counts as escaped in its place.
std::string withWholeReferences(std::string text) {
    const std::string cut = "CIM_ComputerSystem.Name=\\\"pc123\\\"";
    for (std::size_t at = text.find(cut); at != std::string::npos; at = text.find(cut, at + 1)) {
        text.insert(at + cut.size(), "\"");
    }
    return text;
}

/// One file may leave the grammar in one more place than the others of its product.
void expectReadable(const std::string& product, Tolerances tolerances,
                    const std::string& exceptional = "",
                    Tolerance exception = Tolerance::RawLineEnds) {
    const std::vector<fs::path> files = expectedFiles(product);
    EXPECT_THAT(files, Not(IsEmpty()));
    for (const fs::path& file : files) {
        Tolerances allowed = tolerances;
        if (file.filename() == exceptional) {
            const std::string text = withWholeReferences(support::readFile(file));
            EXPECT_NE(refusal(text, tolerances), "accepted") << file;
            allowed.add(exception);
        }
        EXPECT_EQ(refusal(withWholeReferences(support::readFile(file)), allowed), "accepted")
            << file;
    }
}

// An enumeration is declared as text, and without a value it is a bare 0 all the same.
TEST(GoldenFilesTest, SmsKeepsToTheGrammarButForEnumerationsWithoutAValue) {
    expectReadable("SMS", kSmsDialect, "sensor.mif", Tolerance::IntegersAsText);
}

TEST(GoldenFilesTest, LanDeskWritesIntegersWhereItDeclaresText) {
    expectReadable("LD", kLanDeskDialect, "sensor.mif", Tolerance::EmptyDates);
}

TEST(GoldenFilesTest, CaKeepsBackslashesPlain) {
    expectReadable("CA", kCaDialect, "kwvinv.mif", Tolerance::IntegersAsText);
}

TEST(GoldenFilesTest, QveDeclaresAndWritesTextOnly) {
    for (const fs::path& file : expectedFiles("QVE")) {
        Tolerances tolerances = kQveDialect;
        if (file.filename() == "kwinvlumo.mif") {
            tolerances.add(Tolerance::RepeatedNames);
        }
        EXPECT_EQ(refusal(support::readFile(file), tolerances), "accepted") << file;
    }
    EXPECT_THAT(expectedFiles("QVE"), Not(IsEmpty()));
}

TEST(GoldenFilesTest, ACutReferenceMakesAFileUnreadable) {
    const fs::path cpu =
        fs::path(TEST_SOURCE_DIR) / "golden" / "workstation" / "expected" / "SMS" / "cpu.mif";
    EXPECT_THAT(refusal(support::readFile(cpu), kSmsDialect), HasSubstr("line end in a literal"));
}

}  // namespace
