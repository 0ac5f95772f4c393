#include "protocol/ConnectionPlaces.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

const Peer kTrusted{true, {}};
const Peer kNetwork{};
const Peer kAda{false, 1000};
const Peer kBob{false, 1001};
const Peer kEve{false, 1002};

std::size_t taken(ConnectionPlaces& places, const Peer& peer) {
    std::size_t count = 0;
    while (places.take(peer))
        ++count;
    return count;
}

TEST(ConnectionPlaces, givesAUserHalf) {
    ConnectionPlaces places(128);
    EXPECT_EQ(taken(places, kAda), 64U);
    EXPECT_EQ(places.taken(), 64U);
    EXPECT_TRUE(places.take(kBob));
}

TEST(ConnectionPlaces, keepsAnEighthForTrustedPeersFromAllOthersTogether) {
    ConnectionPlaces places(128);
    EXPECT_EQ(taken(places, kAda), 64U);
    EXPECT_EQ(taken(places, kBob), 48U);
    EXPECT_EQ(taken(places, kEve), 0U);
    EXPECT_EQ(taken(places, kNetwork), 0U);
    EXPECT_EQ(taken(places, kTrusted), 16U);
}

TEST(ConnectionPlaces, keepsAnEighthForTrustedPeersFromTheNetwork) {
    ConnectionPlaces places(128);
    EXPECT_EQ(taken(places, kNetwork), 112U);
    EXPECT_EQ(taken(places, kTrusted), 16U);
}

TEST(ConnectionPlaces, givesTrustedPeersAll) {
    ConnectionPlaces places(128);
    EXPECT_EQ(taken(places, kTrusted), 128U);
    EXPECT_FALSE(places.take(kNetwork));
}

TEST(ConnectionPlaces, keepsOneOfFew) {
    for (const std::size_t count : {2U, 3U, 7U, 15U}) {
        ConnectionPlaces places(count);
        EXPECT_EQ(taken(places, kNetwork), count - 1);
        EXPECT_EQ(taken(places, kTrusted), 1U);
    }
}

TEST(ConnectionPlaces, givesAnybodyTheOnlyOne) {
    for (const Peer& peer : {kTrusted, kNetwork, kAda}) {
        ConnectionPlaces places(1);
        EXPECT_EQ(taken(places, peer), 1U);
    }
}

TEST(ConnectionPlaces, tellsWhetherThereAreAny) {
    ConnectionPlaces places(8);
    EXPECT_EQ(taken(places, kNetwork), 7U);
    EXPECT_TRUE(places.hasAny());
    EXPECT_FALSE(places.hasForUnknown());
    EXPECT_TRUE(places.take(kTrusted));
    EXPECT_FALSE(places.hasAny());
    places.giveBack(kNetwork);
    EXPECT_TRUE(places.hasAny());
    EXPECT_TRUE(places.hasForUnknown());
}

TEST(ConnectionPlaces, takesPlacesBack) {
    ConnectionPlaces places(8);
    for (const Peer& peer : {kAda, kNetwork, kTrusted}) {
        const std::size_t most = taken(places, peer);
        places.giveBack(peer);
        places.giveBack(peer);
        EXPECT_EQ(taken(places, peer), 2U);
        for (std::size_t i = 0; i < most; ++i)
            places.giveBack(peer);
        EXPECT_EQ(places.taken(), 0U);
    }
    EXPECT_EQ(taken(places, kAda), 4U);
    EXPECT_EQ(taken(places, kNetwork), 3U);
}

}  // namespace
}  // namespace cimomd
