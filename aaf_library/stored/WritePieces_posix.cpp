// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/WritePieces.h"

#include <cerrno>
#include <fstream>

namespace aaf::stored {

bool WritePieces(const std::filesystem::path& file, const std::vector<Bytes>& pieces) {
    errno = 0;
    std::ofstream out(file, std::ios::binary | std::ios::trunc);
    for (const Bytes& bytes : pieces) {
        out.write(reinterpret_cast<const char*>(bytes.data()),
                  static_cast<std::streamsize>(bytes.size()));
    }
    out.close();
    return !out.fail();
}

}  // namespace aaf::stored
