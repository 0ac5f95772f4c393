#include "bench/synthetic/ReadyInventory.h"

#include "bench/synthetic/SyntheticInstance.h"
#include "bench/synthetic/SyntheticXml.h"

namespace bench {

namespace {

ReadyAnswer classAnswer(const SyntheticClass& synthetic, Random& random) {
    ReadyAnswer answer("GetClass");
    answer.append(classXml(synthetic, random));
    answer.finish();
    return answer;
}

ReadyAnswer instancesAnswer(const SyntheticClass& synthetic, std::size_t count, Random& random) {
    ReadyAnswer answer("EnumerateInstances");
    std::string xml;
    for (std::size_t i = 0; i < count; ++i) {
        xml.clear();
        appendInstanceXml(synthetic, makeInstance(synthetic, i, random), xml);
        answer.append(xml);
    }
    answer.finish();
    return answer;
}

std::string key(std::string_view method, std::string_view className) {
    return std::string(method) + " " + std::string(className);
}

}  // namespace

ReadyInventory::ReadyInventory(const InventorySize& size) {
    for (std::size_t i = 0; i < size.classes; ++i) {
        const SyntheticClass synthetic = makeClass(i, size.properties);
        Random random(i + 1);
        answers.emplace(key("GetClass", synthetic.name), classAnswer(synthetic, random));
        answers.emplace(key("EnumerateInstances", synthetic.name),
                        instancesAnswer(synthetic, size.instances, random));
        classList.push_back(synthetic);
    }
}

const ReadyAnswer* ReadyInventory::find(std::string_view method, std::string_view className) const {
    const auto found = answers.find(key(method, className));
    return found == answers.end() ? nullptr : &found->second;
}

}  // namespace bench
