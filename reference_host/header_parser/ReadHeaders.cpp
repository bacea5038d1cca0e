// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>
#include <cstring>
#include <vector>

#include "reference_host/header_parser/QTParser.h"

namespace header_parser {

NCFRESULT ReadHeaders(IQTParser& parser, const ReadAt& readAt, ncfUInt32* passes) {
    std::vector<ncfUInt8> buffer;
    ncfUInt64 position = 0;
    ncfUInt32 size = 4096;
    ncfUInt32 count = 0;
    NCFRESULT result = QT_E_MOREDATA;
    while (result == QT_E_MOREDATA) {
        buffer.assign(std::max<std::size_t>(buffer.size(), size), 0);
        if (readAt(position, buffer.data(), size) == 0) {
            result = NMA_E_NODATA;
            break;
        }
        ++count;
        result = parser.ParseHeaders(buffer.data(), buffer.data() + size, position);
        if (result == QT_E_MOREDATA) {
            const NCFRESULT asked = parser.GetRecomendedReadPosition(&position, &size);
            result = asked == NCF_OK && size == 0 ? NMA_E_NODATA : asked == NCF_OK ? result : asked;
        }
    }
    if (passes != nullptr) {
        *passes = count;
    }
    return result;
}

NCFRESULT ReadHeaders(IQTParser& parser, const ncfUInt8* bytes, ncfUInt64 size, ncfUInt32* passes) {
    const ReadAt readAt = [&](ncfUInt64 position, ncfUInt8* to, ncfUInt32 wanted) {
        const ncfUInt64 left = position < size ? size - position : 0;
        const auto given = static_cast<ncfUInt32>(std::min<ncfUInt64>(wanted, left));
        if (given > 0) {
            std::memcpy(to, bytes + position, given);
        }
        return given;
    };
    return ReadHeaders(parser, readAt, passes);
}

}  // namespace header_parser
