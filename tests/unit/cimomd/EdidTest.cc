#include "system/devices/Edid.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

// Places that the structure fixes.
constexpr std::size_t kFirstDescriptor = 54;
constexpr std::size_t kDescriptorBytes = 18;

/// A first block of zeros with the right head and, when asked for, the right sum.
class Block {
  public:
    Block() { put(0, {0, 255, 255, 255, 255, 255, 255, 0}); }

    Block& put(std::size_t place, const std::vector<unsigned>& values) {
        for (const unsigned value : values)
            bytes[place++] = static_cast<char>(value);
        return *this;
    }
    Block& descriptor(std::size_t number, const std::vector<unsigned>& values) {
        return put(kFirstDescriptor + number * kDescriptorBytes, values);
    }
    Block& text(std::size_t number, unsigned kind, const std::string& content) {
        descriptor(number, {0, 0, 0, kind, 0});
        bytes.replace(kFirstDescriptor + number * kDescriptorBytes + 5, content.size(), content);
        return *this;
    }

    std::string whole() const {
        unsigned sum = 0;
        for (const char byte : bytes)
            sum += static_cast<unsigned char>(byte);
        std::string out = bytes;
        out.back() = static_cast<char>(256 - sum % 256);
        return out;
    }
    Edid read() const { return parseEdid(whole()).value(); }

  private:
    std::string bytes = std::string(128, '\0');
};

TEST(Edid, refusesWhatIsNoWholeBlock) {
    const std::string good = Block().whole();
    ASSERT_TRUE(parseEdid(good).has_value());
    EXPECT_FALSE(parseEdid("").has_value());
    EXPECT_FALSE(parseEdid(good.substr(0, 127)).has_value());
    EXPECT_FALSE(parseEdid(good.substr(1) + '\0').has_value());
    EXPECT_FALSE(parseEdid(std::string(128, '\0')).has_value());
    EXPECT_TRUE(parseEdid(good + "anything").has_value());
}

TEST(Edid, refusesAWrongSum) {
    for (std::size_t place = 8; place < 128; ++place) {
        std::string bytes = Block().whole();
        bytes[place] = static_cast<char>(bytes[place] ^ 0x10);
        EXPECT_FALSE(parseEdid(bytes).has_value()) << place;
    }
}

TEST(Edid, tellsNothingWhereTheBlockIsEmpty) {
    const Edid edid = Block().read();
    EXPECT_FALSE(edid.makerCode || edid.serialNumber || edid.year || edid.week || edid.name);
    EXPECT_FALSE(edid.widthPixels || edid.heightPixels || edid.hasFrequencyRange);
    EXPECT_FALSE(edid.widthMillimetres || edid.heightMillimetres);
    EXPECT_TRUE(edid.texts.empty());
}

TEST(Edid, unpacksTheLettersOfTheMaker) {
    // D, E and L are 4, 5 and 12: 00100 00101 01100.
    EXPECT_EQ(Block().put(8, {0x10, 0xAC}).read().makerCode, "DEL");
    // 27 is no letter.
    EXPECT_EQ(Block().put(8, {0x10, 0xBB}).read().makerCode.reason(), Absence::Filtered);
    EXPECT_FALSE(Block().put(8, {0x10, 0xBB}).read().makerCode);
}

TEST(Edid, readsNumbersFromTheLowByteOn) {
    EXPECT_EQ(Block().put(10, {0xC4, 0xA0}).read().productCode, 0xA0C4);
    EXPECT_EQ(Block().put(12, {0x39, 0x30, 0, 0}).read().serialNumber, "12345");
    EXPECT_EQ(Block().put(12, {0, 0, 0, 0x80}).read().serialNumber, "2147483648");
    EXPECT_EQ(Block().put(12, {1, 1, 1, 1}).read().serialNumber.reason(), Absence::Filtered);
    EXPECT_FALSE(Block().put(12, {1, 1, 1, 1}).read().serialNumber);
}

TEST(Edid, prefersTheSerialNumberThatIsAText) {
    Block block;
    block.put(12, {0x39, 0x30, 0, 0}).text(1, 0xFF, "CN0J5H1Q74\n  ");
    EXPECT_EQ(block.read().serialNumber, "CN0J5H1Q74");
    block.text(1, 0xFF, "0000000000\n  ");
    EXPECT_EQ(block.read().serialNumber, "12345");
}

TEST(Edid, readsWhenItWasMade) {
    const Edid made = Block().put(16, {33, 29}).read();
    EXPECT_EQ(made.week, std::uint8_t{33});
    EXPECT_EQ(made.year, std::uint16_t{2019});
    const Edid model = Block().put(16, {255, 31}).read();
    EXPECT_FALSE(model.week);
    EXPECT_FALSE(model.year);
    EXPECT_EQ(model.modelYear, std::uint16_t{2021});
    EXPECT_FALSE(made.modelYear);
    EXPECT_EQ(Block().put(16, {54, 4}).read().year, std::uint16_t{1994});
    EXPECT_FALSE(Block().put(16, {55, 3}).read().week);
    EXPECT_FALSE(Block().put(16, {55, 3}).read().year);
}

TEST(Edid, readsTexts) {
    const Edid edid = Block()
                          .text(0, 0xFE, "LG Display\n  ")
                          .text(1, 0xFE, "LP140WU1-SPB1")
                          .text(2, 0xFC, "a\nb")
                          .text(3, 0xFE, "\n            ")
                          .read();
    EXPECT_EQ(edid.texts, (std::vector<std::string>{"LG Display", "LP140WU1-SPB1"}));
    EXPECT_EQ(edid.name, "a");
}

TEST(Edid, readsTheModeItLikesBest) {
    // 2560 is 0xA00 and 1440 is 0x5A0.
    Block block;
    block.descriptor(0, {1, 0, 0x00, 160, 0xA0, 0xA0, 45, 0x50});
    EXPECT_EQ(block.read().widthPixels, 2560U);
    EXPECT_EQ(block.read().heightPixels, 1440U);
    block.descriptor(1, {1, 0, 0x80, 0, 0x20, 0xE0, 0, 0x10});
    EXPECT_EQ(block.read().widthPixels, 2560U);
    EXPECT_FALSE(Block().descriptor(1, {1, 0, 0x80, 0, 0x20, 0xE0, 0, 0x10}).read().widthPixels);
    EXPECT_FALSE(Block().descriptor(0, {1, 0, 0, 0, 0, 0xE0, 0, 0x10}).read().heightPixels);
}

TEST(Edid, countsTheLinesOfBothFieldsWhenInterlaced) {
    // 540 is 0x21C.
    Block block;
    block.descriptor(0, {1, 0, 0x80, 0, 0x70, 0x1C, 0, 0x20}).put(kFirstDescriptor + 17, {0x80});
    EXPECT_EQ(block.read().heightPixels, 1080U);
}

TEST(Edid, readsTheSizeOfThePicture) {
    // 597 is 0x255 and 336 is 0x150.
    const std::vector<unsigned> timing{1, 0, 0, 0, 0xA0, 0, 0, 0x50, 0, 0, 0, 0, 0x55, 0x50, 0x21};
    const Edid exact = Block().put(21, {60, 34}).descriptor(0, timing).read();
    EXPECT_EQ(exact.widthMillimetres, 597U);
    EXPECT_EQ(exact.heightMillimetres, 336U);
    const Edid coarse = Block().put(21, {60, 34}).read();
    EXPECT_EQ(coarse.widthMillimetres, 600U);
    EXPECT_EQ(coarse.heightMillimetres, 340U);
    const Edid television =
        Block().put(21, {89, 50}).descriptor(0, {1, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 16, 9}).read();
    EXPECT_EQ(television.widthMillimetres, 890U);
    EXPECT_EQ(television.heightMillimetres, 500U);
    EXPECT_FALSE(Block().put(21, {79, 0}).descriptor(0, timing).read().widthMillimetres);
    EXPECT_FALSE(Block().put(21, {0, 79}).descriptor(0, timing).read().heightMillimetres);
}

TEST(Edid, knowsColourFromMonochrome) {
    EXPECT_EQ(Block().put(24, {0x00}).read().isColour, false);
    EXPECT_EQ(Block().put(24, {0x08}).read().isColour, true);
    EXPECT_EQ(Block().put(24, {0x10}).read().isColour, true);
    EXPECT_FALSE(Block().put(24, {0x18}).read().isColour);
    EXPECT_EQ(Block().put(19, {3, 0x80}).read().isColour, false);
    EXPECT_EQ(Block().put(19, {4, 0x80}).read().isColour, true);
}

TEST(Edid, knowsARangeFromOneFrequency) {
    const auto range = [](unsigned offsets, const std::vector<unsigned>& limits) {
        return Block()
            .descriptor(1, {0, 0, 0, 0xFD, offsets})
            .put(kFirstDescriptor + 23, limits)
            .read()
            .hasFrequencyRange;
    };
    EXPECT_EQ(range(0, {56, 76, 30, 120}), true);
    EXPECT_EQ(range(0, {60, 60, 30, 31}), true);
    EXPECT_EQ(range(0, {60, 60, 31, 31}), false);
    // 255 is added to the most, or to both.
    EXPECT_EQ(range(2, {60, 60, 31, 31}), true);
    EXPECT_EQ(range(3, {60, 60, 31, 31}), false);
    EXPECT_EQ(range(8, {60, 60, 31, 31}), true);
    EXPECT_EQ(range(0, {76, 56, 120, 30}), false);
}

}  // namespace
}  // namespace cimomd
