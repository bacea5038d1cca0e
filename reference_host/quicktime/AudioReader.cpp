// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/AudioReader.h"

#include <algorithm>
#include <cstring>

#include "reference_host/framework/Guard.h"
#include "reference_host/quicktime/SoundWords.h"

namespace host {
namespace {

// Long requests are served in pieces, so memory does not grow with them.
constexpr std::size_t kPieceWords = 262144;

}  // namespace

NCFRESULT AudioReader::SetParams(ncfUInt32 track, ncfUInt32 bytesPerSample, ncfUInt8 littleEndian,
                                 double, ncfUInt32& channels) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return Guarded([&] {
        const auto stream = streams_.find(track);
        Need(stream != streams_.end(), NCF_E_NOTFOUND);
        Need(bytesPerSample >= 1 && bytesPerSample <= 4, NCF_E_INVALIDARG);
        Track& entry = tracks_[track];
        if (!entry.decoder) {
            entry.decoder = EditedSound::Open(path_, stream->second, hasWholeIndex_);
        }
        Need(entry.decoder, NCF_E_FAIL);
        entry.bytesPerSample = static_cast<int>(bytesPerSample);
        entry.littleEndian = littleEndian != 0;
        channels = static_cast<ncfUInt32>(entry.decoder->Channels());
        return NCF_OK;
    });
}

NCFRESULT AudioReader::ReadSamples(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* count,
                                   void* destination, ncfUInt64 size, ncfUInt8, ncfUInt8) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return Guarded([&] {
        Need(count && destination);
        const auto found = tracks_.find(track);
        Need(found != tracks_.end() && found->second.bytesPerSample != 0, NMA_E_NOTINITIALIZED);
        Track& entry = found->second;
        const auto wide = static_cast<std::size_t>(entry.decoder->Channels());
        const std::size_t frameBytes = wide * static_cast<std::size_t>(entry.bytesPerSample);
        const ncfUInt64 wanted = std::min<ncfUInt64>(*count, size / frameBytes);
        auto* to = static_cast<ncfUInt8*>(destination);
        ncfUInt64 done = 0;
        ncfUInt64 reached = 0;
        bool isPastEnd = false;
        while (done < wanted && !isPastEnd) {
            const ncfUInt64 piece =
                std::min<ncfUInt64>(std::max<std::size_t>(kPieceWords / wide, 1), wanted - done);
            const ncfUInt64 got = entry.decoder->Read(sample + done, piece, words_);
            StoreSoundWords(words_.data(), static_cast<std::size_t>(piece) * wide,
                            entry.bytesPerSample, entry.littleEndian, to);
            to += static_cast<std::size_t>(piece) * frameBytes;
            reached = got > 0 ? done + got : reached;
            isPastEnd = got < piece;
            done += piece;
        }
        std::memset(to, 0, static_cast<std::size_t>(wanted - done) * frameBytes);
        *count = reached;
        return reached > 0 ? NCF_OK : NMA_E_NODATA;
    });
}

}  // namespace host
