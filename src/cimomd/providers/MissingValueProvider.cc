#include "providers/MissingValueProvider.h"

#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"

namespace cimomd {
namespace {

// Velmira_MissingValue.Reason
Pegasus::Uint16 reasonNumber(Absence reason) {
    switch (reason) {
        case Absence::Absent:
            return 2;
        case Absence::NeedsRoot:
            return 3;
        case Absence::Filtered:
            return 4;
        case Absence::TimedOut:
            return 5;
        case Absence::Unreadable:
            return 6;
    }
    return 0;
}

Fact<std::string> orNothing(const std::string& text) {
    return text.empty() ? Fact<std::string>() : Fact<std::string>(text);
}

/// Reads one provider after the other; holds one of its instances at a time.
class MissingValueStream : public InstanceStream {
  public:
    explicit MissingValueStream(std::vector<const Provider*> asked) : providers(std::move(asked)) {}

    bool next(ProvidedInstance& out) override {
        while (reported == current.missing.size()) {
            if (!readOn())
                return false;
        }
        out = publish(current.missing[reported++]);
        return true;
    }

  private:
    /// The next instance, the next provider's absence, or false at the end of all.
    bool readOn() {
        reported = 0;
        current = {};
        if (stream == nullptr && position == providers.size())
            return false;
        try {
            if (stream == nullptr)
                stream = providers[position++]->enumerate();
            else if (!stream->next(current))
                endOfProvider(stream->absence());
        } catch (const std::exception&) {
            endOfProvider(Absence::Unreadable);
        } catch (const Pegasus::Exception&) {
            endOfProvider(Absence::Unreadable);
        }
        return true;
    }

    void endOfProvider(const std::optional<Absence>& absence) {
        stream.reset();
        current = {};
        if (absence)
            current.missing.push_back({"", *absence});
    }

    ProvidedInstance publish(const MissingValue& value) const {
        const char* className = providers[position - 1]->className();
        InstanceBuilder builder(MissingValueProvider::kClassName);
        builder
            .key("InstanceID",
                 fmt::format("Velmira:{}:{}:{}", className, value.property, current.identity),
                 kNameLength)
            .text("TargetClassName", std::string(className))
            .text("TargetIdentity", orNothing(current.identity))
            .text("PropertyName", orNothing(value.property))
            .value<Pegasus::Uint16>("Reason", reasonNumber(value.reason));
        return builder.take();
    }

    std::vector<const Provider*> providers;
    std::unique_ptr<InstanceStream> stream;
    /// One past the provider that `stream` belongs to, or belonged to.
    std::size_t position = 0;
    ProvidedInstance current;
    std::size_t reported = 0;
};

}  // namespace

MissingValueProvider::MissingValueProvider(const std::vector<std::unique_ptr<Provider>>& others) {
    for (const auto& provider : others)
        providers.push_back(provider.get());
}

std::unique_ptr<InstanceStream> MissingValueProvider::enumerate() const {
    return std::make_unique<MissingValueStream>(providers);
}

}  // namespace cimomd
