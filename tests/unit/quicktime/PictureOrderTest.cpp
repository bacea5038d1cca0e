// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/quicktime/PictureOrder.h"

namespace {

host::PacketEntry Packet(ncfSInt64 decode, ncfSInt64 display, bool isSync, bool isShown = true) {
    host::PacketEntry packet;
    packet.decodeTime = decode;
    packet.displayTime = display;
    packet.position = decode * 100;
    packet.duration = 1;
    packet.isSync = isSync;
    packet.isShown = isShown;
    return packet;
}

TEST(PictureOrder, NumbersPicturesAsTheyAreShown) {
    const host::PictureOrder order(
        {Packet(0, 1, true), Packet(1, 4, false), Packet(2, 2, false), Packet(3, 3, false)});
    ASSERT_EQ(order.PictureCount(), 4u);
    EXPECT_EQ(order.PacketOfPicture(1), 2u);
    EXPECT_EQ(order.PacketOfPicture(3), 1u);
    EXPECT_EQ(order.PictureOfPacket(1), 3u);
    EXPECT_FALSE(order.IsIntraOnly());
}

TEST(PictureOrder, LeavesOutWhatIsOnlyThereForOthers) {
    const host::PictureOrder order(
        {Packet(0, 0, true, false), Packet(1, 1, false, false), Packet(2, 2, false)});
    ASSERT_EQ(order.PictureCount(), 1u);
    EXPECT_EQ(order.PacketOfPicture(0), 2u);
    EXPECT_EQ(order.StartFor(0), 0u);
    EXPECT_FALSE(order.PictureOfPacket(1));
    EXPECT_FALSE(order.PictureOfPacket(9));
}

// Pictures shown before the sync sample that they follow need the one before.
TEST(PictureOrder, StartsBeforeTheGroupForItsLeadingPictures) {
    const host::PictureOrder order({Packet(0, 1, true), Packet(1, 2, false), Packet(2, 5, true),
                                    Packet(3, 3, false), Packet(4, 4, false), Packet(5, 6, false)});
    EXPECT_EQ(order.StartFor(2), 0u);  // shown at 3
    EXPECT_EQ(order.StartFor(3), 0u);
    EXPECT_EQ(order.StartFor(4), 2u);
    EXPECT_EQ(order.StartFor(5), 2u);
    EXPECT_FALSE(order.IsWholeFrom(2, 2));
    EXPECT_TRUE(order.IsWholeFrom(5, 2));
}

TEST(PictureOrder, TakesBackWhatWasToldAsSyncAndIsNone) {
    host::PictureOrder order(
        {Packet(0, 0, true), Packet(1, 1, true), Packet(2, 2, true), Packet(3, 3, true)});
    EXPECT_TRUE(order.IsIntraOnly());
    order.TakeBackSyncs(1, 3);
    EXPECT_FALSE(order.IsIntraOnly());
    EXPECT_FALSE(order.Packet(2).isSync);
    EXPECT_EQ(order.StartFor(1), 0u);
    EXPECT_EQ(order.StartFor(2), 0u);
    EXPECT_EQ(order.StartFor(3), 3u);
}

TEST(PictureOrder, FillsTimesThatTheContainerLeavesOut) {
    const host::PictureOrder order({Packet(0, 1, true), Packet(1, AV_NOPTS_VALUE, false),
                                    Packet(2, 2, false), Packet(3, 3, false), Packet(4, 5, false)});
    EXPECT_TRUE(order.HasDisplayTimes());
    EXPECT_EQ(order.PictureOfPacket(1), 3u);  // shown when the next such one is decoded
}

TEST(PictureOrder, FindsAPacketByItsTimesAndPlace) {
    const host::PictureOrder order(
        {Packet(0, 1, true), Packet(1, 4, false), Packet(2, 2, false), Packet(3, 3, false)});
    EXPECT_EQ(order.Find(2, 2, 200, 0).value().packet, 2u);
    EXPECT_EQ(order.Find(9, 4, 100, 3).value().packet, 1u);  // times of decoding may be guesses
    EXPECT_EQ(order.Find(AV_NOPTS_VALUE, AV_NOPTS_VALUE, 300, 0).value().packet, 3u);
    EXPECT_FALSE(order.Find(2, 2, 777, 0));
}

TEST(PictureOrder, KnowsTheSecondFieldOfAPicture) {
    std::vector<host::PacketEntry> packets = {Packet(0, 0, true), Packet(2, 2, false)};
    packets[0].second = {1, 1, 100, 50, true};
    packets[1].second = {3, 3, 300, 50, true};
    const host::PictureOrder order(packets);
    const auto first = order.Find(2, 2, 200, 1);
    const auto second = order.Find(3, 3, 300, 2);
    ASSERT_TRUE(first && second);
    EXPECT_EQ(first->packet, 1u);
    EXPECT_FALSE(first->isSecondField);
    EXPECT_EQ(second->packet, 1u);
    EXPECT_TRUE(second->isSecondField);
}

}  // namespace
