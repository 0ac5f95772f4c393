// Values of every type on their way from a provider through an answer to the client: what arrives
// is what was sent.

#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "FuzzBytes.h"
#include "FuzzService.h"
#include "Require.h"
#include "providers/RecordStream.h"
#include "xml/CimXmlReader.h"
#include "xml/MemorySource.h"

namespace {

using namespace Pegasus;

constexpr unsigned kMaxInstances = 4;
constexpr unsigned kMaxElements = 3;
constexpr unsigned kMaxCharacters = 8;

// --- values from octets --------------------------------------------------------------------------

// What XML can carry; one half of a pair is no character.
bool isCharacter(Uint16 code) {
    const bool isControl = code < 0x20 && code != '\t' && code != '\n' && code != '\r';
    return !isControl && (code < 0xD800 || code > 0xDFFF) && code < 0xFFFE;
}

bool isBlank(Uint16 code) {
    return code == ' ' || code == '\t' || code == '\n' || code == '\r';
}

// Half of them ASCII.
Uint16 anyCharacter(FuzzBytes& bytes) {
    const Uint16 code = bytes.below(2) == 0 ? bytes.number<Uint8>() : bytes.number<Uint16>();
    return isCharacter(code) ? code : Uint16{'x'};
}

// Not blank at its ends: readers of CIM-XML drop that.
String anyText(FuzzBytes& bytes) {
    String text;
    for (unsigned left = bytes.below(kMaxCharacters + 1); left > 0; --left) {
        if (bytes.below(8) == 0) {
            text.append(Char16(Uint16(0xD800 + bytes.number<Uint16>() % 0x400)));
            text.append(Char16(Uint16(0xDC00 + bytes.number<Uint16>() % 0x400)));
        } else {
            text.append(Char16(anyCharacter(bytes)));
        }
    }
    for (const Uint32 end : {Uint32{0}, text.size()}) {
        const Uint32 position = end == 0 ? 0 : end - 1;
        if (position < text.size() && isBlank(text[position])) {
            text[position] = Char16('b');
        }
    }
    return text;
}

void fill(FuzzBytes& bytes, Boolean& value) {
    value = bytes.below(2) != 0;
}
template <typename Number>
requires std::is_integral_v<Number>
void fill(FuzzBytes& bytes, Number& value) {
    value = bytes.number<Number>();
}
template <typename Number>
requires std::is_floating_point_v<Number>
void fill(FuzzBytes& bytes, Number& value) {
    value = bytes.number<Number>();
    value = std::isfinite(value) ? value : Number{0};
}
void fill(FuzzBytes& bytes, Char16& value) {
    value = Char16(anyCharacter(bytes));
}
void fill(FuzzBytes& bytes, String& value) {
    value = anyText(bytes);
}
void fill(FuzzBytes& bytes, CIMDateTime& value) {
    const unsigned hour = bytes.below(24);
    const unsigned minute = bytes.below(60);
    const unsigned second = bytes.below(60);
    const unsigned micros = bytes.number<Uint32>() % 1000000;
    const std::string time = fmt::format("{:02}{:02}{:02}.{:06}", hour, minute, second, micros);
    if (bytes.below(2) == 0) {
        const unsigned days = bytes.number<Uint32>() % 100000000;
        value = CIMDateTime(fmt::format("{:08}{}:000", days, time).c_str());
        return;
    }
    const unsigned year = bytes.number<Uint16>() % 10000;
    const unsigned month = 1 + bytes.below(12);
    const unsigned day = 1 + bytes.below(28);
    const char sign = bytes.below(2) == 0 ? '+' : '-';
    const unsigned offset = bytes.number<Uint16>() % 1000;
    value = CIMDateTime(
        fmt::format("{:04}{:02}{:02}{}{}{:03}", year, month, day, time, sign, offset).c_str());
}
void fill(FuzzBytes& bytes, CIMObjectPath& value) {
    Array<CIMKeyBinding> keys;
    keys.append(CIMKeyBinding(CIMName("Text"), anyText(bytes), CIMKeyBinding::STRING));
    keys.append(CIMKeyBinding(CIMName("Number"), CIMValue(bytes.number<Sint64>())));
    const CIMNamespaceName nameSpace =
        bytes.below(2) == 0 ? CIMNamespaceName() : CIMNamespaceName("root/other");
    value = CIMObjectPath(String(), nameSpace, CIMName("T_Other"), keys);
}
void fill(FuzzBytes& bytes, CIMInstance& value) {
    value = CIMInstance(CIMName("T_Inner"));
    value.addProperty(CIMProperty(CIMName("Text"), CIMValue(anyText(bytes))));
    value.addProperty(CIMProperty(CIMName("Number"), CIMValue(bytes.number<Uint16>())));
}
void fill(FuzzBytes& bytes, CIMObject& value) {
    CIMInstance instance;
    fill(bytes, instance);
    value = CIMObject(instance);
}

template <typename Scalar>
CIMValue anyValueOf(FuzzBytes& bytes) {
    const unsigned choice = bytes.below(4);
    if (choice < 2) {
        return CIMValue(kCimTypeOf<Scalar>, choice == 1);
    }
    Array<Scalar> elements;
    for (unsigned left = choice == 2 ? 1 : bytes.below(kMaxElements + 1); left > 0; --left) {
        Scalar element{};
        fill(bytes, element);
        elements.append(element);
    }
    if (choice == 2) {
        return CIMValue(Scalar(elements[0]));
    }
    return CIMValue(elements);
}

template <typename... Scalars>
struct AnyValue {
    static CIMValue of(unsigned type, FuzzBytes& bytes) {
        constexpr std::array<CIMValue (*)(FuzzBytes&), sizeof...(Scalars)> kMakers = {
            anyValueOf<Scalars>...};
        return kMakers[type](bytes);
    }
    static constexpr unsigned kTypes = sizeof...(Scalars);
};
using Values = CimScalarTypes<AnyValue>;

std::string propertyName(unsigned type, bool isArray) {
    return fmt::format("{}{}", isArray ? 'A' : 'S', type);
}

// The types that MOF has no word for are qualified strings.
std::string declaration(unsigned type, bool isArray) {
    const auto cimType = static_cast<CIMType>(type);
    const char* brackets = isArray ? "[]" : "";
    if (cimType == CIMTYPE_OBJECT || cimType == CIMTYPE_INSTANCE) {
        return fmt::format(
            "[{}] string {}{};\n",
            cimType == CIMTYPE_OBJECT ? "EmbeddedObject" : "EmbeddedInstance(\"T_Inner\")",
            propertyName(type, isArray), brackets);
    }
    if (cimType == CIMTYPE_REFERENCE) {
        return fmt::format("string {}{};\n", propertyName(type, isArray), brackets);
    }
    return fmt::format("{} {}{};\n", cimTypeToString(cimType), propertyName(type, isArray),
                       brackets);
}

std::string classes() {
    std::string mof =
        "Qualifier Key : boolean = false, Scope(property), Flavor(DisableOverride);\n"
        "Qualifier EmbeddedObject : boolean = false, Scope(property);\n"
        "Qualifier EmbeddedInstance : string, Scope(property);\n"
        "class T_Inner { string Text; uint16 Number; };\n"
        "class T_Thing {\n[Key] uint32 Id;\n";
    for (unsigned type = 0; type < Values::kTypes; ++type) {
        mof += declaration(type, false) + declaration(type, true);
    }
    return mof + "};\n";
}

// --- there and back ------------------------------------------------------------------------------

class Things : public cimomd::Provider {
  public:
    const char* className() const override { return "T_Thing"; }
    std::unique_ptr<cimomd::InstanceStream> enumerate() const override {
        return std::make_unique<cimomd::RecordStream<CIMInstance>>(
            sent, [](const CIMInstance& instance) {
                return cimomd::ProvidedInstance{instance, {}, {}};
            });
    }

    std::vector<CIMInstance> sent;
};

CIMInstance anyInstance(Uint32 id, FuzzBytes& bytes) {
    CIMInstance instance(CIMName("T_Thing"));
    instance.addProperty(CIMProperty(CIMName("Id"), CIMValue(id)));
    for (unsigned type = 0; type < Values::kTypes; ++type) {
        // Most of the types each time, so that instances resemble each other.
        if (bytes.below(8) != 0) {
            const CIMValue value = Values::of(type, bytes);
            const std::string name = propertyName(type, value.isArray());
            instance.addProperty(CIMProperty(CIMName(name.c_str()), value));
        }
    }
    return instance;
}

std::string answerTo(const cimomd::CimService& service) {
    const std::string request =
        "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE ID=\"7\" PROTOCOLVERSION=\"1.0\">"
        "<SIMPLEREQ><IMETHODCALL NAME=\"EnumerateInstances\"><LOCALNAMESPACEPATH>"
        "<NAMESPACE NAME=\"root\"/><NAMESPACE NAME=\"cimv2\"/></LOCALNAMESPACEPATH>"
        "<IPARAMVALUE NAME=\"ClassName\"><CLASSNAME NAME=\"T_Thing\"/></IPARAMVALUE>"
        "</IMETHODCALL></SIMPLEREQ></MESSAGE></CIM>";
    const cimomd::HttpAnswer answer = service.answer(cimomd::HttpHead{}, request);
    std::string text;
    std::array<char, 4096> buffer{};
    std::size_t count = 0;
    while (answer.body->read(buffer.data(), buffer.size(), count) ==
           cimomd::ResponseStream::Outcome::Data) {
        text.append(buffer.data(), count);
    }
    return text;
}

struct SameElement {
    bool operator()(const CIMInstance& a, const CIMInstance& b) const {
        return CIMValue(a).toString() == CIMValue(b).toString();
    }
    bool operator()(const CIMObject& a, const CIMObject& b) const {
        return CIMValue(a).toString() == CIMValue(b).toString();
    }
    bool operator()(Char16 a, Char16 b) const { return Uint16{a} == Uint16{b}; }
    template <typename Number>
    requires std::is_floating_point_v<Number>
    bool operator()(Number a, Number b) const {
        return a == b && std::signbit(a) == std::signbit(b);
    }
    template <typename T>
    requires(!std::is_floating_point_v<T>) bool operator()(const T& a, const T& b) const {
        return a == b;
    }
};

struct SameValue {
    const CIMValue& received;

    bool operator()(std::monostate) const { return received.isNull(); }
    template <typename T>
    bool operator()(const T& scalar) const {
        T other{};
        received.get(other);
        return !received.isNull() && SameElement()(scalar, other);
    }
    template <typename T>
    bool operator()(const Array<T>& elements) const {
        Array<T> others;
        received.get(others);
        bool isSame = !received.isNull() && elements.size() == others.size();
        for (Uint32 i = 0; isSame && i < elements.size(); ++i) {
            isSame = SameElement()(elements[i], std::as_const(others)[i]);
        }
        return isSame;
    }
};

void requireSame(const CIMConstInstance& sent, const CIMConstInstance& received) {
    require(sent.getPropertyCount() == received.getPropertyCount());
    for (Uint32 i = 0; i < sent.getPropertyCount(); ++i) {
        require(sent.getProperty(i).getName() == received.getProperty(i).getName());
        const CIMValue before = sent.getProperty(i).getValue();
        const CIMValue after = received.getProperty(i).getValue();
        require(before.getType() == after.getType() && before.isArray() == after.isArray());
        require(before.visit(SameValue{after}));
    }
}

struct Server {
    Server() : Server(std::make_unique<Things>()) {}

    Things& things;
    FuzzService model;

  private:
    explicit Server(std::unique_ptr<Things> provider)
        : things(*provider), model(classes(), std::move(provider)) {}
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static Server server;
    FuzzBytes bytes(data, size);
    std::vector<CIMInstance>& sent = server.things.sent;
    sent.clear();
    while (!bytes.empty() && sent.size() < kMaxInstances) {
        sent.push_back(anyInstance(static_cast<Uint32>(sent.size()), bytes));
    }
    const std::string text = answerTo(server.model.service);
    MemorySource source(text);
    const Array<CIMInstance> received = decodeEnumerateInstancesResponse(source, "7");
    require(received.size() == sent.size());
    for (Uint32 i = 0; i < received.size(); ++i) {
        requireSame(sent[i], received[i]);
    }
    return 0;
}
