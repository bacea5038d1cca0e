// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

#include <filesystem>
#include <string>

// Trees as files. No exception leaves these functions; a result says what kind
// of failure it was and in a sentence that begins with the file's name why.

namespace aaf::stored {

enum class FileFailure {
    None,
    NotThere,     // the file, or the folder to write to, does not exist
    NoAccess,     // the system refused to open, read, write or replace the file
    NotAaf,       // the file is of another kind
    Damaged,      // an AAF file that is cut short or contradicts itself
    NotStorable,  // the content has something that the stored form cannot hold
    TooLarge,     // the content takes more bytes than a file of that kind may have
    NoMemory,
};

struct FileResult {
    FileFailure failure = FileFailure::None;
    std::string message;
    // Of a model that was read all the same: a sentence for each thing in the file that makes no
    // sense.
    std::vector<std::string> notes = {};

    explicit operator bool() const { return failure == FileFailure::None; }
};

// Replaces the file as a whole: it is written under another name beside it
// and put in place when it is complete. After a failure the old file stands
// and nothing is left behind.
FileResult SaveTree(const StoredObject& root, const std::filesystem::path& path,
                    SectorSize sectorSize);

// Leaves the tree untouched on failure.
FileResult LoadTree(const std::filesystem::path& path, StoredObject& root);

// Looks at the first bytes only. False also when the file cannot be read. The
// kind is what the file's signature says; null when it is not wanted.
bool IsAafFile(const std::filesystem::path& path, SectorSize* kind);

// Class of the object that holds everything, the root of every file.
extern const StoredAuid kRootClassId;

}  // namespace aaf::stored
