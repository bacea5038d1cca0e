// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/HostText.h"

#include "tests/unit/util/UtilFixture.h"

namespace text = host::text;

TEST(HostText, ReadsAStringInEveryEncodingAndLeavesItAlone) {
    for (ncfUInt32 encoding = kNCFASCII; encoding <= kNCFWCHAR; ++encoding) {
        const auto string = host::MakeString("plain", encoding);
        EXPECT_EQ(U"plain", text::Read(string.get()));
        EXPECT_EQ(encoding, string->GetEncoding());
    }
}

TEST(HostText, ReadsNullAsEmpty) {
    EXPECT_EQ(U"", text::Read(nullptr));
    EXPECT_EQ("", text::ReadUtf8(nullptr));
}

TEST(HostText, LeavesUtf8AsItIsAndReadsTheRestAsCharacters) {
    const text::AsHeld utf8("caf\xC3\xA9 \xFF");
    const text::AsHeld characters(U"caf\u00E9 \xDCFF");
    const auto string = host::MakeString("caf\xC3\xA9 \xFF", kNCFUTF8);
    EXPECT_EQ(utf8, text::ReadAsHeld(string.get()));
    for (const ncfUInt32 encoding : {kNCFUTF16, kNCFUTF32, kNCFWCHAR}) {
        ASSERT_EQ(NCF_OK, string->ConvertTo(encoding));
        EXPECT_EQ(characters, text::ReadAsHeld(string.get())) << encoding;
        EXPECT_EQ("caf\xC3\xA9 \xFF", text::ReadUtf8(string.get())) << encoding;
    }
    EXPECT_EQ(text::AsHeld("plain"), text::ReadAsHeld(host::MakeString("plain", kNCFASCII).get()));
    EXPECT_EQ(text::AsHeld(), text::ReadAsHeld(nullptr));
}

TEST(HostText, AssignsInTheWantedEncoding) {
    const auto string = host::MakeRef<host::String>();
    EXPECT_EQ(NCF_OK, text::Assign(string.get(), U"\u20AC", kNCFUTF8));
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF8), string->GetEncoding());
    EXPECT_EQ(3u, string->GetLength());
    EXPECT_EQ(NCF_E_POINTER, text::Assign(nullptr, U"x", kNCFUTF8));
}
