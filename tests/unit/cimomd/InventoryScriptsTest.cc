// The shipped scripts and their resource texts against the shipped schema. What becomes of their
// names in the files of each product is tried with the whole generator.

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "mof/MofCompiler.h"
#include "providers/ProviderList.h"
#include "system/RecordedSystemCalls.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

// The narrowest product takes this many characters in a column's name.
constexpr std::size_t kMaxColumnName = 18;
// Longer ones are shortened.
constexpr std::size_t kMaxTitle = 13;

const Pegasus::CIMNamespaceName kNamespace("root/cimv2");

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

const ClassRepository& schema() {
    static const ClassRepository repository = [] {
        ClassRepository compiled;
        MofCompiler(compiled, kNamespace)
            .compileFile(std::filesystem::path(SCHEMA_DIR) / "cimomd.mof");
        return compiled;
    }();
    return repository;
}

/// Calls `visit` with each property that a script lists and the key of its resource texts.
template <typename Visitor>
void forEachListedProperty(const Visitor& visit) {
    for (const std::string& name : scriptNames()) {
        const Script script = scriptOf(name);
        const auto* found =
            schema().findClass(kNamespace, Pegasus::CIMName(cimString(script.className)));
        ASSERT_NE(found, nullptr) << name;
        for (const std::string& property : script.properties) {
            const Pegasus::Uint32 index =
                found->findProperty(Pegasus::CIMName(cimString(property)));
            ASSERT_NE(index, Pegasus::PEG_NOT_FOUND) << script.className << "." << property;
            visit(found->getProperty(index), script.className + "." + property);
        }
    }
}

Pegasus::Array<Pegasus::String> valuesOf(const Pegasus::CIMConstProperty& property) {
    Pegasus::Array<Pegasus::String> texts;
    const Pegasus::Uint32 index = property.findQualifier("Values");
    if (index != Pegasus::PEG_NOT_FOUND)
        property.getQualifier(index).getValue().get(texts);
    return texts;
}

TEST(InventoryScripts, nameClassesAndPropertiesThatAreServed) {
    ASSERT_FALSE(scriptNames().empty());
    for (const std::string& name : scriptNames()) {
        const Script script = scriptOf(name);
        const auto* found =
            schema().findClass(kNamespace, Pegasus::CIMName(cimString(script.className)));
        ASSERT_NE(found, nullptr) << name;
        EXPECT_EQ(utf8Of(found->getClassName().getString()), script.className);
        EXPECT_FALSE(script.properties.empty()) << name;
    }
    forEachListedProperty([](const Pegasus::CIMConstProperty& property, const std::string& key) {
        EXPECT_EQ(utf8Of(property.getName().getString()), key.substr(key.find('.') + 1));
    });
}

// A class without instances would leave its place to the instances of the next one.
TEST(InventoryScripts, haveOneClassEach) {
    std::set<std::string> classes;
    for (const std::string& name : scriptNames()) {
        const std::string text = textOf(name);
        EXPECT_EQ(text.find("G["), text.rfind("G[")) << name;
        EXPECT_TRUE(classes.insert(scriptOf(name).className).second) << name;
    }
}

// Velmira_MissingValue is for those who wonder what the tables lack.
TEST(InventoryScripts, listEveryClassThatIsServed) {
    const SystemPaths paths("/nonexistent");
    const RecordedSystemCalls calls(paths);
    std::set<std::string> served;
    for (const auto& provider : makeProviders(paths, calls))
        served.insert(provider->className());
    EXPECT_EQ(served.erase("Velmira_MissingValue"), 1U);
    std::set<std::string> listed;
    for (const std::string& name : scriptNames())
        listed.insert(scriptOf(name).className);
    EXPECT_EQ(listed, served);
}

// Of 64 bits only the lower 32 are written. No frame is that long.
TEST(InventoryScripts, listNumbersThatSurviveTheOutput) {
    forEachListedProperty([](const Pegasus::CIMConstProperty& property, const std::string& key) {
        const bool is64Bit = property.getType() == Pegasus::CIMTYPE_UINT64 ||
                             property.getType() == Pegasus::CIMTYPE_SINT64;
        EXPECT_FALSE(is64Bit && !property.isArray() &&
                     key.find(".ActiveMaximumTransmissionUnit") == std::string::npos)
            << key;
    });
}

TEST(InventoryScripts, haveColumnsThatTheirWordsFitInto) {
    const auto texts = resources();
    forEachListedProperty([&](const Pegasus::CIMConstProperty& property, const std::string& key) {
        const auto size = texts.find(key + ".Size");
        if (size == texts.end())
            return;
        EXPECT_FALSE(property.isArray()) << key << " is as wide as every array";
        const unsigned long width = std::stoul(size->second);
        EXPECT_TRUE(width > 0 && width <= 255) << key;
        const Pegasus::Array<Pegasus::String> values = valuesOf(property);
        for (Pegasus::Uint32 i = 0; i < values.size(); ++i)
            EXPECT_LE(utf8Of(values[i]).size(), width) << key << ": " << utf8Of(values[i]);
    });
}

TEST(InventoryScripts, haveReadableNamesThatEveryProductTakes) {
    const auto texts = resources();
    for (const std::string& name : scriptNames()) {
        const Script script = scriptOf(name);
        std::string title = script.title;
        std::replace(title.begin(), title.end(), ' ', '_');
        ASSERT_TRUE(texts.count("title." + title)) << title;
        EXPECT_LE(texts.at("title." + title).size(), kMaxTitle) << title;
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
