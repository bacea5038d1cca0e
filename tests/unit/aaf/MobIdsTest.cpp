// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/MobIds.h"

#include "tests/unit/aaf/support/DescriptionHost.h"

namespace NMA::Impl {
namespace {

using MobIdsTest = DescriptionHost;

TEST_F(MobIdsTest, HaveTheTemplateOfAllClips) {
    const aafMobID_t id = MobIdTemplate(0xB1);
    const unsigned char expected[16] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01,
                                        0x01, 0x01, 0x0F, 0x00, 0x13, 0xB1, 0x00, 0x00};
    EXPECT_EQ(std::memcmp(&id, expected, sizeof expected), 0);
    EXPECT_EQ(id.material, GUID{});
}

TEST_F(MobIdsTest, EqualBytesGiveEqualMaterial) {
    aafUID_t first{};
    aafUID_t second{};
    aafUID_t other{};
    EXPECT_EQ(GenerateUID(Media(), "abcd", 4, first), NCF_OK);
    EXPECT_EQ(GenerateUID(Media(), "abcd", 4, second), NCF_OK);
    EXPECT_EQ(GenerateUID(Media(), "abce", 4, other), NCF_OK);
    EXPECT_EQ(first, second);
    EXPECT_NE(first, other);
    EXPECT_NE(first, GUID{});
}

TEST_F(MobIdsTest, TheClipIsNotRead) {
    aafUID_t uid{};
    EXPECT_EQ(GenerateUID(std::tr1::shared_ptr<BaseClip>(), "abcd", 4, uid), NCF_OK);
}

TEST_F(MobIdsTest, AFailureIsLoggedWithItsStatementAndLeavesTheIdAlone) {
    aafUID_t uid = ncfGuid("11111111-1111-1111-1111-111111111111");
    EXPECT_EQ(GenerateUID(Media(), nullptr, 4, uid), NCF_E_POINTER);
    EXPECT_EQ(uid, ncfGuid("11111111-1111-1111-1111-111111111111"));
    EXPECT_TRUE(log.returned(NCF_E_POINTER,
                             "GenerateUMIDFromData_AddData(&UMIDGenState, contentSize, "
                             "(unsigned char*)pContent)",
                             "NMA::Impl::GenerateUID"));
}

}  // namespace
}  // namespace NMA::Impl
