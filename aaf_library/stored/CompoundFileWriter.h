// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

#include <memory>
#include <string>

typedef struct _GsfOutfile GsfOutfile;
typedef struct _GsfOutput GsfOutput;

namespace aaf::stored {

// One storage of a compound file that is being written. Storages and streams
// are written one at a time: a contained storage has to be closed before its
// holder gets anything else. Throws StoredError.
class StorageWriter {
public:
    StorageWriter(StorageWriter&& other) noexcept;
    StorageWriter& operator=(StorageWriter&&) = delete;
    StorageWriter(const StorageWriter&) = delete;
    ~StorageWriter();

    void SetClass(const StoredAuid& classId);
    void stream(const std::u16string& name, const Bytes& content);
    StorageWriter storage(const std::u16string& name);
    void Close();

private:
    friend class CompoundFileWriter;
    explicit StorageWriter(GsfOutfile* storage) : storage_(storage) {}

    GsfOutfile* storage_;
};

// A compound file that comes to be in memory.
class CompoundFileWriter {
public:
    explicit CompoundFileWriter(SectorSize sectorSize);
    CompoundFileWriter(const CompoundFileWriter&) = delete;
    CompoundFileWriter& operator=(const CompoundFileWriter&) = delete;
    ~CompoundFileWriter();

    StorageWriter& root() { return *root_; }

    // Closes the root and gives the whole file, signature included.
    Bytes Finish();

private:
    SectorSize sectorSize_;
    GsfOutput* sink_;
    std::unique_ptr<StorageWriter> root_;
};

}  // namespace aaf::stored
