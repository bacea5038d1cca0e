// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the host calls lets no exception out: a result that is thrown becomes
// the operation's, anything else "unexpected".

#include <functional>
#include <stdexcept>

#include "tests/unit/essence/support/MappingFixture.h"

namespace {

// A track that can't even tell how many formats it has.
class BrokenTrack final : public MediaTrack {
public:
    explicit BrokenTrack(std::function<void()> raise) : raise_(std::move(raise)) {}
    ncfUInt32 GetTrackType() const override { return kVideo; }
    ncfUInt32 GetNumberOfFormats() const override {
        raise_();
        return 0;
    }

private:
    std::function<void()> raise_;
};

// A mapping at work: picture track 0 and sound track 1, formats chosen for both.
class GuardedOperations : public MappingFixture {
protected:
    GuardedOperations() {
        AddVideo(1);
        AddAudio(2);
        property->codes = {QuickTime::kBGRAPixelFormat, QuickTime::kb64aPixelFormat};
        property->storageType = 1;
        Bind();
        EXPECT_EQ(QueryImages(), NCF_OK);
        EXPECT_EQ(QuerySound(), NCF_OK);
        EXPECT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
        EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_OK);
        buffer = new FakeBuffer(&journal);
        request = new FakeRequest(&journal, buffer);
        request->count = 1;
    }
    ~GuardedOperations() override { request->Release(); }

    // Runs `operation` with a clip and readers that throw, once a result and
    // once something else.
    void Expect(const char* name, const std::function<NCFRESULT()>& operation) {
        SCOPED_TRACE(name);
        // The track map is built anew, so that its questions are asked too.
        const auto run = [&](std::function<void()> raise) {
            mapping->_trackRemapVect.clear();
            clip->whenAsked = wrapper->whenAsked = wrapper->picture->whenAsked = raise;
            const NCFRESULT result = operation();
            clip->whenAsked = wrapper->whenAsked = wrapper->picture->whenAsked = nullptr;
            EXPECT_EQ(lock->depth(), 0);
            return result;
        };
        EXPECT_EQ(run([] { throw NCF_E_HANDLE; }), NCF_E_HANDLE);
        EXPECT_EQ(run([] { throw std::runtime_error("broken"); }), NCF_E_UNEXPECTED);
    }
    // The same with a lock that throws, for what never comes to the clip.
    void ExpectOfLock(const char* name, const std::function<NCFRESULT()>& operation) {
        SCOPED_TRACE(name);
        lock->whenLocked = [] { throw NCF_E_HANDLE; };
        EXPECT_EQ(operation(), NCF_E_HANDLE);
        lock->whenLocked = [] { throw std::runtime_error("broken"); };
        EXPECT_EQ(operation(), NCF_E_UNEXPECTED);
        lock->whenLocked = nullptr;
        EXPECT_EQ(lock->depth(), 0);
    }

    FakeBuffer* buffer = nullptr;
    FakeRequest* request = nullptr;
    ncfUInt32 number = 0;
    ncfUInt64 large = 0;
    ncfSInt64 offset = 0;
    ncfUInt16 small = 0;
};

TEST_F(GuardedOperations, OfSampleTables) {
    Expect("GetNumberOfTracks", [this] { return mapping->GetNumberOfTracks(); });
    Expect("GetNumberOfChannels", [this] { return mapping->GetNumberOfChannels(1, &number); });
    Expect("GetNumberOfSamples", [this] { return mapping->GetNumberOfSamples(0, &large); });
    Expect("GetSampleSize", [this] { return mapping->GetSampleSize(0, 0, &large); });
    Expect("GetSamplePosition", [this] { return mapping->GetSamplePosition(0, 0, &large); });
    Expect("GetSampleTemporalOffset",
           [this] { return mapping->GetSampleTemporalOffset(0, 0, &offset); });
    Expect("GetSampleProperties",
           [this] { return mapping->GetSampleProperties(0, 0, &large, &number); });
    Expect("GetNumberOfContiguousSamples",
           [this] { return mapping->GetNumberOfContiguousSamples(1, 0, &offset); });
    Expect("GetNumberOfContiguousBytes",
           [this] { return mapping->GetNumberOfContiguousBytes(1, 0, &large); });
}

TEST_F(GuardedOperations, OfPictures) {
    Expect("SetWorkingImageFormat", [this] {
        mapping->mediaTracks_[0]->SetSelectedFormat(MediaFormatPtr());
        return mapping->SetWorkingImageFormat(0, 1);
    });
    Expect("GetWorkingImageSize",
           [this] { return mapping->GetWorkingImageSize(0, &number, &number); });
    Expect("GetWorkingImageBufferRequirements",
           [this] { return mapping->GetWorkingImageBufferRequirements(0, &small, &large); });
    ExpectOfLock("GetImageFormat", [this] {
        return mapping->GetImageFormat(0, 0, &number, &number, &number, &number, &number, &number,
                                       &number, &number);
    });
    mapping->mediaTracks_[0].reset(new BrokenTrack([] { throw NCF_E_HANDLE; }));
    EXPECT_EQ(mapping->GetNumberOfImageFormats(0, &number), NCF_E_HANDLE);
    mapping->mediaTracks_[0].reset(new BrokenTrack([] { throw std::runtime_error("broken"); }));
    EXPECT_EQ(mapping->GetNumberOfImageFormats(0, &number), NCF_E_UNEXPECTED);
}

TEST_F(GuardedOperations, OfSound) {
    Expect("SetWorkingAudioFormat", [this] { return mapping->SetWorkingAudioFormat(1, 1); });
    ExpectOfLock("GetNumberOfAudioFormats",
                 [this] { return mapping->GetNumberOfAudioFormats(1, &number); });
    ExpectOfLock("GetAudioFormat",
                 [this] { return mapping->GetAudioFormat(1, 0, &number, &small, &small); });
}

TEST_F(GuardedOperations, OfDelivery) {
    Expect("Setup", [this] { return mapping->Setup(0); });
    Expect("Cleanup", [this] { return mapping->Cleanup(0); });
    for (const ncfUInt32 track : {0u, 1u}) {
        request->track = track;
        Expect("ProvideSampleRange", [this] { return mapping->ProvideSampleRange(request, 0); });
    }
}

TEST_F(GuardedOperations, OfCreationAndQueries) {
    mapping->imageFormatsReady_ = false;
    Expect("InternalQueryInterface", [this] { return Query(NMA::IID_IUncompressedImageProvider); });
    host->maker(CompID_LockComponent, [](const GUID&, void**) -> NCFRESULT { throw NCF_E_HANDLE; });
    EXPECT_EQ(mapping->InitializeInstance(host->unknown()), NCF_E_HANDLE);
    host->maker(CompID_LockComponent,
                [](const GUID&, void**) -> NCFRESULT { throw std::runtime_error("broken"); });
    EXPECT_EQ(mapping->InitializeInstance(host->unknown()), NCF_E_UNEXPECTED);
}

}  // namespace
