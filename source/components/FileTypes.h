// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/plugin/UTF16Literal.h"

namespace NMA::Impl {

// One type of file that the plug-in claims.
struct FileType {
    ncfUTF16LiteralToUTF16 extension;  // in capitals
    ncfUTF16LiteralToUTF16 description;
};

inline constexpr ncfUInt32 kFileTypeCount = 34;

// A row of the table, which is kept in the order that the host shows;
// `index` is below kFileTypeCount.
const FileType& FileTypeAt(ncfUInt32 index);
// The text that groups all rows.
const ncfUTF16LiteralToUTF16& FileTypeGroup();

}  // namespace NMA::Impl
