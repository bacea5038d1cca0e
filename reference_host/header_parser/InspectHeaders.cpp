// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/InspectHeaders.h"

#include <fstream>

#include "reference_host/header_parser/QTParser.h"

namespace header_parser {

HeaderReport InspectHeaders(const std::filesystem::path& file) {
    HeaderReport report;
    std::ifstream stream(file, std::ios::binary);
    std::error_code error;
    report.fileSize = std::filesystem::file_size(file, error);
    if (!stream || error) {
        report.fileSize = 0;
        report.refusal = {NCF_E_HANDLE, "the file can't be read"};
        return report;
    }
    const auto parser = host::MakeRef<QTParser>();
    const ReadAt readAt = [&stream](ncfUInt64 position, ncfUInt8* to, ncfUInt32 wanted) {
        stream.clear();
        stream.seekg(static_cast<std::streamoff>(position));
        stream.read(reinterpret_cast<char*>(to), wanted);
        return static_cast<ncfUInt32>(stream.gcount());
    };
    if (ReadHeaders(*parser, readAt) != NCF_OK) {
        report.refusal = parser->WhyUnfinished(report.fileSize);
    }
    report.movie = parser->ReadMovie();
    return report;
}

}  // namespace header_parser
