// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/OtherClipFixture.h"

namespace {

constexpr std::size_t kMebibyte = 1048576;

class OtherClipContentHash : public OtherClipTest {
protected:
    // The content of a clip over a file with these bytes.
    ByteVector ContentOf(const std::vector<ncfUInt8>& bytes) {
        const TempFile own(bytes, "hashed.avi");
        NCFSmartPtr<INCFConsole> console(&host->console());
        NCFSmartPtr<INCFComponentFactory> factory(host->factory());
        OtherClip hashed(HostText(own.path()), console, factory);
        ByteVector content(3, 99);  // cleared first
        EXPECT_EQ(hashed.GetContentForHash(content), NCF_OK);
        return content;
    }
    static ByteVector Length(ncfUInt8 byte5, ncfUInt8 byte6, ncfUInt8 byte7) {
        return {0, 0, 0, 0, 0, byte5, byte6, byte7};
    }
    static ByteVector Join(std::initializer_list<ByteVector> parts) {
        ByteVector all;
        for (const auto& part : parts) {
            all.insert(all.end(), part.begin(), part.end());
        }
        return all;
    }
};

}  // namespace

TEST_F(OtherClipContentHash, IsCodesLengthAndTheMiddleOfTheFile) {
    wrapper->AddPicture(1);
    wrapper->AddSound(2);
    wrapper->codes = {{1, "avc1"}, {2, "mp4a"}};
    wrapper->describedTracks = 2;
    const std::vector<ncfUInt8> bytes = CountingBytes(9000);
    EXPECT_EQ(ContentOf(bytes), Join({{2, 'a', 'v', 'c', '1', 'm', 'p', '4', 'a'},
                                      Length(0, 0x23, 0x28),
                                      {bytes.begin() + 4500, bytes.end()}}));
}

TEST_F(OtherClipContentHash, LeavesOutTheLastByteOfAnOddFile) {
    wrapper->AddSound(1);
    const std::vector<ncfUInt8> bytes = CountingBytes(7001);
    EXPECT_EQ(ContentOf(bytes),
              Join({{0}, Length(0, 0x1B, 0x59), {bytes.begin() + 3500, bytes.end() - 1}}));
}

TEST_F(OtherClipContentHash, TakesAMebibyteOfALargeFile) {
    wrapper->AddSound(1);
    const std::vector<ncfUInt8> bytes = CountingBytes(3 * kMebibyte);
    const auto middle = bytes.begin() + 3 * kMebibyte / 2;
    EXPECT_EQ(ContentOf(bytes), Join({{0}, Length(0x30, 0, 0), {middle, middle + kMebibyte}}));
}

TEST_F(OtherClipContentHash, TakesNothingOfAFileOfOneByte) {
    wrapper->AddSound(1);
    EXPECT_EQ(ContentOf({42}), Join({{0}, Length(0, 0, 1)}));
}

TEST_F(OtherClipContentHash, TakesNothingOfAnEmptyFile) {
    wrapper->AddSound(1);
    EXPECT_EQ(ContentOf({}), Join({{0}, Length(0, 0, 0)}));
}

// The same movie gives the same bytes, whatever the wrapper leaves behind.
TEST_F(OtherClipContentHash, CountsATrackWithoutACodeAsFourZeros) {
    wrapper->AddSound(1);
    wrapper->codes = {{1, "mp4a"}, {3, "tmcd"}};
    wrapper->describedTracks = 3;
    EXPECT_EQ(ContentOf({42}),
              Join({{3, 'm', 'p', '4', 'a', 0, 0, 0, 0, 't', 'm', 'c', 'd'}, Length(0, 0, 1)}));
}

TEST_F(OtherClipContentHash, CountsTracksInOneByte) {
    wrapper->AddSound(1);
    wrapper->describedTracks = 257;
    const ByteVector content = ContentOf({42});
    EXPECT_EQ(content.size(), 1 + 257 * 4 + 8u);
    EXPECT_EQ(content.front(), 1);
    EXPECT_EQ(wrapper->lastTrack, 257u);
}

TEST_F(OtherClipContentHash, TakesNoMoreCodesThanAMovieCanHaveTracks) {
    wrapper->AddSound(1);
    for (const ncfUInt32 told : {65536u, 0xFFFFFFFFu}) {
        wrapper->describedTracks = told;
        const ByteVector content = ContentOf({42});
        ASSERT_EQ(content.size(), 1 + 65535 * 4 + 8u) << told;
        EXPECT_EQ(content.front(), static_cast<ncfUInt8>(told)) << "the number as it is told";
        EXPECT_EQ(wrapper->lastTrack, 65535u);
    }
}

TEST_F(OtherClipContentHash, OpensTheMovieOnce) {
    wrapper->AddSound(1);
    LoadOther();
    ByteVector content;
    EXPECT_EQ(other->GetContentForHash(content), NCF_OK);
    EXPECT_EQ(journal.count("wrapper.NewMovieFromFilePath"), 1);
}

TEST_F(OtherClipContentHash, ThrowsWhenTheFileIsGone) {
    RecordingNMALog lines(1);
    wrapper->AddSound(1);
    LoadOther();
    std::filesystem::remove(std::filesystem::u8path(file.path()));
    ByteVector content;
    EXPECT_THROW(other->GetContentForHash(content), NCFRESULT);
}
