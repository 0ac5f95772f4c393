#include "system/processor/ProcessorCache.h"

#include <gtest/gtest.h>

#include "InstanceText.h"
#include "RecordedTree.h"
#include "providers/processor/CacheMemoryProvider.h"

namespace cimomd {
namespace {

TEST(ProcessorCache, readsSizes) {
    EXPECT_EQ(parseCacheSize("32K"), 32U);
    EXPECT_EQ(parseCacheSize("16M"), 16384U);
    EXPECT_EQ(parseCacheSize("4294967296K"), 4294967296U);
    for (const char* wrong : {"", "K", "32", "0K", "-1K", "32 K", "32k", "32G", "1.5M",
                              "4294967297K", "99999999999999999999K"})
        EXPECT_FALSE(parseCacheSize(wrong).has_value()) << wrong;
}

TEST(ProcessorCache, countsASharedCacheOnce) {
    RecordedTree tree;
    for (const char* processor : {"cpu2", "cpu10", "cpu3"}) {
        const std::string base = std::string("cpu/") + processor + "/cache/";
        tree.file(base + "index0/level", "1\n").file(base + "index0/type", "Data\n");
        tree.file(base + "index3/level", "3\n")
            .file(base + "index3/type", "Unified\n")
            .file(base + "index3/shared_cpu_list", "2-3,10\n");
    }
    tree.directory("cpu/cpufreq").directory("cpu/cpu2/cache/index").directory("cpu/cpu4");
    const auto caches = readProcessorCaches(tree.root / "cpu");
    ASSERT_TRUE(caches.has_value());
    ASSERT_EQ(caches->size(), 4U);
    EXPECT_EQ((*caches)[0].firstProcessor, 2U);
    EXPECT_EQ((*caches)[0].level, 1U);
    EXPECT_EQ((*caches)[1].level, 3U);
    EXPECT_EQ((*caches)[1].sharedBy, "2-3,10");
    EXPECT_EQ((*caches)[2].firstProcessor, 3U);
    EXPECT_EQ((*caches)[2].sharedBy, std::nullopt);
    EXPECT_EQ((*caches)[3].firstProcessor, 10U);
    EXPECT_EQ(readProcessorCaches(tree.root / "none").reason(), Absence::Absent);
}

TEST(ProcessorCache, readsOddTexts) {
    RecordedTree tree;
    const std::string base = "cpu/cpu0/cache/";
    tree.file(base + "index0/level", "0\n")
        .file(base + "index1/level", "first\n")
        .file(base + "index2/level", "2\n")
        .file(base + "index2/size", "much\n")
        .file(base + "index2/ways_of_associativity", "0\n")
        .file(base + "index2/number_of_sets", "-4\n")
        .file(base + "index2/coherency_line_size", "\n");
    const auto caches = readProcessorCaches(tree.root / "cpu");
    ASSERT_EQ(caches->size(), 1U);
    const ProcessorCache& cache = caches->front();
    EXPECT_EQ(cache.sizeKB.reason(), Absence::Filtered);
    EXPECT_EQ(cache.ways.reason(), Absence::Absent);
    EXPECT_EQ(cache.sets, std::nullopt);
    EXPECT_EQ(cache.lineBytes, std::nullopt);
    EXPECT_EQ(cache.type, std::nullopt);
}

Pegasus::CIMInstance instanceOf(const ProcessorCache& cache) {
    return CacheMemoryProvider::publish("node7", cache).instance;
}

TEST(CacheMemoryProvider, publishesTheNumbersOfTheStandard) {
    ProcessorCache cache;
    cache.firstProcessor = 4;
    cache.level = 4;
    cache.type = std::string("Trace");
    cache.sizeKB = std::uint64_t{131072};
    cache.writePolicy = std::string("WriteThrough");
    EXPECT_EQ(textOf(instanceOf(cache), "DeviceID"), "L4-4");
    EXPECT_EQ(textOf(instanceOf(cache), "Caption"), "L4 cache of processor 4");
    EXPECT_EQ(textOf(instanceOf(cache), "Level"), "1");
    EXPECT_EQ(textOf(instanceOf(cache), "LevelNumber"), "4");
    EXPECT_EQ(textOf(instanceOf(cache), "CacheType"), "1");
    EXPECT_EQ(textOf(instanceOf(cache), "WritePolicy"), "3");
    EXPECT_EQ(textOf(instanceOf(cache), "BlockSize"), "1024");
    EXPECT_EQ(textOf(instanceOf(cache), "NumberOfBlocks"), "131072");
    EXPECT_EQ(textOf(instanceOf(cache), "SizeKB"), "131072");
    EXPECT_EQ(textOf(instanceOf(cache), "Volatile"), "TRUE");
    cache.writePolicy = std::string("WriteBack");
    EXPECT_EQ(textOf(instanceOf(cache), "WritePolicy"), "2");
    cache.level = 100000;
    EXPECT_EQ(textOf(instanceOf(cache), "LevelNumber"), "null");
}

TEST(CacheMemoryProvider, tellsTheAssociativity) {
    struct Case {
        Fact<std::uint64_t> ways;
        Fact<std::uint64_t> sets;
        const char* expected;
    };
    const auto number = [](std::uint64_t value) { return Fact<std::uint64_t>(value); };
    for (const Case& one : std::vector<Case>{{number(1), number(512), "2"},
                                             {number(2), number(512), "3"},
                                             {number(4), number(512), "4"},
                                             {number(64), number(1), "5"},
                                             {number(8), number(512), "6"},
                                             {number(16), Absence::Absent, "7"},
                                             {number(12), number(512), "1"},
                                             {Absence::Absent, number(512), "null"}}) {
        ProcessorCache cache;
        cache.ways = one.ways;
        cache.sets = one.sets;
        EXPECT_EQ(textOf(instanceOf(cache), "Associativity"), one.expected);
    }
}

}  // namespace
}  // namespace cimomd
