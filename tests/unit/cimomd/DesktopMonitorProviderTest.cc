#include "providers/devices/DesktopMonitorProvider.h"

#include <gtest/gtest.h>

#include "InstanceText.h"

namespace cimomd {
namespace {

Pegasus::CIMInstance published(const Fact<Edid>& edid) {
    return DesktopMonitorProvider::publish("node7", {"card0-DP-1", true, edid}).instance;
}

TEST(DesktopMonitorProvider, tellsTheType) {
    const auto typeOf = [](Fact<bool> isColour, Fact<bool> hasRange) {
        Edid edid;
        edid.isColour = isColour;
        edid.hasFrequencyRange = hasRange;
        return textOf(published(edid), "DisplayType");
    };
    EXPECT_EQ(typeOf(true, true), "2");
    EXPECT_EQ(typeOf(false, true), "3");
    EXPECT_EQ(typeOf(true, false), "4");
    EXPECT_EQ(typeOf(false, false), "5");
    EXPECT_EQ(typeOf(Absence::Absent, true), "null");
    EXPECT_EQ(typeOf(true, Absence::Absent), "null");
}

TEST(DesktopMonitorProvider, callsAMonitorByWhatIsKnown) {
    Edid edid;
    EXPECT_EQ(textOf(published(edid), "Name"), "card0-DP-1");
    edid.makerCode = "DEL";
    EXPECT_EQ(textOf(published(edid), "Name"), "DEL card0-DP-1");
    EXPECT_EQ(textOf(published(edid), "Model"), "null");
    edid.texts = {"LG Display", "LP140WU1"};
    EXPECT_EQ(textOf(published(edid), "Name"), "LG Display LP140WU1");
    edid.name = "DELL U2719D";
    EXPECT_EQ(textOf(published(edid), "Model"), "DELL U2719D");
}

TEST(DesktopMonitorProvider, tellsTheYearOfTheModelFromThatOfTheMonitor) {
    Edid edid;
    EXPECT_EQ(textOf(published(edid), "Made"), "null");
    edid.year = 2019;
    EXPECT_EQ(textOf(published(edid), "Made"), "2019");
    edid.week = 7;
    EXPECT_EQ(textOf(published(edid), "Made"), "2019-W07");
    EXPECT_EQ(textOf(published(edid), "YearOfManufacture"), "2019");
    EXPECT_EQ(textOf(published(edid), "ModelYear"), "null");
    Edid ofModel;
    ofModel.modelYear = 2021;
    EXPECT_EQ(textOf(published(ofModel), "Made"), "model 2021");
    EXPECT_EQ(textOf(published(ofModel), "ModelYear"), "2021");
    EXPECT_EQ(textOf(published(ofModel), "YearOfManufacture"), "null");
}

TEST(DesktopMonitorProvider, passesOnWhyAMonitorTellsNothing) {
    const auto provided =
        DesktopMonitorProvider::publish("node7", {"card0-DP-1", true, Absence::Unreadable});
    EXPECT_EQ(textOf(provided.instance, "Name"), "card0-DP-1");
    std::size_t unreadable = 0;
    for (const MissingValue& value : provided.missing) {
        if (value.reason == Absence::Unreadable)
            ++unreadable;
        else
            EXPECT_STREQ(value.property, "OperationalStatus");
    }
    // All that the monitor would have told.
    EXPECT_EQ(unreadable, 14U);
}

}  // namespace
}  // namespace cimomd
