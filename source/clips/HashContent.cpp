// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/HashContent.h"

#include <algorithm>

#include "source/plugin/ResultChecks.h"
#include "source/plugin/os/Os.h"

namespace {

// Largest range that one read can fetch.
constexpr ncfUInt64 kLargestRead = 0xFFFFFFFF;

// A longer range than a track's is the movie header, which is in the system's cache
// since it was parsed. It is read in pieces that the processor's cache holds: each is
// copied from the reader's memory.
constexpr ncfUInt32 kPiece = kHashChunkSize / 4;

// Whether pieces come out as one read would.
bool IsInside(NMA::Impl::SimpleFileIO& file_reader, ncfUInt64 offset, ncfUInt32 size) {
    ncfUInt64 length = 0;
    return file_reader.GetLength(&length) >= 0 && offset <= length && size <= length - offset;
}

NCFRESULT ReadWhole(const char* ncfFunction, const char* statement,
                    NMA::Impl::SimpleFileIO& file_reader, ncfUInt64 offset, ncfUInt32 size,
                    ncfUInt8* bytes) {
    const bool inPieces = size > kHashChunkSize && IsInside(file_reader, offset, size);
    const ncfUInt32 most = inPieces ? kPiece : size;
    for (ncfUInt32 done = 0; done < size;) {
        const ncfUInt32 wanted = std::min(most, size - done);
        ncfUInt32 actualRead = 0;
        NCF_RETURN_TEXT(statement,
                        file_reader.Read(offset + done, bytes + done, wanted, &actualRead));
        if (actualRead != wanted) {
            return NCF_E_FAIL;
        }
        done += wanted;
    }
    return NCF_OK;
}

// Room behind a short movie header for what tracks add.
constexpr std::size_t kRoomForTracks = 4 * kHashChunkSize;

// The first range is the movie header. A long one must not be moved for what the
// tracks add, since both copies would be held meanwhile. So it gets as much room
// again: where the tracks fill that too, they are most of the content.
std::size_t NextCapacity(const ByteVector& content, std::size_t needed) {
    return content.empty() ? 2 * needed + kRoomForTracks : std::max(needed, 2 * content.capacity());
}

// How much of the content is good, however the reading ends.
struct Kept {
    ByteVector& content;
    std::size_t size;

    ~Kept() { content.resize(size); }
};

}  // namespace

NCFRESULT AppendFileRange(const char* function, const char* statement,
                          NMA::Impl::SimpleFileIO& file_reader, ncfUInt64 offset, ncfUInt64 size,
                          ByteVector& content) {
    if (size == 0) {
        return NCF_OK;
    }
    if (size > kLargestRead) {
        return NCF_E_FAIL;
    }
    const auto wanted = static_cast<ncfUInt32>(size);
    Kept kept{content, content.size()};
    // Room that nothing is written to costs nothing. When it is used up it
    // doubles, since a movie of many tracks must not move everything for each.
    if (const std::size_t needed = kept.size + wanted; needed > content.capacity()) {
        content.reserve(NextCapacity(content, needed));
    }
    os::ExpectLargeBlock(content.data() + kept.size, wanted);
    content.resize(kept.size + wanted);
    const NCFRESULT result =
        ReadWhole(function, statement, file_reader, offset, wanted, &content[kept.size]);
    if (result >= 0) {
        kept.size = content.size();
    }
    return result;
}
