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

// Fills an output that may be null.
template <class Out, class Value>
void Give(Out* out, Value value) {
    if (out) {
        *out = static_cast<Out>(value);
    }
}

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
    if (!movie_) {
        return NMA_E_NOTINITIALIZED;
    }
    if (!fourBytes) {
        return NCF_E_POINTER;
    }
    const AVStream* const stream = movie_->FindTrack(track);
    if (!stream) {
        return NCF_E_NOTFOUND;
    }
    const ncfUInt32 code = CodecCode(*stream->codecpar);
    if (code == 0) {
        return NCF_E_FAIL;
    }
    for (int i = 0; i < 4; ++i) {
        fourBytes[i] = static_cast<ncfUInt8>(code >> (24 - 8 * i));
    }
    return NCF_OK;
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
    if (!movie_) {
        return NMA_E_NOTINITIALIZED;
    }
    if (!name) {
        return NCF_E_POINTER;
    }
    return Guarded([&] {
        const AVStream* const stream = movie_->FindTrack(track);
        if (!stream) {
            return NCF_E_NOTFOUND;
        }
        const std::string text = CodecNameOf(*stream->codecpar);
        return name->AssignUTF8(kNCFUTF8, text.c_str(), static_cast<ncfUInt32>(text.size()));
    });
}

NCFRESULT QuickTimeWrapper::GetVendor(ncfUInt32 track, ncfUInt32* vendor) {
    if (!movie_) {
        return NMA_E_NOTINITIALIZED;
    }
    if (!vendor) {
        return NCF_E_POINTER;
    }
    const AVStream* const stream = movie_->FindTrack(track);
    if (!stream) {
        return NCF_E_NOTFOUND;
    }
    const AVDictionaryEntry* const entry = av_dict_get(stream->metadata, "vendor_id", nullptr, 0);
    *vendor = entry ? CodeFromText(entry->value) : 0;
    return NCF_OK;
}

NCFRESULT QuickTimeWrapper::GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* channels,
                                                 double* sampleRate, ncfUInt32* formatID,
                                                 ncfUInt32* formatFlags, ncfUInt32* bytesPerPacket,
                                                 ncfUInt32* framesPerPacket,
                                                 ncfUInt32* bitsPerChannel, ncfUInt8* isBigEndian,
                                                 ncfUInt8* isConstantBitRate) {
    if (!movie_) {
        return NMA_E_NOTINITIALIZED;
    }
    const AVStream* const stream = movie_->FindTrack(track);
    if (!stream) {
        return NCF_E_NOTFOUND;
    }
    SoundForm form;
    const NCFRESULT found = Guarded([&] {
        const SoundForm* const known = movie_->SoundFormOf(track);
        form = known ? *known : form;
        return known ? NCF_OK : NCF_E_FAIL;
    });
    if (found < 0) {
        return found;
    }
    Give(channels, form.channels);
    Give(sampleRate, form.sampleRate);
    Give(formatID, form.formatId);
    Give(formatFlags, form.formatFlags);
    Give(bytesPerPacket, form.bytesPerPacket);
    Give(framesPerPacket, form.framesPerPacket);
    Give(bitsPerChannel, form.bitsPerChannel);
    Give(isBigEndian, form.isBigEndian);
    Give(isConstantBitRate, form.isConstantBitRate);
    return NCF_OK;
}

NCFRESULT QuickTimeWrapper::GetTimeCodeInfoForTrack(ncfUInt32 track, ncfUInt8* hours,
                                                    ncfUInt8* minutes, ncfUInt8* seconds,
                                                    ncfUInt8* frames, ncfUInt32* timeScale,
                                                    ncfUInt32* frameDuration, ncfUInt32* drop,
                                                    ncfUInt32* numFrames) {
    if (!movie_) {
        return NMA_E_NOTINITIALIZED;
    }
    if (!movie_->IsTimecode(track)) {
        return NCF_E_NOTFOUND;
    }
    TimecodeStart start;
    if (!ReadTimecodeStart(*movie_->FindTrack(track), start)) {
        return NCF_E_FAIL;
    }
    Give(hours, start.hours);
    Give(minutes, start.minutes);
    Give(seconds, start.seconds);
    Give(frames, start.frames);
    Give(timeScale, start.timeScale);
    Give(frameDuration, start.frameDuration);
    Give(drop, start.isDropFrame);
    Give(numFrames, start.framesPerSecond);
    return NCF_OK;
}

}  // namespace host
