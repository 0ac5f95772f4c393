#pragma once

// Operations on a few classes and instances, without HTTP around them.

#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "CimRequests.h"
#include "ServedModel.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "text/CimText.h"

namespace cimomd {

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

class OperationFixture : public testing::Test {
  protected:
    void provide(const char* className, int count, int failAt = -1) {
        providers.push_back(std::make_unique<NumberProvider>(className, count, failAt));
    }

    /// The elements that the operation returns, or "code: description" of its failure. The
    /// providers so far serve it.
    std::string answerTo(const std::string& body) {
        const Pegasus::CimRequest request = decoded(body);
        if (model == nullptr)
            model = std::make_unique<ServedModel>(mof, std::move(providers));
        std::string xml;
        try {
            const auto answer = model->dispatcher.dispatch(request);
            while (answer->next(xml)) {
            }
        } catch (const Pegasus::CIMException& error) {
            return std::to_string(error.getCode()) + ": " + utf8Of(error.getMessage());
        }
        return xml;
    }
    std::string answerTo(const std::string& method, const std::string& className,
                         const std::string& parameters = "") {
        return answerTo(requestBody(method, "root/cimv2", className, parameters));
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

    std::string mof =
        "Qualifier Key : boolean = false, Scope(property, reference), Flavor(DisableOverride);\n"
        "Qualifier Description : string, Scope(any), Flavor(Translatable);\n"
        "[Description(\"d\")] class Base { [Key] uint32 Id; string Note; };\n"
        "class Leaf : Base { string More; };\n"
        "class Other : Base { };\n";
    ProviderList providers;

  private:
    std::unique_ptr<ServedModel> model;
};

}  // namespace cimomd
