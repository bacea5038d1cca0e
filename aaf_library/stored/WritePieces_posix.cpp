// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/WritePieces.h"

#include <cerrno>
#include <fstream>

namespace aaf::stored {

bool WritePieces(const std::filesystem::path& file, const std::vector<Piece>& pieces) {
    errno = 0;
    std::ofstream out(file, std::ios::binary | std::ios::trunc);
    for (const Piece& piece : pieces) {
        out.write(reinterpret_cast<const char*>(piece.data),
                  static_cast<std::streamsize>(piece.size));
    }
    out.close();
    return !out.fail();
}

}  // namespace aaf::stored
