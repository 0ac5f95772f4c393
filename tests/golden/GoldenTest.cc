// Whole outputs, compared byte for byte with files reasoned out by hand. A case is a folder:
//   scripts/                the inventory scripts
//   sennet.properties       the resource properties
//   server/CLASS.class.xml, server/CLASS.instances.xml
//                           what the server returns; a class without files is refused
//   expected/PRODUCT/       every file that is there after the run: *.mif in the MIF directory, all
//                           others in the SQL directory

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <functional>
#include <string>
#include <vector>

#include "integration/sennet/SennetSetup.h"
#include "support/FakeCimServer.h"
#include "support/Files.h"

namespace {

namespace fs = std::filesystem;
using support::FakeCimServer;
using support::namesIn;
using support::readFile;
using support::Reply;
using support::writeFile;

const fs::path kCase = fs::path(TEST_SOURCE_DIR) / "golden" / "workstation";

bool endsWith(const std::string& text, const std::string& end) {
    return text.size() >= end.size() &&
           text.compare(text.size() - end.size(), end.size(), end) == 0;
}

bool isMif(const std::string& name) {
    return endsWith(name, ".mif");
}

std::vector<std::string> mifNames(std::vector<std::string> names) {
    names.erase(std::remove_if(names.begin(), names.end(), std::not_fn(isMif)), names.end());
    return names;
}

std::vector<std::string> otherNames(std::vector<std::string> names) {
    names.erase(std::remove_if(names.begin(), names.end(), isMif), names.end());
    return names;
}

/// The text's lines with their ends made visible.
std::vector<std::string> visibleLines(const std::string& text) {
    std::vector<std::string> lines(1);
    for (char c : text) {
        if (c == '\r') {
            lines.back() += "<CR>";
        } else if (c == '\n') {
            lines.back() += "<LF>";
            lines.emplace_back();
        } else {
            lines.back() += c;
        }
    }
    return lines;
}

/// Nothing when both are equal; otherwise the first line that differs, with two before it.
std::string difference(const std::string& expected, const std::string& found) {
    if (expected == found) {
        return "";
    }
    std::vector<std::string> left = visibleLines(expected);
    std::vector<std::string> right = visibleLines(found);
    const size_t count = std::max(left.size(), right.size());
    left.resize(count, "<end of file>");
    right.resize(count, "<end of file>");
    size_t line = 0;
    while (left[line] == right[line]) {
        ++line;
    }
    std::string report;
    for (size_t i = line < 2 ? 0 : line - 2; i < line; ++i) {
        report += "        " + std::to_string(i + 1) + "  " + left[i] + "\n";
    }
    return report + "expected " + std::to_string(line + 1) + "  " + left[line] + "\nfound    " +
           std::to_string(line + 1) + "  " + right[line] + "\n";
}

class GoldenTest : public ::testing::TestWithParam<const char*> {
  protected:
    GoldenTest() {
        for (const std::string& name : namesIn(kCase / "scripts")) {
            setup.addScript(name, readFile(kCase / "scripts" / name));
        }
        setup.setProperties(readFile(kCase / "sennet.properties"));
        for (const std::string& name : namesIn(kCase / "server")) {
            answer(name);
        }
        for (const std::string& name : staleFiles()) {
            const fs::path file = writtenFile(name);
            fs::create_directories(file.parent_path());
            writeFile(file, "of an earlier run");
        }
    }

    fs::path writtenFile(const std::string& name) const {
        return fs::path(isMif(name) ? setup.mifDirectory() : setup.sqlDirectory()) / name;
    }

    void answer(const std::string& name) {
        const std::string kClass = ".class.xml";
        const std::string kInstances = ".instances.xml";
        const std::string xml = readFile(kCase / "server" / name);
        if (endsWith(name, kClass)) {
            server.onGetClass(name.substr(0, name.size() - kClass.size()), Reply::ok(xml));
        } else if (endsWith(name, kInstances)) {
            server.onEnumerateInstances(name.substr(0, name.size() - kInstances.size()),
                                        Reply::ok(xml));
        } else {
            FAIL() << "what is " << name << "?";
        }
    }

    /// Files of an earlier run that the product replaces or, for the script without instances,
    /// removes.
    static std::vector<std::string> staleFiles() {
        const std::string product = GetParam();
        if (product == "CA") {
            return {"kwvinv.mif"};
        }
        if (product == "QVE") {
            return {"kwvinv.mif",
                    "kwinvlumo.mif",
                    "kwv_disk_lumo_schema.sql",
                    "kwv_disk_queries.sh",
                    "kwv_idle_lumo_schema.sql",
                    "kwv_idle_sybase_schema.sql",
                    "kwv_idle_ms_schema.sql",
                    "kwv_idle_oracle_schema.sql",
                    "kwv_idle_queries.sh",
                    "kwv_idle_queries_lumo.sh"};
        }
        return {"disk.mif", "idle.mif"};
    }

    SennetSetup setup;
    FakeCimServer server;
};

TEST_P(GoldenTest, WritesTheExpectedFiles) {
    const std::string product = GetParam();
    const support::ProgramResult result = setup.run({"/" + product}, server);
    EXPECT_EQ(result.exitStatus, 0);
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(result.out, setup.start() +
                              "Processing Port...\n"
                              "Processing cpu...\n"
                              "Processing disk...\n"
                              "Deleting idle...\n"
                              "Processing sensor...\n"
                              "Processing zone...\n");
    const fs::path expectedFiles = kCase / "expected" / product;
    const std::vector<std::string> names = namesIn(expectedFiles);
    EXPECT_EQ(namesIn(setup.mifDirectory()), mifNames(names));
    EXPECT_EQ(namesIn(setup.sqlDirectory()), otherNames(names));
    for (const std::string& name : names) {
        if (fs::exists(writtenFile(name))) {
            EXPECT_EQ(difference(readFile(expectedFiles / name), readFile(writtenFile(name))), "")
                << name;
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Products, GoldenTest, ::testing::Values("SMS", "CA", "LD", "QVE"),
                         [](const auto& info) { return std::string(info.param); });

}  // namespace
