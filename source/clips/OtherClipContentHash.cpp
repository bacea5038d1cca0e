// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The bytes that give a movie its identity when its structure is not known:
//
//     1      number of described tracks, low byte
//     4 each code of a track
//     8      length of the file, most significant byte first
//     ...    at most a mebibyte from the middle of the file

#include <algorithm>

#include "source/clips/HashContent.h"
#include "source/clips/OtherClip.h"
#include "source/plugin/ResultChecks.h"

NCFRESULT OtherClip::GetContentForHash(ByteVector& pContent) {
    NCF_FUNCTION("OtherClip::GetContentForHash");
    pContent.clear();
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
    NCF_RETURN(GetQuickTimeInterface(qtWrapper));
    const ncfUInt32 count = qtWrapper->GetDescribedTrackCount();
    pContent.push_back(static_cast<ncfUInt8>(count));
    for (ncfUInt32 i = 1; i <= std::min(count, kMostTracks); ++i) {
        // A track without a code counts as four zeros.
        ncfUInt8 fourcc[4] = {};
        qtWrapper->GetFourCCFromImageDescrptor(i, fourcc);
        pContent.insert(pContent.end(), fourcc, fourcc + sizeof fourcc);
    }

    NMA::Impl::SimpleFileIO file_reader(fileName_.inArg());
    ncfUInt64 fileLength = 0;
    NCF_RETURN(file_reader.GetLength(&fileLength));
    for (int shift = 56; shift >= 0; shift -= 8) {
        pContent.push_back(static_cast<ncfUInt8>(fileLength >> shift));
    }
    const ncfUInt64 readSize = std::min(kHashChunkSize, fileLength / 2);
    return AppendFileRange(ncfFunction,
                           "file_reader.Read(fileLength/2, &local[0], readSize, &bytesRead)",
                           file_reader, fileLength / 2, readSize, pContent);
}
