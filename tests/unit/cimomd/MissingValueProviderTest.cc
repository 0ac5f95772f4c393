#include "providers/MissingValueProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

namespace cimomd {
namespace {

class DiskProvider : public Provider {
  public:
    const char* className() const override { return "Test_Disk"; }
    std::unique_ptr<InstanceStream> enumerate() const override {
        return std::make_unique<RecordStream<std::string>>(
            std::vector<std::string>{"sda", "sdb"}, [](const std::string& name) {
                InstanceBuilder builder("Test_Disk");
                builder.key("DeviceID", name)
                    .text("SerialNumber", name == "sda" ? Fact<std::string>(Absence::NeedsRoot)
                                                        : Fact<std::string>("S1"))
                    .value<Pegasus::Uint32>("Rate", Absence::TimedOut);
                return builder.take();
            });
    }
};

class NoServiceProvider : public Provider {
  public:
    const char* className() const override { return "Test_Service"; }
    std::unique_ptr<InstanceStream> enumerate() const override {
        return std::make_unique<EmptyStream>(Absence::Absent);
    }
};

class FailingProvider : public Provider {
  public:
    const char* className() const override { return "Test_Broken"; }
    std::unique_ptr<InstanceStream> enumerate() const override { throw ProviderError("broken"); }
};

struct Row {
    std::string id;
    std::string className;
    std::string identity;
    std::string property;
    std::string reason;

    bool operator==(const Row&) const = default;
};

TEST(MissingValueProvider, tellsEveryNullAndEveryClassThatCannotBeRead) {
    std::vector<std::unique_ptr<Provider>> others;
    others.push_back(std::make_unique<NoServiceProvider>());
    others.push_back(std::make_unique<DiskProvider>());
    others.push_back(std::make_unique<FailingProvider>());
    std::vector<Row> rows;
    for (const auto& instance : all(MissingValueProvider(others).enumerate()))
        rows.push_back({textOf(instance, "InstanceID"), textOf(instance, "TargetClassName"),
                        textOf(instance, "TargetIdentity"), textOf(instance, "PropertyName"),
                        textOf(instance, "Reason")});
    EXPECT_EQ(rows,
              (std::vector<Row>{
                  {"Velmira:Test_Service::", "Test_Service", "null", "null", "2"},
                  {"Velmira:Test_Disk:SerialNumber:sda", "Test_Disk", "sda", "SerialNumber", "3"},
                  {"Velmira:Test_Disk:Rate:sda", "Test_Disk", "sda", "Rate", "5"},
                  {"Velmira:Test_Disk:Rate:sdb", "Test_Disk", "sdb", "Rate", "5"},
                  {"Velmira:Test_Broken::", "Test_Broken", "null", "null", "6"}}));
}

TEST(MissingValueProvider, hasNothingToTellOfNoProvider) {
    EXPECT_TRUE(all(MissingValueProvider({}).enumerate()).empty());
}

}  // namespace
}  // namespace cimomd
