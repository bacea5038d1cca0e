// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <atomic>
#include <thread>
#include <vector>

#include "reference_host/framework/HostPath.h"
#include "reference_host/quicktime/QuickTimeProperty.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

TEST(QuickTimeProperty, NamesPixelFormatsInTheCodecsOrder) {
    const std::vector<ncfUInt32> deep = {Code("2vuy"), Code("r4fl"), Code("v210"), Code("b64a"),
                                         Code("BGRA")};
    struct Row {
        const char* arguments;
        std::vector<ncfUInt32> codes;
        ncfUInt32 storage;
    };
    for (const Row& row : {Row{"-c:v libx264 -pix_fmt yuv420p", {Code("2vuy"), Code("BGRA")}, 0},
                           Row{"-c:v prores_ks", deep, 0},
                           Row{"-c:v prores_ks -profile:v 4 -pix_fmt yuva444p10", deep, 0},
                           Row{"-c:v qtrle -pix_fmt argb", {Code("BGRA")}, 1},
                           Row{"-c:v qtrle -pix_fmt gray", {Code("BGRA")}, 1},
                           Row{"-c:v png -pix_fmt rgb24", {Code("BGRA")}, 1},
                           Row{"-c:v png -pix_fmt rgba64be", {Code("b64a"), Code("BGRA")}, 1},
                           Row{"-c:v png -pix_fmt pal8", {Code("BGRA")}, 1}}) {
        SCOPED_TRACE(row.arguments);
        const MadeMovie movie(std::string("-f lavfi -i testsrc2=s=64x48:r=25:d=0.2 ") +
                              row.arguments);
        const auto property = host::MakeRef<host::QuickTimeProperty>();
        ASSERT_EQ(property->CreateMovie(host::ModulePath(movie.Path()).get()), NCF_OK);
        host::Ref<INCFBuffer> buffer;
        ncfUInt32 count = 0, storage = 7, range = 7;
        ASSERT_EQ(property->GetCodecPixelFormats(buffer.Out(), &count), NCF_OK);
        void* start = nullptr;
        ASSERT_EQ(buffer->GetBufferPointer(&start), NCF_OK);
        const auto* codes = static_cast<const ncfUInt32*>(start);
        EXPECT_EQ(std::vector<ncfUInt32>(codes, codes + count), row.codes);
        EXPECT_EQ(property->GetCodecStorageType(&storage), NCF_OK);
        EXPECT_EQ(storage, row.storage);
        EXPECT_EQ(property->DoesCodecSupportRGB_CCIR(&range), NCF_OK);
        EXPECT_EQ(range, 0u);
    }
}

TEST(QuickTimeProperty, NamesNoneForSoundAlone) {
    const MadeMovie movie("-f lavfi -i sine=d=0.2 -c:a pcm_s16le");
    const auto property = host::MakeRef<host::QuickTimeProperty>();
    ASSERT_EQ(property->CreateMovie(host::ModulePath(movie.Path()).get()), NCF_OK);
    host::Ref<INCFBuffer> buffer;
    ncfUInt32 count = 7;
    EXPECT_EQ(property->GetCodecPixelFormats(buffer.Out(), &count), NCF_OK);
    EXPECT_EQ(count, 0u);
}

// Who asks while another opens the movie again waits for it.
TEST(QuickTimeProperty, AnswersOnSeveralThreads) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=0.2 -c:v libx264 -pix_fmt yuv420p");
    const auto property = host::MakeRef<host::QuickTimeProperty>();
    const auto path = host::ModulePath(movie.Path());
    ASSERT_EQ(property->CreateMovie(path.get()), NCF_OK);
    std::atomic<bool> isOpening{true};
    std::thread opening([&] {
        for (int i = 0; i < 20; ++i) {
            EXPECT_EQ(property->CreateMovie(path.get()), NCF_OK);
        }
        isOpening = false;
    });
    int wrong = 0;
    while (isOpening) {
        host::Ref<INCFBuffer> buffer;
        ncfUInt32 count = 0, storage = 7, range = 7;
        wrong += property->GetCodecPixelFormats(buffer.Out(), &count) != NCF_OK || count != 2;
        wrong += property->GetCodecStorageType(&storage) != NCF_OK || storage != 0;
        wrong += property->DoesCodecSupportRGB_CCIR(&range) != NCF_OK || range != 0;
    }
    opening.join();
    EXPECT_EQ(wrong, 0);
}

}  // namespace
