#include "protocol/Dispatcher.h"

#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include "CimRequests.h"
#include "mof/MofCompiler.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

/// Serves numbered instances of a class; fails before the one that `failAt` counts.
class NumberProvider : public Provider {
  public:
    NumberProvider(const char* name, int count, int failAt = -1)
        : name(name), count(count), failAt(failAt) {}

    const char* className() const override { return name; }

    std::unique_ptr<InstanceStream> enumerate() const override {
        std::vector<int> numbers;
        for (int i = 1; i <= count; ++i)
            numbers.push_back(i);
        const NumberProvider* self = this;
        return std::make_unique<RecordStream<int>>(
            numbers, [self](const int& number) { return self->publish(number); });
    }

  private:
    ProvidedInstance publish(int number) const {
        if (number == failAt)
            throw ProviderError("the source broke");
        InstanceBuilder builder(name);
        builder.value<Pegasus::Uint32>("Id", static_cast<Pegasus::Uint32>(number))
            .text("Note", std::nullopt);
        if (std::string(name) == "Leaf")
            builder.text("More", "m");
        return builder.take();
    }

    const char* name;
    int count;
    int failAt;
};

class DispatcherTest : public testing::Test {
  protected:
    DispatcherTest() {
        MofCompiler(repository, Pegasus::CIMNamespaceName("root/cimv2")).compileText(kText, "t");
    }

    /// The elements that the operation returns, or "code: description" of its failure.
    std::string answerTo(const std::string& body) {
        const Pegasus::CimRequest request = decoded(body);
        std::string xml;
        try {
            const auto answer = Dispatcher(repository, providers).dispatch(request);
            while (answer->next(xml)) {
            }
        } catch (const Pegasus::CIMException& error) {
            return std::to_string(error.getCode()) + ": " + utf8Of(error.getMessage());
        }
        return xml;
    }

    static bool has(const std::string& xml, std::string_view part) {
        return xml.find(part) != std::string::npos;
    }
    static int count(const std::string& xml, std::string_view part) {
        int found = 0;
        for (std::size_t at = xml.find(part); at != std::string::npos; at = xml.find(part, at + 1))
            ++found;
        return found;
    }

    static constexpr std::string_view kText =
        "Qualifier Key : boolean = false, Scope(property), Flavor(DisableOverride);\n"
        "Qualifier Description : string, Scope(any), Flavor(Translatable);\n"
        "[Description(\"d\")] class Base { [Key] uint32 Id; string Note; };\n"
        "class Leaf : Base { string More; };\n"
        "class Other : Base { };\n";

    ClassRepository repository;
    ProviderList providers;
};

TEST_F(DispatcherTest, namesWhatIsWrongWithARequest) {
    const std::string unknownOperation = "7: the operation DeleteClass is not supported";
    EXPECT_EQ(answerTo(requestBody("DeleteClass", "root/cimv2", "Base")), unknownOperation);
    EXPECT_EQ(answerTo(requestBody("DeleteClass", "root/none", "Base")), unknownOperation);
    EXPECT_EQ(answerTo(requestBody("OpenEnumerateInstances", "root/cimv2", "Base")),
              "7: the operation OpenEnumerateInstances is not supported");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/none", "Base")),
              "3: there is no namespace root/none");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/cimv2", "None")),
              "6: there is no class None in root/cimv2");
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "None")),
              "5: there is no class None in root/cimv2");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/cimv2", "")),
              "4: GetClass needs the parameter ClassName");
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "")),
              "4: EnumerateInstances needs the parameter ClassName");
    EXPECT_EQ(answerTo(requestBody("GetClass", "root/cimv2", "Base", flag("DeepInheritance", true)))
                  .substr(0, 2),
              "4:");
}

TEST_F(DispatcherTest, ignoresTheCaseOfNames) {
    EXPECT_TRUE(
        has(answerTo(requestBody("getclass", "ROOT/CIMV2", "BASE")), "<CLASS NAME=\"Base\""));
}

TEST_F(DispatcherTest, answersGetClassByItsFlags) {
    const std::string byDefault = answerTo(requestBody("GetClass", "root/cimv2", "Leaf"));
    EXPECT_TRUE(has(byDefault, "<CLASS NAME=\"Leaf\" SUPERCLASS=\"Base\""));
    EXPECT_TRUE(has(byDefault, "NAME=\"More\""));
    EXPECT_FALSE(has(byDefault, "NAME=\"Id\""));
    EXPECT_FALSE(has(byDefault, "CLASSORIGIN"));

    const std::string whole =
        answerTo(requestBody("GetClass", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + flag("IncludeClassOrigin", true)));
    EXPECT_TRUE(has(whole, "NAME=\"Id\""));
    EXPECT_TRUE(has(whole, "CLASSORIGIN=\"Base\""));
    EXPECT_TRUE(has(whole, "CLASSORIGIN=\"Leaf\""));
    EXPECT_TRUE(has(whole, "PROPAGATED=\"true\""));
    EXPECT_TRUE(has(whole, "QUALIFIER NAME=\"Key\""));

    const std::string bare =
        answerTo(requestBody("GetClass", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + flag("IncludeQualifiers", false)));
    EXPECT_FALSE(has(bare, "QUALIFIER"));

    const std::string some =
        answerTo(requestBody("GetClass", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + propertyList({"note", "None"})));
    EXPECT_TRUE(has(some, "NAME=\"Note\""));
    EXPECT_FALSE(has(some, "NAME=\"Id\""));
    EXPECT_FALSE(has(some, "NAME=\"More\""));
}

TEST_F(DispatcherTest, givesTheInstancesOfAClassAndItsSubclasses) {
    providers.push_back(std::make_unique<NumberProvider>("Other", 1));
    providers.push_back(std::make_unique<NumberProvider>("Leaf", 2));
    const std::string all =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base", flag("LocalOnly", false)));
    EXPECT_EQ(count(all, "<VALUE.NAMEDINSTANCE>"), 3);
    EXPECT_EQ(count(all,
                    "<INSTANCENAME CLASSNAME=\"Leaf\"><KEYBINDING NAME=\"Id\"><KEYVALUE "
                    "VALUETYPE=\"numeric\""),
              2);
    EXPECT_LT(all.find("CLASSNAME=\"Leaf\""), all.find("CLASSNAME=\"Other\""));
    EXPECT_EQ(count(all, "NAME=\"More\""), 2);
    const std::string leaves =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "leaf", flag("LocalOnly", false)));
    EXPECT_EQ(count(leaves, "<VALUE.NAMEDINSTANCE>"), 2);
}

TEST_F(DispatcherTest, leavesOutWhatTheFlagsLeaveOut) {
    providers.push_back(std::make_unique<NumberProvider>("Leaf", 1));
    const std::string shallow =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base",
                             flag("LocalOnly", false) + flag("DeepInheritance", false)));
    EXPECT_TRUE(has(shallow, "PROPERTY NAME=\"Id\""));
    EXPECT_FALSE(has(shallow, "NAME=\"More\""));
    const std::string shallowSome =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base",
                             flag("LocalOnly", false) + flag("DeepInheritance", false) +
                                 propertyList({"More", "Note"})));
    EXPECT_TRUE(has(shallowSome, "PROPERTY NAME=\"Note\""));
    EXPECT_FALSE(has(shallowSome, "NAME=\"More\""));
    EXPECT_FALSE(has(shallowSome, "PROPERTY NAME=\"Id\""));
    const std::string local = answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf"));
    EXPECT_TRUE(has(local, "PROPERTY NAME=\"More\""));
    EXPECT_FALSE(has(local, "PROPERTY NAME=\"Id\""));
    const std::string origin =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf",
                             flag("LocalOnly", false) + flag("IncludeClassOrigin", true)));
    EXPECT_TRUE(has(origin, "CLASSORIGIN=\"Base\""));
    const std::string nothing =
        answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf", propertyList({})));
    EXPECT_TRUE(has(nothing, "<INSTANCENAME CLASSNAME=\"Leaf\">"));
    EXPECT_FALSE(has(nothing, "<PROPERTY"));
}

TEST_F(DispatcherTest, anotherClassDoesNotSufferFromAFailingProvider) {
    providers.push_back(std::make_unique<NumberProvider>("Other", 3, 2));
    providers.push_back(std::make_unique<NumberProvider>("Leaf", 1));
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "Other")),
              "1: Other: the source broke");
    EXPECT_EQ(count(answerTo(requestBody("EnumerateInstances", "root/cimv2", "Leaf")),
                    "<VALUE.NAMEDINSTANCE>"),
              1);
}

TEST_F(DispatcherTest, aClassWithoutProviderHasNoInstances) {
    EXPECT_EQ(answerTo(requestBody("EnumerateInstances", "root/cimv2", "Base")), "");
}

}  // namespace
}  // namespace cimomd
