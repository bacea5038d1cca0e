// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

extern "C" {
#include <libavutil/dict.h>
}

#include <cstring>

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

bool IsPrintable(ncfUInt32 tag) {
    for (int shift = 0; shift < 32; shift += 8) {
        const ncfUInt32 c = tag >> shift & 0xFF;
        if (c < 0x20 || c > 0x7E) {
            return false;
        }
    }
    return true;
}

// The tag with its first character in the low byte; 0 for none. A codec of
// another container has the tag that it has in movies.
ncfUInt32 TagOf(const AVCodecParameters& form) {
    if (IsPrintable(form.codec_tag)) {
        return form.codec_tag;
    }
    const AVCodecTag* const table = form.codec_type == AVMEDIA_TYPE_AUDIO
                                        ? avformat_get_mov_audio_tags()
                                        : avformat_get_mov_video_tags();
    const AVCodecTag* const tables[] = {table, nullptr};
    const ncfUInt32 tag = av_codec_get_tag(tables, form.codec_id);
    return IsPrintable(tag) ? tag : 0;
}

ncfUInt32 Swapped(ncfUInt32 tag) {
    return tag << 24 | (tag & 0xFF00u) << 8 | (tag >> 8 & 0xFF00u) | tag >> 24;
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
    const ncfUInt32 tag = TagOf(*stream->codecpar);
    if (tag == 0) {
        return NCF_E_FAIL;
    }
    for (int i = 0; i < 4; ++i) {
        fourBytes[i] = static_cast<ncfUInt8>(tag >> (8 * i));
    }
    return NCF_OK;
}

ncfUInt32 QuickTimeWrapper::GetImageDescriptionCount(ncfUInt32 track) {
    const AVStream* const stream = movie_ ? movie_->FindTrack(track) : nullptr;
    if (!stream) {
        return 0;
    }
    const MovieAtoms::Track* const atoms = movie_->Atoms().Find(track);
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
        std::string text;
        CodecName(Swapped(TagOf(*stream->codecpar)), text);
        if (text.empty()) {
            const AVCodecDescriptor* const codec =
                avcodec_descriptor_get(stream->codecpar->codec_id);
            text = codec ? (codec->long_name ? codec->long_name : codec->name) : "";
        }
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
    *vendor = 0;
    if (entry && std::strlen(entry->value) == 4) {
        for (int i = 0; i < 4; ++i) {
            *vendor = *vendor << 8 | static_cast<unsigned char>(entry->value[i]);
        }
    }
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
    if (!ReadSoundForm(*stream, form)) {
        return NCF_E_FAIL;
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
