// Answers made to defeat the recognition of what repeats: four times as much of them may take four
// times as long, but not sixteen times.

#include <gtest/gtest.h>

#include <algorithm>
#include <ctime>
#include <random>
#include <string>
#include <vector>

#include "ResponseText.h"
#include "xml/CimXmlReader.h"
#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

constexpr int kMany = 400;

std::string property(int number, const char* type = "string") {
    return "<PROPERTY NAME=\"P" + std::to_string(number) + "\" TYPE=\"" + type +
           "\"><VALUE>1</VALUE></PROPERTY>\n";
}

std::string instanceOf(int classNumber, const std::string& members) {
    return "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"T\"/><INSTANCE CLASSNAME=\"T" +
           std::to_string(classNumber) + "\">" + members + "</INSTANCE></VALUE.NAMEDINSTANCE>";
}

std::string shuffledProperties(int size) {
    std::mt19937 random(1);
    std::vector<int> order(kMany);
    for (int i = 0; i < kMany; ++i) {
        order[static_cast<std::size_t>(i)] = i;
    }
    std::string xml;
    for (int i = 0; i < 4 * size; ++i) {
        std::shuffle(order.begin(), order.end(), random);
        std::string members;
        for (const int number : order) {
            members += property(number);
        }
        xml += instanceOf(0, members);
    }
    return xml;
}

std::string ownSubsets(int size) {
    std::mt19937 random(1);
    std::string xml;
    for (int i = 0; i < 10 * size; ++i) {
        std::string members;
        for (int number = 0; number < kMany; ++number) {
            members += random() % 2 == 0 ? "" : property(number);
        }
        xml += instanceOf(0, members);
    }
    return xml;
}

std::string changingTypes(int size) {
    std::string xml;
    for (int i = 0; i < 6 * size; ++i) {
        std::string members;
        for (int number = 0; number < kMany; ++number) {
            members += property(number, i % 2 == 0 ? "uint8" : "uint16");
        }
        xml += instanceOf(0, members);
    }
    return xml;
}

// Each property stands before all that were seen earlier.
std::string newFirstProperties(int size) {
    std::string xml;
    for (int i = 0; i < 500 * size; ++i) {
        xml += instanceOf(i / kMany, property(i % kMany));
    }
    return xml;
}

std::string classesOfTheirOwn(int size) {
    std::string members;
    for (int number = 0; number < 10; ++number) {
        members += property(number);
    }
    std::string xml;
    for (int i = 0; i < 150 * size; ++i) {
        xml += instanceOf(i, members);
    }
    return xml;
}

// More classes in turn than are remembered.
std::string classesInTurn(int size) {
    std::string members;
    for (int number = 0; number < 10; ++number) {
        members += property(number);
    }
    std::string xml;
    for (int i = 0; i < 150 * size; ++i) {
        xml += instanceOf(i % 65, members);
    }
    return xml;
}

std::string oneLargeInstance(int size) {
    std::string members;
    for (int number = 0; number < 1500 * size; ++number) {
        members += property(number);
    }
    return instanceOf(0, members);
}

// Every other array is like the earlier ones up to its last element.
std::string arraysThatEndOtherwise(int size) {
    std::string xml;
    for (int i = 0; i < 10 * size; ++i) {
        std::string array = "<PROPERTY.ARRAY NAME=\"A\" TYPE=\"string\"><VALUE.ARRAY>";
        for (int element = 0; element < 500; ++element) {
            array += "<VALUE></VALUE>";
        }
        array += i % 2 == 0 ? "<VALUE/>" : "";
        xml += instanceOf(0, array + "</VALUE.ARRAY></PROPERTY.ARRAY>");
    }
    return xml;
}

// Processor time, for the machine may have other things to do.
double secondsFor(const std::string& instances) {
    const std::string text = instancesText(instances);
    double least = 1e9;
    for (int attempt = 0; attempt < 3; ++attempt) {
        MemorySource source(text, text.size());
        const std::clock_t begin = std::clock();
        decodeEnumerateInstancesResponse(source, "7");
        least = std::min(least, static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC);
    }
    return least;
}

struct HostileAnswer {
    const char* name;
    std::string (*instances)(int size);
};

class CostOfRepeatedInstances : public testing::TestWithParam<HostileAnswer> {};

TEST_P(CostOfRepeatedInstances, StaysInProportion) {
    constexpr double kNoise = 0.02;
    const double small = secondsFor(GetParam().instances(2));
    const double large = secondsFor(GetParam().instances(8));
    EXPECT_LT(large, 8 * (small + kNoise)) << "after " << small;
}

INSTANTIATE_TEST_SUITE_P(Answers, CostOfRepeatedInstances,
                         testing::Values(HostileAnswer{"shuffled", shuffledProperties},
                                         HostileAnswer{"subsets", ownSubsets},
                                         HostileAnswer{"types", changingTypes},
                                         HostileAnswer{"first", newFirstProperties},
                                         HostileAnswer{"classes", classesOfTheirOwn},
                                         HostileAnswer{"turns", classesInTurn},
                                         HostileAnswer{"large", oneLargeInstance},
                                         HostileAnswer{"arrays", arraysThatEndOtherwise}),
                         [](const auto& info) { return std::string(info.param.name); });

}  // namespace
}  // namespace Pegasus
