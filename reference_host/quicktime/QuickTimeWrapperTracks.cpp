// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

extern "C" {
#include <libavutil/dict.h>
}

#include <cstdio>

#include "reference_host/framework/Guard.h"
#include "reference_host/quicktime/CodecNames.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"
#include "reference_host/quicktime/SoundForm.h"
#include "reference_host/quicktime/TimecodeStart.h"

namespace host {
namespace {

// A code as the library prints it: characters, and "[n]" for those that are
// none. The first is in the top byte; 0 for a text that is no such code.
ncfUInt32 CodeFromText(const char* text) {
    ncfUInt32 code = 0;
    int count = 0;
    for (; *text != 0 && count < 4; ++count) {
        unsigned value = static_cast<unsigned char>(*text);
        int length = 1;
        if (*text == '[' && (std::sscanf(text, "[%3u]%n", &value, &length) != 1 || value > 0xFF)) {
            return 0;
        }
        code = code << 8 | value;
        text += length;
    }
    return *text == 0 && count == 4 ? code : 0;
}

}  // namespace

NCFRESULT QuickTimeWrapper::GetFourCCFromImageDescrptor(ncfUInt32 track, ncfUInt8* fourBytes) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(fourBytes);
        const ncfUInt32 code = CodecCode(*Track(track).codecpar);
        Need(code != 0, NCF_E_FAIL);
        for (int i = 0; i < 4; ++i) {
            fourBytes[i] = static_cast<ncfUInt8>(code >> (24 - 8 * i));
        }
        return NCF_OK;
    });
}

ncfUInt32 QuickTimeWrapper::GetImageDescriptionCount(ncfUInt32 track) {
    const AVStream* const stream = movie_ ? movie_->FindTrack(track) : nullptr;
    if (!stream) {
        return 0;
    }
    const MovieAtoms::Track* const atoms = movie_->FindAtoms(track);
    return atoms && atoms->descriptionCount > 0 ? atoms->descriptionCount : 1;
}

// Resolution codes belong to codecs that are none of this library's.
ncfUInt32 QuickTimeWrapper::GetResolutionId(ncfUInt32) {
    return 0;
}

NCFRESULT QuickTimeWrapper::GetCodecTypeName(ncfUInt32 track, INCFString* name) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(name);
        const std::string text = CodecNameOf(*Track(track).codecpar);
        return name->AssignUTF8(kNCFUTF8, text.c_str(), static_cast<ncfUInt32>(text.size()));
    });
}

NCFRESULT QuickTimeWrapper::GetVendor(ncfUInt32 track, ncfUInt32* vendor) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(vendor);
        const AVDictionaryEntry* const entry =
            av_dict_get(Track(track).metadata, "vendor_id", nullptr, 0);
        *vendor = entry ? CodeFromText(entry->value) : 0;
        return NCF_OK;
    });
}

NCFRESULT QuickTimeWrapper::GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* channels,
                                                 double* sampleRate, ncfUInt32* formatID,
                                                 ncfUInt32* formatFlags, ncfUInt32* bytesPerPacket,
                                                 ncfUInt32* framesPerPacket,
                                                 ncfUInt32* bitsPerChannel, ncfUInt8* isBigEndian,
                                                 ncfUInt8* isConstantBitRate) {
    return Guarded([&] {
        Track(track);
        const SoundForm* const form = movie_->SoundFormOf(track);
        Need(form, NCF_E_FAIL);
        Give(form->channels, channels);
        Give(form->sampleRate, sampleRate);
        Give(form->formatId, formatID);
        Give(form->formatFlags, formatFlags);
        Give(form->bytesPerPacket, bytesPerPacket);
        Give(form->framesPerPacket, framesPerPacket);
        Give(form->bitsPerChannel, bitsPerChannel);
        Give(form->isBigEndian, isBigEndian);
        Give(form->isConstantBitRate, isConstantBitRate);
        return NCF_OK;
    });
}

NCFRESULT QuickTimeWrapper::GetTimeCodeInfoForTrack(ncfUInt32 track, ncfUInt8* hours,
                                                    ncfUInt8* minutes, ncfUInt8* seconds,
                                                    ncfUInt8* frames, ncfUInt32* timeScale,
                                                    ncfUInt32* frameDuration, ncfUInt32* drop,
                                                    ncfUInt32* numFrames) {
    return Guarded([&] {
        TimecodeStart start;
        Need(Movie().IsTimecode(track), NCF_E_NOTFOUND);
        Need(ReadTimecodeStart(Track(track), start), NCF_E_FAIL);
        Give(start.hours, hours);
        Give(start.minutes, minutes);
        Give(start.seconds, seconds);
        Give(start.frames, frames);
        Give(start.timeScale, timeScale);
        Give(start.frameDuration, frameDuration);
        Give(start.isDropFrame, drop);
        Give(start.framesPerSecond, numFrames);
        return NCF_OK;
    });
}

}  // namespace host
