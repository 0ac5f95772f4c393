// The inner parts of a run, each alone, on a synthetic answer of 1,000 instances of 20 properties.

#include <Pegasus/Client/CIMClient.h>
#include <benchmark/benchmark.h>

#include <Velm/Properties.h>

#include <filesystem>
#include <string>
#include <string_view>

#include "CimScriptParser/CimScriptParser.h"
#include "SennetConverter/framework/CimInstanceLists.h"
#include "SennetConverter/framework/PropertyLookup.h"
#include "SennetConverter/framework/SennetUtilities.h"
#include "SennetConverter/mif/SmsSennetConverter.h"
#include "bench/synthetic/SyntheticInstance.h"
#include "bench/synthetic/SyntheticScripts.h"
#include "bench/synthetic/SyntheticXml.h"
#include "cimclient/xml/CimXmlReader.h"
#include "cimclient/xml/MemorySource.h"

namespace {

using namespace Pegasus;

constexpr std::size_t kInstances = 1000;
constexpr unsigned kMaxNameLength = 30;
constexpr const char* kMessageId = "1";
constexpr const char* kText = "left bay of the upper shelf, \"B\" & spare";

const bench::SyntheticClass& syntheticClass() {
    static const bench::SyntheticClass made = bench::makeClass(0, 20);
    return made;
}

std::string makeInstancesAnswer() {
    bench::Random random(1);
    std::string xml = bench::answerOpening(kMessageId, "EnumerateInstances");
    for (std::size_t i = 0; i < kInstances; ++i) {
        bench::appendInstanceXml(syntheticClass(), bench::makeInstance(syntheticClass(), i, random),
                                 xml);
    }
    return xml += bench::answerEnd();
}

std::string makeClassAnswer() {
    bench::Random random(1);
    std::string xml = bench::answerOpening(kMessageId, "GetClass");
    xml += bench::classXml(syntheticClass(), random);
    return xml += bench::answerEnd();
}

const std::string& instancesAnswer() {
    static const std::string xml = makeInstancesAnswer();
    return xml;
}

Array<CIMInstance> decodedInstances() {
    MemorySource source(instancesAnswer());
    return decodeEnumerateInstancesResponse(source, kMessageId);
}

CIMClass decodedClass() {
    static const std::string xml = makeClassAnswer();
    MemorySource source(xml);
    return decodeGetClassResponse(source, kMessageId);
}

/// A directory with the inventory script of the synthetic class, which goes with this object.
class ScriptDirectory {
  public:
    ScriptDirectory() {
        std::string name = (std::filesystem::temp_directory_path() / "inner-parts-XXXXXX").string();
        path = ::mkdtemp(name.data());
        bench::writeScripts(path, {syntheticClass()});
    }
    ~ScriptDirectory() { std::filesystem::remove_all(path); }
    ScriptDirectory(const ScriptDirectory&) = delete;
    ScriptDirectory& operator=(const ScriptDirectory&) = delete;

    String script() const {
        return String((path / (syntheticClass().name + ".script.inv")).c_str());
    }
    String output() const { return String((path / "out.mif").c_str()); }

  private:
    std::filesystem::path path;
};

void decodeInstances(benchmark::State& state) {
    for (auto _ : state) {
        benchmark::DoNotOptimize(decodedInstances().size());
    }
    state.SetBytesProcessed(state.iterations() *
                            static_cast<std::int64_t>(instancesAnswer().size()));
}
BENCHMARK(decodeInstances);

void decodeClass(benchmark::State& state) {
    for (auto _ : state) {
        benchmark::DoNotOptimize(decodedClass().getPropertyCount());
    }
}
BENCHMARK(decodeClass);

void stringFromUtf8(benchmark::State& state) {
    for (auto _ : state) {
        benchmark::DoNotOptimize(String(kText).size());
    }
}
BENCHMARK(stringFromUtf8);

void stringToUtf8(benchmark::State& state) {
    const String text(kText);
    for (auto _ : state) {
        benchmark::DoNotOptimize(static_cast<const char*>(text.getCString()));
    }
}
BENCHMARK(stringToUtf8);

void lookUpProperties(benchmark::State& state) {
    CIMClass cimClass = decodedClass();
    CIMInstance instance = decodedInstances()[0];
    std::vector<PropertyLookup> columns;
    for (const bench::SyntheticProperty& property : syntheticClass().properties) {
        columns.emplace_back(cimClass, CIMName(property.name.c_str()));
    }
    for (auto _ : state) {
        for (const PropertyLookup& column : columns) {
            benchmark::DoNotOptimize(column.in(&instance).type);
        }
    }
}
BENCHMARK(lookUpProperties);

void renderRows(benchmark::State& state) {
    const ScriptDirectory directory;
    CimScriptParser parser(directory.script());
    parser.parse();
    Array<CIMClass> classes;
    classes.append(decodedClass());
    Array<CIMInstance> instances = decodedInstances();
    CimInstanceLists lists;
    lists.addInstanceList(instances);
    for (auto _ : state) {
        SmsSennetConverter converter(directory.output(), Velm::Properties(), kMaxNameLength);
        converter.printOutput(parser, classes, lists);
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(kInstances));
}
BENCHMARK(renderRows);

void escapeText(benchmark::State& state) {
    const ScriptDirectory directory;
    SmsSennetConverter converter(directory.output(), Velm::Properties(), kMaxNameLength);
    const String text(kText);
    for (auto _ : state) {
        benchmark::DoNotOptimize(converter.formatString(text).size());
    }
}
BENCHMARK(escapeText);

void hashName(benchmark::State& state) {
    const String name("OperationalStatus");
    for (auto _ : state) {
        benchmark::DoNotOptimize(CIMName(name).hash());
    }
}
BENCHMARK(hashName);

void shortenName(benchmark::State& state) {
    const String name("A Title That Is Too Long For A Table");
    for (auto _ : state) {
        benchmark::DoNotOptimize(SennetUtilities::hashString(name, kMaxNameLength).size());
    }
}
BENCHMARK(shortenName);

}  // namespace

BENCHMARK_MAIN();
