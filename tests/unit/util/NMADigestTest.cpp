// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <cstring>
#include <vector>

#include "tests/unit/util/UtilFixture.h"

namespace {

// Sixteen bytes in memory order, in hexadecimal.
std::string InHex(const GUID& uid) {
    unsigned char bytes[16];
    std::memcpy(bytes, &uid, sizeof(bytes));
    std::string text;
    for (const unsigned char byte : bytes) {
        char digits[3];
        std::snprintf(digits, sizeof(digits), "%02x", byte);
        text += digits;
    }
    return text;
}

std::string DigestOf(const std::vector<std::string>& pieces) {
    void* state = nullptr;
    EXPECT_EQ(NCF_OK, GenerateUMIDFromData_Begin(&state));
    for (const std::string& piece : pieces) {
        EXPECT_EQ(NCF_OK, GenerateUMIDFromData_AddData(
                              &state, static_cast<ncfUInt32>(piece.size()),
                              reinterpret_cast<const unsigned char*>(piece.data())));
    }
    GUID uid{};
    EXPECT_EQ(NCF_OK, GenerateUMIDFromData_Finish(&state, &uid));
    EXPECT_EQ(nullptr, state);
    return InHex(uid);
}

}  // namespace

// The published test vectors of SHA-256, first half.
TEST(Digest, IsTheFirstHalfOfTheKnownDigests) {
    EXPECT_EQ("e3b0c44298fc1c149afbf4c8996fb924", DigestOf({}));
    EXPECT_EQ("ba7816bf8f01cfea414140de5dae2223", DigestOf({"abc"}));
    EXPECT_EQ("248d6a61d20638b8e5c026930c3e6039",
              DigestOf({"abcdbcdecdefdefgefghfghighijhijkijkljklmklmnlmnomnopnopq"}));
}

TEST(Digest, DoesNotDependOnThePieces) {
    EXPECT_EQ(DigestOf({"abc"}), DigestOf({"a", "", "bc"}));
    EXPECT_NE(DigestOf({"abc"}), DigestOf({"abd"}));
}

TEST(Digest, FinishFreesTheStateWhenThereIsNoOutput) {
    void* state = nullptr;
    ASSERT_EQ(NCF_OK, GenerateUMIDFromData_Begin(&state));
    EXPECT_EQ(NCF_E_POINTER, GenerateUMIDFromData_Finish(&state, nullptr));
    EXPECT_EQ(nullptr, state);
}

TEST(Digest, IsFinishedAfterAFailedAddition) {
    void* state = nullptr;
    ASSERT_EQ(NCF_OK, GenerateUMIDFromData_Begin(&state));
    EXPECT_EQ(NCF_E_POINTER, GenerateUMIDFromData_AddData(&state, 4, nullptr));
    GUID uid{};
    EXPECT_EQ(NCF_OK, GenerateUMIDFromData_Finish(&state, &uid));
    EXPECT_EQ("e3b0c44298fc1c149afbf4c8996fb924", InHex(uid));
}

TEST(Digest, AnswersCallsWithoutAState) {
    void* state = nullptr;
    GUID uid{};
    EXPECT_EQ(NCF_E_POINTER, GenerateUMIDFromData_Begin(nullptr));
    EXPECT_EQ(NMA_E_NOTINITIALIZED, GenerateUMIDFromData_AddData(&state, 0, nullptr));
    EXPECT_EQ(NMA_E_NOTINITIALIZED, GenerateUMIDFromData_Finish(&state, &uid));
    EXPECT_EQ(NCF_E_POINTER, GenerateUMIDFromData_Finish(nullptr, &uid));
}
