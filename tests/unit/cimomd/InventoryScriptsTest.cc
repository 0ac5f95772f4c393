// The shipped scripts and their resource texts against the shipped schema.

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "mof/MofCompiler.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

// The narrowest product takes this many characters in a column's name.
constexpr std::size_t kMaxColumnName = 18;

struct Script {
    std::string title;
    std::string className;
    std::vector<std::string> properties;
};

std::string textOf(const std::string& name) {
    return readText(std::filesystem::path(INVENTORY_DIR) / name).value();
}

Script scriptOf(const std::string& name) {
    Script script;
    const std::string text = textOf(name);
    for (const std::string_view line : linesOf(text)) {
        const std::size_t equals = line.find('=');
        const std::string value(equals == std::string_view::npos ? "" : line.substr(equals + 1));
        if (line.substr(0, equals) == "title")
            script.title = value;
        if (line.substr(0, equals) == "G[0]")
            script.className = value;
        if (line.substr(0, equals) == "A[0]") {
            std::string names = value;
            std::replace(names.begin(), names.end(), ',', ' ');
            for (const std::string_view property : fieldsOf(names))
                script.properties.emplace_back(property);
            EXPECT_NE(value.back(), ',') << name;
        }
    }
    return script;
}

std::map<std::string, std::string> resources() {
    std::map<std::string, std::string> out;
    const std::string text = textOf("sennet.properties");
    for (const std::string_view line : linesOf(text)) {
        const auto entry = keyValueOf(line, '=');
        if (!entry || line.front() == '#')
            continue;
        EXPECT_TRUE(out.emplace(entry->key, entry->value).second) << entry->key;
    }
    return out;
}

std::vector<std::string> scriptNames() {
    std::vector<std::string> names;
    const auto listed = listDirectory(INVENTORY_DIR);
    for (const std::string& name : listed.value()) {
        if (name.size() > 11 && name.substr(name.size() - 11) == ".script.inv")
            names.push_back(name);
    }
    return names;
}

TEST(InventoryScripts, nameClassesAndPropertiesThatAreServed) {
    ClassRepository repository;
    const Pegasus::CIMNamespaceName nameSpace("root/cimv2");
    MofCompiler(repository, nameSpace)
        .compileFile(std::filesystem::path(SCHEMA_DIR) / "cimomd.mof");
    ASSERT_EQ(scriptNames().size(), 5U);
    for (const std::string& name : scriptNames()) {
        const Script script = scriptOf(name);
        const auto* found =
            repository.findClass(nameSpace, Pegasus::CIMName(cimString(script.className)));
        ASSERT_NE(found, nullptr) << name;
        EXPECT_EQ(utf8Of(found->getClassName().getString()), script.className);
        EXPECT_FALSE(script.properties.empty()) << name;
        for (const std::string& property : script.properties)
            EXPECT_NE(found->findProperty(Pegasus::CIMName(cimString(property))),
                      Pegasus::PEG_NOT_FOUND)
                << script.className << "." << property;
    }
}

TEST(InventoryScripts, haveReadableNamesThatEveryProductTakes) {
    const auto texts = resources();
    for (const std::string& name : scriptNames()) {
        const Script script = scriptOf(name);
        std::string title = script.title;
        std::replace(title.begin(), title.end(), ' ', '_');
        EXPECT_TRUE(texts.count("title." + title)) << title;
        std::set<std::string> columns;
        for (const std::string& property : script.properties) {
            const auto text = texts.find(script.className + "." + property);
            ASSERT_NE(text, texts.end()) << script.className << "." << property;
            EXPECT_LE(text->second.size(), kMaxColumnName) << text->second;
            EXPECT_TRUE(columns.insert(lowerCase(text->second)).second) << text->second;
        }
    }
}

TEST(InventoryScripts, haveNoTextsWithoutAScript) {
    std::set<std::string> known;
    for (const std::string& name : scriptNames()) {
        const Script script = scriptOf(name);
        std::string title = script.title;
        std::replace(title.begin(), title.end(), ' ', '_');
        known.insert("title." + title);
        for (const std::string& property : script.properties) {
            known.insert(script.className + "." + property);
            known.insert(script.className + "." + property + ".Size");
        }
    }
    for (const auto& [key, text] : resources())
        EXPECT_TRUE(known.count(key)) << key;
}

}  // namespace
}  // namespace cimomd
