// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/UniversalLabels.h"

#include <gtest/gtest.h>

namespace NMA::Impl {
namespace {

TEST(UniversalLabels, TurnIntoIdentifiersByExchangingTheirHalves) {
    EXPECT_EQ(MakeAAFUIDfromMXFUL(CompressedSoundCodingBaseKey),
              ncfGuid("04020202-0000-0000-060E-2B3404010101"));
    EXPECT_EQ(MakeAAFUIDfromMXFUL(UncompressedPCM_BigEndian_AudioCoding),
              ncfGuid("0F020202-0301-0100-060E-2B3404010101"));
    EXPECT_EQ(MakeAAFUIDfromMXFUL(UncompressedPCMAudioCoding),
              ncfGuid("04020202-0301-0100-060E-2B3404010101"));
    EXPECT_EQ(MakeAAFUIDfromMXFUL(SampleProviderPictureCodingKey),
              ncfGuid("0E040201-027F-0000-060E-2B3404010101"));
}

TEST(UniversalLabels, CombineBytesAsSignedValues) {
    MXFUL label{};
    label[8] = 0x43;
    label[9] = 0x13;
    label[10] = 0xB5;
    label[11] = 0x72;
    label[13] = 0x80;
    EXPECT_EQ(MakeAAFUIDfromMXFUL(label), ncfGuid("FFFFB572-FF80-0000-0000-000000000000"));
}

}  // namespace
}  // namespace NMA::Impl
