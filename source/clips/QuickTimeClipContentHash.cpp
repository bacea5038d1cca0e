// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The bytes that give a movie its identity: the whole movie header, then at
// most a mebibyte from the middle of each track. Few reads tell even large
// movies apart, and the same file gives the same bytes on every machine.

#include <algorithm>

#include "source/clips/HashContent.h"
#include "source/clips/QuickTimeClip.h"
#include "source/plugin/ResultChecks.h"

namespace {

NCFRESULT AppendRange(const char* function, NMA::Impl::SimpleFileIO& file_reader, ncfUInt64 offset,
                      ncfUInt64 size, ByteVector& content) {
    return AppendFileRange(function, "file_reader.Read(offset, &local[0], size, &actualRead)",
                           file_reader, offset, size, content);
}

}  // namespace

NCFRESULT QuickTimeClip::GetContentForHash(ByteVector& content) {
    NCF_FUNCTION("QuickTimeClip::GetContentForHash");
    content.clear();
    NMA::Impl::SimpleFileIO file_reader(fileName_.inArg());
    ncfUInt64 offset = 0;
    ncfUInt64 size = 0;
    NCF_RETURN(qtParser_->GetMOOVAtom(&offset, &size));
    NCFRESULT result = AppendRange(ncfFunction, file_reader, offset, size, content);
    if (result < 0) {
        return result;
    }
    std::vector<NCFSmartPtr<ITrackInfo>> tracks;
    result = GatherTracks(tracks);
    if (result < 0) {
        return result;
    }
    // The chunks of other movies may lie in other files.
    ncfBool isSelfContained = 0;
    NCF_RETURN(qtParser_->IsMovieSelfContained(&isSelfContained));
    if (!isSelfContained) {
        return NCF_OK;
    }
    for (std::size_t i = 0; i < tracks.size(); ++i) {
        NCFSmartPtr<IQTSampleTable> pTable;
        ncfUInt64 numSamples = 0;
        NCF_RETURN_TEXT("tracks[i]->GetSampleTable(&pTable)",
                        tracks[i]->GetSampleTable(pTable.outArg()));
        NCF_RETURN(pTable->GetNumSamples(&numSamples));
        if (numSamples == 0) {
            continue;
        }
        NCF_RETURN(pTable->GetChunkFromTheMiddle(&offset, &size));
        size = std::min(size, kHashChunkSize);
        ncfUInt64 streamLength = 0;
        NCF_RETURN(file_reader.GetLength(&streamLength));
        if (offset > streamLength || size > streamLength - offset) {
            // A file that was cut short may still have its beginning.
            pTable->GetDataOffset(1, &offset);
        }
        result = AppendRange(ncfFunction, file_reader, offset, size, content);
        if (result < 0) {
            return result;
        }
    }
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GatherTracks(std::vector<NCFSmartPtr<ITrackInfo>>& tracks) {
    NCF_FUNCTION("QuickTimeClip::GetContentForHash");
    ncfUInt32 trackCount = 0;
    NCF_RETURN(qtParser_->GetVideoTrackCount(&trackCount));
    for (ncfUInt32 i = 0; i < trackCount; ++i) {
        NCFSmartPtr<IVideoTrackInfo> pVideoTrack;
        NCFSmartPtr<ITrackInfo> pTrack;
        NCF_RETURN_TEXT("qtParser_->GetVideoTrackInfo(i, &pVideoTrack)",
                        qtParser_->GetVideoTrackInfo(i, pVideoTrack.outArg()));
        NCF_RETURN_TEXT("pVideoTrack->QueryInterface(IID_ITrackInfo, (void**)pTrack.outArg())",
                        ncfQuery(pVideoTrack.inArg(), IID_ITrackInfo, pTrack));
        tracks.push_back(pTrack);
    }
    NCF_RETURN(qtParser_->GetAudioTrackCount(&trackCount));
    for (ncfUInt32 i = 0; i < trackCount; ++i) {
        NCFSmartPtr<IAudioTrackInfo> pAudioTrack;
        NCFSmartPtr<ITrackInfo> pTrack;
        NCF_RETURN_TEXT("qtParser_->GetAudioTrackInfo(i, &pAudioTrack)",
                        qtParser_->GetAudioTrackInfo(i, pAudioTrack.outArg()));
        NCF_RETURN_TEXT("pAudioTrack->QueryInterface(IID_ITrackInfo, (void**)pTrack.outArg())",
                        ncfQuery(pAudioTrack.inArg(), IID_ITrackInfo, pTrack));
        tracks.push_back(pTrack);
    }
    NCF_RETURN(qtParser_->GetTimeCodeTrackCount(&trackCount));
    for (ncfUInt32 i = 0; i < trackCount; ++i) {
        NCFSmartPtr<ITrackInfo> pTrack;
        NCF_RETURN_TEXT("qtParser_->GetTimeCodeTrackInfo(i, &pTrack)",
                        qtParser_->GetTimeCodeTrackInfo(i, pTrack.outArg()));
        tracks.push_back(pTrack);
    }
    NCF_RETURN(qtParser_->GetOtherTrackCount(&trackCount));
    for (ncfUInt32 i = 0; i < trackCount; ++i) {
        NCFSmartPtr<ITrackInfo> pTrack;
        NCF_RETURN_TEXT("qtParser_->GetOtherTrackInfo(i, &pTrack)",
                        qtParser_->GetOtherTrackInfo(i, pTrack.outArg()));
        tracks.push_back(pTrack);
    }
    return NCF_OK;
}
