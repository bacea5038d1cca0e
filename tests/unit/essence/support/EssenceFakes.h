// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstring>

#include "host_interfaces/framework/AVBuffer.h"
#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "tests/unit/clips/FakeWrapper.h"

inline std::string CodeText(ncfUInt32 fourCC) {
    if (fourCC < 256) {
        return std::to_string(fourCC);
    }
    return {static_cast<char>(fourCC >> 24), static_cast<char>(fourCC >> 16),
            static_cast<char>(fourCC >> 8), static_cast<char>(fourCC)};
}

// Picture reader over a frame of given bytes, the same at every place. Like a
// real one it reads nothing while it isn't started.
class PictureReader : public FakeObject<QTWrapper::IQTVideoReader>, public FakeCalls {
public:
    explicit PictureReader(Journal* lines) : FakeCalls("reader", lines) {}

    std::vector<ncfUInt8> frame;
    ncfUInt32 frameSize = 0;  // when not 0, told in place of the frame's size
    void* destination = nullptr;
    bool isStarted = false;

    NCFRESULT SetOutputPixelFormat(ncfUInt32 fourCC, ncfUInt32 a, ncfUInt32 b) override {
        return enter(("SetOutputPixelFormat " + CodeText(fourCC) + " " + std::to_string(a) + " " +
                      std::to_string(b))
                         .c_str());
    }
    NCFRESULT ReadFrame(ncfUInt64 sample, void* to, ncfUInt32 a, ncfUInt32 b,
                        ncfUInt32 c) override {
        journal->add("reader.ReadFrame " + std::to_string(sample) + " " +
                     std::to_string(a + b + c));
        destination = to;
        const auto found = results.find("ReadFrame");
        const NCFRESULT result = found != results.end() ? found->second
                                 : isStarted            ? NCF_OK
                                                        : NMA_E_NOTINITIALIZED;
        if (result == NCF_OK && !frame.empty()) {
            std::memcpy(to, frame.data(), frame.size());
        }
        return result;
    }
    ncfUInt32 GetFrameBufferSize(ncfUInt32 all, ncfUInt64 sample, ncfUInt32 c) override {
        journal->add("reader.GetFrameBufferSize " + std::to_string(all) + " " +
                     std::to_string(sample) + " " + std::to_string(c));
        return frameSize != 0 ? frameSize : static_cast<ncfUInt32>(frame.size());
    }
    NCFRESULT InitQT(ncfUInt32 mode) override {
        const NCFRESULT result = enter("InitQT");
        EXPECT_EQ(mode, 0u);
        isStarted = result >= 0;
        return result;
    }
    NCFRESULT ReleaseQT() override {
        isStarted = false;
        return enter("ReleaseQT");
    }
};

// Sound reader that fills what it is given with 0x55.
class SoundReader : public FakeObject<QTWrapper::IQTAudioReader>, public FakeCalls {
public:
    explicit SoundReader(Journal* lines) : FakeCalls("sound", lines) {}

    ncfUInt32 channels = 2;
    ncfUInt64 filled = ~ncfUInt64{0};  // bytes written at most

    NCFRESULT SetParams(ncfUInt32 track, ncfUInt32 bytes, ncfUInt8 littleEndian, double rate,
                        ncfUInt32& out) override {
        journal->add("sound.SetParams " + std::to_string(track) + " " + std::to_string(bytes) +
                     " " + std::to_string(littleEndian) + " " + std::to_string(rate) + " " +
                     std::to_string(out));
        const auto found = results.find("SetParams");
        if (found != results.end()) {
            return found->second;
        }
        out = channels;
        return NCF_OK;
    }
    NCFRESULT ReadSamples(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* count, void* to,
                          ncfUInt64 size, ncfUInt8 a, ncfUInt8 b) override {
        journal->add("sound.ReadSamples " + std::to_string(track) + " " + std::to_string(sample) +
                     " " + std::to_string(*count) + " " + std::to_string(size) + " " +
                     std::to_string(a + b));
        std::memset(to, 0x55, std::min(size, filled));
        *count = 1;
        const auto found = results.find("ReadSamples");
        return found == results.end() ? NCF_OK : found->second;
    }
};

class EssenceWrapper : public FakeWrapper {
public:
    explicit EssenceWrapper(Journal* lines)
        : FakeWrapper(lines), picture(new PictureReader(lines)), sound(new SoundReader(lines)) {}
    ~EssenceWrapper() override {
        picture->Release();
        sound->Release();
    }

    PictureReader* picture;
    SoundReader* sound;
    ncfUInt32 channels = 6;
    double rate = 48000.0;

    NCFRESULT GetQTVideoReader(QTWrapper::IQTVideoReader** out) override {
        return giveObject("GetQTVideoReader", out, picture);
    }
    NCFRESULT GetQTAudioReader(QTWrapper::IQTAudioReader** out) override {
        return giveObject("GetQTAudioReader", out, sound);
    }
    NCFRESULT PreparePixelFormat(ncfUInt32 fourCC) override {
        journal->add("wrapper.PreparePixelFormat " + CodeText(fourCC));
        return NCF_E_FAIL;  // nobody looks
    }
    NCFRESULT GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* outChannels, double* outRate,
                                   ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*,
                                   ncfUInt8*, ncfUInt8*) override {
        lastTrack = track;
        const NCFRESULT result = enter("GetAudioInfoForTrack");
        if (result >= 0 && outChannels) {
            *outChannels = channels;
        }
        if (result >= 0 && outRate) {
            *outRate = rate;
        }
        return result;
    }
    ncfUInt32 lastTrack = 0;
};

// Memory that tells when it was asked for and handed over.
class FakeBuffer : public FakeObject<INCFBuffer>, public FakeCalls {
public:
    explicit FakeBuffer(Journal* lines, std::string name = "buffer")
        : FakeCalls(std::move(name), lines) {}

    std::vector<ncfUInt8> bytes;
    bool complete = false;
    bool givesNull = false;

    NCFRESULT Allocate(ncfUInt64 size, ncfUInt32 alignment) override {
        journal->add(who + ".Allocate " + std::to_string(size) + " " + std::to_string(alignment));
        const auto found = results.find("Allocate");
        if (found != results.end()) {
            return found->second;
        }
        bytes.assign(static_cast<std::size_t>(size), 0xAA);
        return NCF_OK;
    }
    NCFRESULT GetBufferPointer(void** start) override {
        const NCFRESULT result = enter("GetBufferPointer");
        *start = result < 0 || givesNull || bytes.empty() ? nullptr : bytes.data();
        return result;
    }
    NCFRESULT SetComplete(ncfUInt32 state, ncfUInt64 valid, NCFRESULT result) override {
        journal->add(who + ".SetComplete " + std::to_string(state) + " " + std::to_string(valid) +
                     " " + std::to_string(result));
        const auto found = results.find("SetComplete");
        complete = found == results.end();
        return complete ? NCF_OK : found->second;
    }
};

class FakeRequest : public FakeObject<INCFAVBuffer>, public FakeCalls {
public:
    FakeRequest(Journal* lines, FakeBuffer* buffer)
        : FakeCalls("request", lines), buffer_(buffer) {}
    ~FakeRequest() override { buffer_->Release(); }

    ncfUInt32 track = 0;
    ncfUInt64 sample = 0;
    ncfUInt64 count = 1;
    bool bufferless = false;  // succeeds and gives no buffer

    NCFRESULT GetBuffer(INCFBuffer** out) override {
        return giveObject("GetBuffer", out, bufferless ? nullptr : buffer_);
    }
    NCFRESULT GetSampleRange(ncfUInt32* outTrack, ncfUInt64* outSample,
                             ncfUInt64* outCount) override {
        const NCFRESULT result = enter("GetSampleRange");
        if (result >= 0) {
            *outTrack = track;
            *outSample = sample;
            *outCount = count;
        }
        return result;
    }

private:
    FakeBuffer* buffer_;
};

// The property component with a codec's abilities.
class FakeProperty : public FakeObject<QuickTime::IQuickTimeProperty>, public FakeCalls {
public:
    explicit FakeProperty(Journal* lines) : FakeCalls("property", lines) {}

    std::vector<ncfUInt32> codes;
    ncfUInt32 storageType = 0;
    ncfUInt32 videoRange = 0;
    bool bufferless = false;          // tells a count and gives no buffer
    NCFRESULT bufferResult = NCF_OK;  // of the pointer of the buffer
    std::string path;

    NCFRESULT CreateMovie(INCFString* file) override {
        path = TextOf(file);
        return enter("CreateMovie");
    }
    NCFRESULT GetCodecPixelFormats(INCFBuffer** out, ncfUInt32* count) override {
        *out = nullptr;
        *count = static_cast<ncfUInt32>(codes.size());
        const NCFRESULT result = enter("GetCodecPixelFormats");
        if (result >= 0 && !bufferless) {
            auto* const buffer = new FakeBuffer(journal, "codes");
            const auto* const bytes = reinterpret_cast<const ncfUInt8*>(codes.data());
            buffer->bytes.assign(bytes, bytes + codes.size() * sizeof(ncfUInt32));
            if (bufferResult < 0) {
                buffer->results["GetBufferPointer"] = bufferResult;
            }
            *out = buffer;
        }
        return result;
    }
    NCFRESULT GetCodecName(ncfUInt32, INCFString*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCodecStorageType(ncfUInt32* out) override {
        return give("GetCodecStorageType", out, storageType);
    }
    NCFRESULT DoesCodecSupportRGB_CCIR(ncfUInt32* out) override {
        return give("DoesCodecSupportRGB_CCIR", out, videoRange);
    }
};
