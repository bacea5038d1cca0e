// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// From the file's bytes to the map of tracks.

#include <cstring>
#include <new>

#include "public_include/SimpleFileIO.h"
#include "source/clips/QuickTimeClip.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/Tr1Memory.h"
#include "source/plugin/os/Os.h"

namespace {

// Enough to see where the movie header stands.
constexpr ncfUInt32 kFirstReadSize = 4096;

// Memory that whole sectors are read into without a copy.
std::tr1::shared_ptr<ncfUInt8> MakeReadBuffer(ncfUInt32 size) {
    constexpr std::size_t kSector = 4096;
    auto* const bytes = static_cast<ncfUInt8*>(os::AllocateAligned(size, kSector));
    if (!bytes) {
        throw std::bad_alloc();
    }
    return std::tr1::shared_ptr<ncfUInt8>(bytes, os::FreeAligned);
}

}  // namespace

// The parser walks the atoms and says which bytes it wants next. It is told
// the size that it asked for even where the file ends earlier: zeros stand for
// what is missing.
NCFRESULT QuickTimeClip::ParseMediaHeaders() {
    NCF_FUNCTION("QuickTimeClip::ParseMediaHeaders");
    CHK_PTR(qtParser_);
    CHK_PTR(fileName_);
    NMA::Impl::SimpleFileIO file_reader(fileName_.inArg());

    NCFRESULT result = QT_E_MOREDATA;
    ncfUInt64 pos = 0;
    ncfUInt32 readSize = kFirstReadSize;
    ncfUInt32 capacity = 0;
    std::tr1::shared_ptr<ncfUInt8> outputBuffer;
    while (result != NCF_OK) {
        if (capacity < readSize) {
            outputBuffer.reset();
            outputBuffer = MakeReadBuffer(readSize);
            capacity = readSize;
        }
        ncfUInt32 bytesRead = 0;
        NCF_RETURN(file_reader.Read(pos, outputBuffer.get(), readSize, &bytesRead));
        if (bytesRead == 0) {
            return NCF_E_UNEXPECTED;
        }
        ncfUInt8* const buffer = outputBuffer.get();
        std::memset(buffer + bytesRead, 0, readSize - bytesRead);
        result = qtParser_->ParseHeaders(buffer, buffer + readSize, pos);
        if (result == NCF_OK) {
            continue;
        }
        if (result != QT_E_MOREDATA) {
            return result;
        }
        NCF_RETURN(qtParser_->GetRecomendedReadPosition(&pos, &readSize));
        if (readSize == 0) {
            return NMA_E_NODATA;
        }
    }
    return CollectMediaInfo();
}

// A second track with an id that is taken already is lost.
template <class Info>
NCFRESULT QuickTimeClip::CollectTracks(const char* statement,
                                       NCFRESULT (IQTParser::*getTrackInfo)(ncfUInt32, Info**),
                                       ncfUInt32 count, ncfUInt32 type) {
    NCF_FUNCTION("QuickTimeClip::CollectMediaInfo");
    for (ncfUInt32 i = 0; i < count; ++i) {
        NCFSmartPtr<Info> trackInfo;
        NCF_RETURN_TEXT(statement, (qtParser_.inArg()->*getTrackInfo)(i, trackInfo.inOutArg()));
        ncfUInt32 qtTrack = 0;
        trackInfo->GetTrackId(&qtTrack);
        if (tracks_.insert({qtTrack, TrackMapEntry{trackInfo.inArg(), type}}).second) {
            trackIds_[{type, i}] = qtTrack;
        }
    }
    return NCF_OK;
}

NCFRESULT QuickTimeClip::CollectMediaInfo() {
    NCF_FUNCTION("QuickTimeClip::CollectMediaInfo");
    CHK_PTR(qtParser_.inArg());
    ncfUInt32 videoTrackCount = 0;
    ncfUInt32 audioTrackCount = 0;
    ncfUInt32 tcTrackCount = 0;
    ncfUInt32 otherTrackCount = 0;
    NCF_RETURN(qtParser_->GetVideoTrackCount(&videoTrackCount));
    slog::Progress(ncfFunction) << " videoTrackCount: " << videoTrackCount;
    NCF_RETURN(qtParser_->GetAudioTrackCount(&audioTrackCount));
    slog::Progress(ncfFunction) << " audioTrackCount: " << audioTrackCount;
    NCF_RETURN(qtParser_->GetTimeCodeTrackCount(&tcTrackCount));
    slog::Progress(ncfFunction) << " tcTrackCount: " << tcTrackCount;
    NCF_RETURN(qtParser_->GetOtherTrackCount(&otherTrackCount));
    slog::Progress(ncfFunction) << " otherTrackCount: " << otherTrackCount;

    NCFRESULT result = CollectTracks("qtParser_->GetVideoTrackInfo(i, trackInfo.inOutArg())",
                                     &IQTParser::GetVideoTrackInfo, videoTrackCount, kTrackVideo);
    if (result >= 0) {
        result = CollectTracks("qtParser_->GetAudioTrackInfo(i, trackInfo.inOutArg())",
                               &IQTParser::GetAudioTrackInfo, audioTrackCount, kTrackAudio);
    }
    if (result >= 0) {
        result = CollectTracks("qtParser_->GetTimeCodeTrackInfo(i, trackInfo.inOutArg())",
                               &IQTParser::GetTimeCodeTrackInfo, tcTrackCount, kTrackTimecode);
    }
    if (result >= 0) {
        result = CollectTracks("qtParser_->GetOtherTrackInfo(i, trackInfo.inOutArg())",
                               &IQTParser::GetOtherTrackInfo, otherTrackCount, kTrackOther);
    }
    if (result < 0) {
        return result;
    }
    return tracks_.empty() ? NCF_E_FAIL : NCF_OK;
}
