// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "reference_host/quicktime/CodecParser.h"

namespace host {

enum class FieldKind { Whole, Top, Bottom };

// Tells packets that hold one field from those that hold a whole picture. Only
// H.264 is stored so, in streams that are cut into packets while they are read;
// movie files keep both fields in one sample.
class FieldParser {
public:
    explicit FieldParser(const AVStream& stream);

    // Packets must come in the order in which they are stored. One with both
    // fields looks like its first, and is followed by another of that kind.
    FieldKind KindOf(const AVPacket& packet);

private:
    std::optional<CodecParser> parser_;  // without: all are whole
};

}  // namespace host
