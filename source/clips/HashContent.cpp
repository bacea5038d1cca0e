// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/HashContent.h"

#include <algorithm>

#include "source/plugin/ResultChecks.h"
#include "source/plugin/os/Os.h"

namespace {

// Largest range that one read can fetch.
constexpr ncfUInt64 kLargestRead = 0xFFFFFFFF;

NCFRESULT ReadWhole(const char* ncfFunction, const char* statement,
                    NMA::Impl::SimpleFileIO& file_reader, ncfUInt64 offset, ncfUInt32 size,
                    ncfUInt8* bytes) {
    ncfUInt32 actualRead = 0;
    NCF_RETURN_TEXT(statement, file_reader.Read(offset, bytes, size, &actualRead));
    return actualRead == size ? NCF_OK : NCF_E_FAIL;
}

// How much of the content is good, however the reading ends.
struct Kept {
    std::vector<ncfUInt8>& content;
    std::size_t size;

    ~Kept() { content.resize(size); }
};

}  // namespace

NCFRESULT AppendFileRange(const char* function, const char* statement,
                          NMA::Impl::SimpleFileIO& file_reader, ncfUInt64 offset, ncfUInt64 size,
                          std::vector<ncfUInt8>& content) {
    if (size == 0) {
        return NCF_OK;
    }
    if (size > kLargestRead) {
        return NCF_E_FAIL;
    }
    const auto wanted = static_cast<ncfUInt32>(size);
    Kept kept{content, content.size()};
    // The first range gets its room exactly; from then on it doubles, since a
    // movie of many tracks must not move everything for each of them.
    if (const std::size_t needed = kept.size + wanted; needed > content.capacity()) {
        content.reserve(std::max(needed, 2 * content.capacity()));
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
