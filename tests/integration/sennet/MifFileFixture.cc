#include "integration/sennet/MifFileFixture.h"

#include <filesystem>

#include "support/Files.h"
#include "support/mif/Dialect.h"
#include "support/mif/Refusal.h"

namespace {

namespace fs = std::filesystem;

Mif::Tolerances dialectOf(const std::string& product) {
    static const std::map<std::string, Mif::Tolerances> dialects = {{"/SMS", Mif::kSmsDialect},
                                                                    {"/LD", Mif::kLanDeskDialect},
                                                                    {"/CA", Mif::kCaDialect},
                                                                    {"/QVE", Mif::kQveDialect}};
    return dialects.at(product);
}

bool isMifFile(const fs::directory_entry& entry) {
    return entry.is_regular_file() && entry.path().extension() == ".mif";
}

}  // namespace

support::ProgramResult MifFileFixture::run(const std::string& product) {
    lastProduct = product;
    support::ProgramResult result = setup.run({product}, server);
    expectReadableFiles();
    return result;
}

BackgroundProgram MifFileFixture::start(const std::string& product) {
    lastProduct = product;
    return {SennetSetup::program(), product, setup.environment(server.socketPath())};
}

void MifFileFixture::expectReadableFiles() {
    if (!fs::exists(setup.mifDirectory())) {
        return;
    }
    for (const auto& entry : fs::recursive_directory_iterator(setup.mifDirectory())) {
        if (!isMifFile(entry)) {
            continue;
        }
        const std::string name = fs::relative(entry.path(), setup.mifDirectory());
        const std::string text = support::readFile(entry.path());
        const auto left = leftFiles.find(name);
        if (left != leftFiles.end() && left->second == text) {
            continue;
        }
        const auto refused = refusals.find(name);
        EXPECT_EQ(Mif::refusal(text, dialectOf(lastProduct)),
                  refused == refusals.end() ? "accepted" : refused->second)
            << name << " holds\n"
            << text;
    }
}

void MifFileFixture::leaveMifFile(const std::string& name, const std::string& bytes) {
    setup.leaveMifFile(name, bytes);
    leftFiles[name] = bytes;
}

void MifFileFixture::expectUnreadable(const std::string& name, const std::string& refusal) {
    refusals[name] = refusal;
}

void MifFileFixture::TearDown() {
    expectReadableFiles();
    for (const auto& [name, refusal] : refusals) {
        EXPECT_TRUE(fs::exists(setup.mifFile(name))) << name << ", to be refused: " << refusal;
    }
}
