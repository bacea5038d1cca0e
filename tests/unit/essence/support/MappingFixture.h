// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <memory>

#include "host_interfaces/util/NMAUtil.h"
#include "source/essence/QuickTimeSampleMapping.h"
#include "tests/support/fakes/FakeLock.h"
#include "tests/support/fakes/RecordingLogger.h"
#include "tests/unit/essence/support/EssenceClip.h"
#include "tests/unit/essence/support/EssenceFakes.h"

// The mapping with its inner steps and fields open.
class OpenMapping final : public NMA::Impl::QuickTimeSampleMapping {
public:
    using QuickTimeSampleMapping::_pConsole;
    using QuickTimeSampleMapping::_trackRemapVect;
    using QuickTimeSampleMapping::AddDecompressorPixelFormats;
    using QuickTimeSampleMapping::AddPixelFormat;
    using QuickTimeSampleMapping::codecPixelFormats_;
    using QuickTimeSampleMapping::FirstTrackOf;
    using QuickTimeSampleMapping::GetAlignedWidth;
    using QuickTimeSampleMapping::GetMediaTrack;
    using QuickTimeSampleMapping::imageFormatsReady_;
    using QuickTimeSampleMapping::levelRemap_;
    using QuickTimeSampleMapping::media_;
    using QuickTimeSampleMapping::mediaTracks_;
    using QuickTimeSampleMapping::QuickTimeSampleMapping;
    using QuickTimeSampleMapping::scratch_;
};

// Calls itself sound, but can't keep a channel count.
class SoundTrackWithoutChannels final : public MediaTrack {
public:
    ncfUInt32 GetTrackType() const override { return kAudio; }
};

// A mapping over a fake clip, with its host, its readers and a journal of all
// that they are asked. Tests set the clip up, then `Bind`.
class MappingFixture : public testing::Test {
protected:
    MappingFixture() {
        host = std::make_unique<FakeHost>(&journal);
        NMAInitialize(host->factory());
        log = std::make_unique<RecordingLog>(*host);
        host->maker(CompID_LockComponent, [this](const GUID&, void** out) {
            lock = new FakeLock(&journal);
            *out = static_cast<INCFLock*>(lock);
            return NCF_OK;
        });
        wrapper = new EssenceWrapper(&journal);
        property = new FakeProperty(&journal);
        host->maker(QTWrapper::CompID_QuickTimeWrapper, [this](const GUID& iid, void** out) {
            return wrapper->QueryInterface(iid, out);
        });
        host->maker(QuickTime::CompID_QuickTimeProperty, [this](const GUID& iid, void** out) {
            return property->QueryInterface(iid, out);
        });
        void* made = nullptr;
        EXPECT_EQ(
            CreateInstanceOf<OpenMapping>(host->unknown(), nullptr, NMA::IID_ISampleMapping, &made),
            NCF_OK);
        interface = static_cast<NMA::ISampleMapping*>(made);
        mapping = dynamic_cast<OpenMapping*>(interface);
        clip.reset(new EssenceClip(*host, &journal));
        journal.clear();
    }
    ~MappingFixture() override {
        EXPECT_EQ(lock->depth(), 0) << "the lock is held";
        if (interface) {
            EXPECT_EQ(interface->Release(), 0u) << "a reference to the mapping is left";
        }
        clip.reset();
        wrapper->Release();
        property->Release();
        log.reset();
        NMATerminate();
        host.reset();
        EXPECT_EQ(LiveFakes(), 0) << "a reference is lost";
        EXPECT_EQ(GetObjectCount(), 0u);
    }

    EssenceTrack& AddVideo(ncfUInt32 qtTrack, std::vector<ncfSInt64> offsets = {0, 0, 0, 0}) {
        clip->video.push_back({});
        clip->video.back().qtTrack = qtTrack;
        clip->video.back().displayOffsets = std::move(offsets);
        return clip->video.back();
    }
    EssenceTrack& AddAudio(ncfUInt32 qtTrack) {
        clip->audio.push_back({});
        clip->audio.back().qtTrack = qtTrack;
        clip->audio.back().displayOffsets.assign(10, 0);
        return clip->audio.back();
    }
    // Gives the mapping its path and clip.
    void Bind() {
        NCFSmartPtr<INCFString> path;
        path.attach(MakeHostString("/movies/a.mov"));
        EXPECT_EQ(mapping->SetFilePath(path), NCF_OK);
        EXPECT_EQ(mapping->SetMediaContainer(clip), NCF_OK);
        journal.clear();
    }
    NCFRESULT QueryImages() { return Query(NMA::IID_IUncompressedImageProvider); }
    NCFRESULT QuerySound() { return Query(NMA::IID_IUncompressedAudioProvider); }
    NCFRESULT Query(const GUID& iid) {
        void* out = nullptr;
        const NCFRESULT result = mapping->QueryInterface(iid, &out);
        if (out) {
            static_cast<INCFUnknown*>(out)->Release();
        }
        return result;
    }
    // "BGRA 8/4/2/1/2 <- BGRA": pixel, chroma, colour, component, range, and
    // the reader's code.
    std::vector<std::string> Offered(ncfUInt32 track) {
        std::vector<std::string> list;
        for (const MediaFormatPtr& entry : mapping->mediaTracks_.at(track)->GetFormats()) {
            const auto& format = dynamic_cast<const QTImageFormat&>(*entry);
            list.push_back(std::to_string(format.pixelFormat) + "/" +
                           std::to_string(format.chromaSubSampling) + "/" +
                           std::to_string(format.colorSpace) + "/" +
                           std::to_string(format.componentFormat) + "/" +
                           std::to_string(format.componentRangeType) + " <- " +
                           CodeText(format.qt_params.fourCC));
        }
        return list;
    }
    const QTImageFormat& Format(ncfUInt32 track, std::size_t index) {
        return dynamic_cast<const QTImageFormat&>(
            *mapping->mediaTracks_.at(track)->GetFormats().at(index));
    }
    int Console(ncfUInt32 level, const std::string& text) {
        return host->console().count(level, text);
    }
    static std::string Record(const std::string& code, const std::string& expression,
                              const std::string& operation) {
        return "NCF_RETURN(0x" + code + "): " + expression +
               " : NMA::Impl::QuickTimeSampleMapping::" + operation;
    }
    static std::string Check(const std::string& text, const std::string& operation) {
        return text + "NMA::Impl::QuickTimeSampleMapping::" + operation;
    }

    Journal journal;
    std::unique_ptr<FakeHost> host;
    std::unique_ptr<RecordingLog> log;
    FakeLock* lock = nullptr;
    EssenceWrapper* wrapper = nullptr;
    FakeProperty* property = nullptr;
    std::tr1::shared_ptr<EssenceClip> clip;
    NMA::ISampleMapping* interface = nullptr;
    OpenMapping* mapping = nullptr;
};

using Lines = std::vector<std::string>;
