// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/header_parser/TrackInfo.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/parser/FakeCalls.h"

// Sample table of a fake track: every number is a field, and the arguments of
// the last call are kept.
class FakeSampleTable : public FakeObject<IQTSampleTable>, public FakeCalls {
public:
    explicit FakeSampleTable(const std::string& name, Journal* lines) : FakeCalls(name, lines) {}

    ncfUInt64 numSamples = 300;
    ncfUInt64 dataOffset = 4000;
    ncfUInt32 flags = kQTSampleSync;
    ncfUInt64 nextChange = 31;
    ncfUInt32 dataSize = 1234;
    ncfSInt64 displayOffset = -1000;
    ncfSInt64 decodeDuration = 100;
    ncfUInt32 maxDataSize = 5678;
    ncfBool outOfOrder = 1;
    ncfUInt64 chunkPosition = 0;
    ncfUInt64 chunkSize = 0;
    ncfUInt64 frameNumber = 7;
    ncfUInt64 lastArgument = 0;

    NCFRESULT GetNumSamples(ncfUInt64* out) override {
        return give("GetNumSamples", out, numSamples);
    }
    NCFRESULT GetDataOffset(ncfUInt64 sample, ncfUInt64* out) override {
        lastArgument = sample;
        return give("GetDataOffset", out, dataOffset);
    }
    NCFRESULT GetSampleFlags(ncfUInt64 sample, ncfUInt32* out) override {
        lastArgument = sample;
        return give("GetSampleFlags", out, flags);
    }
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt64 sample, ncfUInt64* out) override {
        lastArgument = sample;
        return give("GetNextDiscontiguousDataAttributeChange", out, nextChange);
    }
    NCFRESULT GetDataSizePerSample(ncfUInt64 sample, ncfUInt32* out) override {
        lastArgument = sample;
        return give("GetDataSizePerSample", out, dataSize);
    }
    NCFRESULT GetDisplayOffset(ncfUInt64 sample, ncfSInt64* out) override {
        lastArgument = sample;
        return give("GetDisplayOffset", out, displayOffset);
    }
    NCFRESULT GetDecodeDuration(ncfUInt64 sample, ncfSInt64* out) override {
        lastArgument = sample;
        return give("GetDecodeDuration", out, decodeDuration);
    }
    NCFRESULT GetMaxDataSizeInBytes(ncfUInt32* out) override {
        return give("GetMaxDataSizeInBytes", out, maxDataSize);
    }
    NCFRESULT GetHasOutOfOrderFrameDependencies(ncfBool* out) override {
        return give("GetHasOutOfOrderFrameDependencies", out, outOfOrder);
    }
    NCFRESULT GetChunkFromTheMiddle(ncfUInt64* position, ncfUInt64* size) override {
        const NCFRESULT result = give("GetChunkFromTheMiddle", position, chunkPosition);
        if (result >= 0) {
            *size = chunkSize;
        }
        return result;
    }
    NCFRESULT DisplayTimeToFrameNum(ncfUInt64 displayTime, ncfUInt64* out) override {
        lastArgument = displayTime;
        return give("DisplayTimeToFrameNum", out, frameNumber);
    }
};

// Video sample description. Texts, fields and colour codes that are not given
// answer NCF_E_PARAMETERNOTAVAILABLE, as the real parser does.
class FakeVideoDescription : public FakeObject<IVideoSampleDescription>, public FakeCalls {
public:
    explicit FakeVideoDescription(Journal* lines) : FakeCalls("video description", lines) {
        results["GetFieldInfo"] = NCF_E_PARAMETERNOTAVAILABLE;
        results["GetVideoColorSpaceDetails"] = NCF_E_PARAMETERNOTAVAILABLE;
        results["GetNivoResolution"] = NCF_E_PARAMETERNOTAVAILABLE;
        results["GetRIAttributes"] = NCF_E_PARAMETERNOTAVAILABLE;
        results["GetCMAttributes"] = NCF_E_PARAMETERNOTAVAILABLE;
    }

    ncfUInt32 dataFormat = 0x61766331;  // 'avc1'
    ncfUInt16 width = 1920;
    ncfUInt16 height = 1080;
    ncfSInt32 hasAlpha = 0;
    ncfUInt32 fieldCount = 1;
    ncfUInt32 topFieldFirst = 0;
    ncfUInt32 split = 0;
    ncfUInt32 vendor = 0x6170706C;  // 'appl'
    ncfUInt32 aspectNumerator = 16;
    ncfUInt32 aspectDenominator = 9;
    ncfUInt32 codes[3] = {1, 1, 1};
    std::vector<ncfUInt32> alphaCodings;
    QTNivoResolution resolution{};
    std::string rasterText;
    std::string colorText;
    bool nullTexts = false;  // success without a string

    void SetFields(ncfUInt32 count, bool top, bool apart) {
        results.erase("GetFieldInfo");
        fieldCount = count;
        topFieldFirst = top;
        split = apart;
    }
    void SetColor(ncfUInt32 primaries, ncfUInt32 transfer, ncfUInt32 matrix) {
        results.erase("GetVideoColorSpaceDetails");
        codes[0] = primaries;
        codes[1] = transfer;
        codes[2] = matrix;
    }
    void SetColorText(const std::string& text) {
        results.erase("GetCMAttributes");
        colorText = text;
    }
    void SetRasterText(const std::string& text) {
        results.erase("GetRIAttributes");
        rasterText = text;
    }

    NCFRESULT GetDataFormat(ncfUInt32* out) override {
        return give("GetDataFormat", out, dataFormat);
    }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt16* w, ncfUInt16* h) override {
        const NCFRESULT result = give("GetEncodedWidthAndHeight", w, width);
        if (result >= 0) {
            *h = height;
        }
        return result;
    }
    NCFRESULT HasAlpha(ncfSInt32* out) override { return give("HasAlpha", out, hasAlpha); }
    NCFRESULT GetFieldInfo(ncfUInt32* count, ncfUInt32* top, ncfUInt32* apart) override {
        const NCFRESULT result = give("GetFieldInfo", count, fieldCount);
        if (result >= 0 && top) {
            *top = topFieldFirst;
        }
        if (result >= 0 && apart) {
            *apart = split;
        }
        return result;
    }
    NCFRESULT GetVendor(ncfUInt32* out) override { return give("GetVendor", out, vendor); }
    NCFRESULT GetImageAspectRatio(ncfUInt32* numerator, ncfUInt32* denominator) override {
        const NCFRESULT result = give("GetImageAspectRatio", numerator, aspectNumerator);
        if (result >= 0) {
            *denominator = aspectDenominator;
        }
        return result;
    }
    NCFRESULT GetVideoColorSpaceDetails(ncfUInt32* out) override {
        const NCFRESULT result = enter("GetVideoColorSpaceDetails");
        if (result >= 0) {
            out[0] = codes[0];
            out[1] = codes[1];
            out[2] = codes[2];
        }
        return result;
    }
    NCFRESULT GetNivoAlphaCodingCount(ncfUInt32* count) override {
        return give("GetNivoAlphaCodingCount", count, alphaCodings.size());
    }
    NCFRESULT GetNivoAlphaCoding(ncfUInt32 index, ncfUInt32* coding) override {
        return give("GetNivoAlphaCoding", coding, alphaCodings.at(index));
    }
    NCFRESULT GetNivoResolution(QTNivoResolution* out) override {
        const NCFRESULT result = enter("GetNivoResolution");
        if (result >= 0) {
            *out = resolution;
        }
        return result;
    }
    NCFRESULT GetRIAttributes(INCFString** text) override {
        return giveText("GetRIAttributes", text, rasterText);
    }
    NCFRESULT GetCMAttributes(INCFString** text) override {
        return giveText("GetCMAttributes", text, colorText);
    }

private:
    NCFRESULT giveText(const char* operation, INCFString** out, const std::string& text) {
        *out = nullptr;
        const NCFRESULT result = enter(operation);
        if (result >= 0 && !nullTexts) {
            *out = MakeHostString(text);
        }
        return result;
    }
};

// Sound sample description: 16-bit stereo at 48 kHz, little-endian.
class FakeAudioDescription : public FakeObject<IAudioSampleDescription>, public FakeCalls {
public:
    explicit FakeAudioDescription(Journal* lines) : FakeCalls("audio description", lines) {}

    ncfUInt32 channels = 2;
    ncfUInt32 bits = 16;
    double rate = 48000.0;
    ncfBool constantBitRate = 1;
    ncfBool lpcm = 1;
    ncfUInt32 bytesPerPacket = 4;
    ncfBool littleEndian = 1;

    NCFRESULT GetChannelsPerFrame(ncfUInt32* out) override {
        return give("GetChannelsPerFrame", out, channels);
    }
    NCFRESULT GetBitsPerChannel(ncfUInt32* out) override {
        return give("GetBitsPerChannel", out, bits);
    }
    NCFRESULT GetSampleRate(double* out) override { return give("GetSampleRate", out, rate); }
    NCFRESULT IsConstantBitRate(ncfBool* out) override {
        return give("IsConstantBitRate", out, constantBitRate);
    }
    NCFRESULT IsLPCM(ncfBool* out) override { return give("IsLPCM", out, lpcm); }
    NCFRESULT GetBytesPerPacket(ncfUInt32* out) override {
        return give("GetBytesPerPacket", out, bytesPerPacket);
    }
    NCFRESULT IsLittleEndian(ncfBool* out) override {
        return give("IsLittleEndian", out, littleEndian);
    }
};
