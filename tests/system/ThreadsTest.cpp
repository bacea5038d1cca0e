// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Clips on several threads at once through one module: to be run under a thread
// sanitizer too.

#include <atomic>
#include <iterator>
#include <thread>

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/AafTree.h"
#include "tests/system/SystemTest.h"

namespace {

// Native pictures of both kinds of descriptor, alpha, the sample provider,
// compressed sound, timecode, sound alone, and the second route.
const std::filesystem::path kMade = CLIPHOST_MADE_MOVIES;
const std::filesystem::path kMovies[] = {
    kMade / "prores_hq_1080p.mov",
    kMade / "imx50_pal.mov",
    kMade / "prores_4444_alpha.mov",
    kMade / "h264_with_aac.mov",
    kMade / "timecode_25.mov",
    kMade / "alac.mov",
    std::filesystem::path(CLIPHOST_TYPE_FILES) / "fragmented.mp4",
    kMade / "dv_pal.mov",
};
constexpr std::size_t kThreads = std::size(kMovies);

class Threads : public SystemTest {
protected:
    // The description as text; empty where there is none. Goes past the
    // session's own notices, which belong to one thread.
    std::string Described(const std::filesystem::path& movie) {
        host::Ref<NMA::IMediaContainer3> container;
        host::Ref<NMA::IAAFClips> clips;
        host::Ref<IAAFFile> file;
        const auto path = cliphost::PathForModule(movie);
        const bool described =
            session().host().Create(NMA::CompID_QuickTimeContainer, container) >= 0 &&
            container->SetFilePath(path.get()) >= 0 &&
            container->GetAAFMasterClips(clips.Out()) >= 0 &&
            clips->GetMetadata(0, file.Out()) >= 0;
        return described ? cliphost::ToText(cliphost::ReadTree(file.get())) : std::string();
    }
};

TEST_F(Threads, DescribeClipsAtOnceAsOneAfterAnother) {
    std::string atOnce[kThreads];
    std::atomic<std::size_t> ready{0};
    std::thread threads[kThreads];
    for (std::size_t i = 0; i < kThreads; ++i) {
        threads[i] = std::thread([this, i, &ready, &text = atOnce[i]] {
            // All begin together: the data files are read by whoever comes first.
            ++ready;
            while (ready < kThreads) {
                std::this_thread::yield();
            }
            text = Described(kMovies[i]);
            for (int again = 0; again < 3; ++again) {
                EXPECT_EQ(Described(kMovies[i]), text) << kMovies[i];
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    Start();
    for (std::size_t i = 0; i < kThreads; ++i) {
        EXPECT_NE(atOnce[i], "") << kMovies[i];
        EXPECT_EQ(Described(kMovies[i]), atOnce[i]) << kMovies[i];
    }
}

}  // namespace
