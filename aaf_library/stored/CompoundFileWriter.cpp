// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileWriter.h"

#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/StoredNames.h"

#include <gsf/gsf-outfile-msole.h>
#include <gsf/gsf-output-memory.h>
#include <algorithm>

namespace aaf::stored {

namespace {

constexpr std::size_t kLongestName = 31;

// libgsf takes any name and writes a broken entry for one that does not fit.
std::string CheckedName(const std::u16string& name) {
    if (name.empty() || name.size() > kLongestName ||
        name.find_first_of(u"/\\:!") != std::u16string::npos) {
        throw StoredError("\"" + ToUtf8(name) + "\" cannot be the name of a storage or stream");
    }
    return ToUtf8(name);
}

std::uint32_t NumberAt(const Bytes& file, std::size_t offset) {
    return ByteReader(file.data() + offset, 4).TakeNumber<std::uint32_t>();
}

// In a large file with large sectors libgsf can name an allocation table
// sector that it did not write; it would begin where the file ends. A sector
// of free entries is what is missing.
void AppendMissingTable(Bytes& file, std::size_t sector) {
    std::size_t last = 0;
    const std::uint32_t count = std::min(NumberAt(file, kTableCountOffset), kHeaderTableCount);
    for (std::uint32_t i = 0; i < count; ++i) {
        last = std::max<std::size_t>(last, NumberAt(file, kTableListOffset + 4 * i));
    }
    if (file.size() < (last + 2) * sector) {
        file.resize((last + 2) * sector, 0xFF);
    }
}

}  // namespace

StorageWriter::StorageWriter(StorageWriter&& other) noexcept : storage_(other.storage_) {
    other.storage_ = nullptr;
}

StorageWriter::~StorageWriter() {
    if (storage_ == nullptr) {
        return;
    }
    if (!gsf_output_is_closed(GSF_OUTPUT(storage_))) {
        gsf_output_close(GSF_OUTPUT(storage_));
    }
    g_object_unref(storage_);
}

void StorageWriter::SetClass(const StoredAuid& classId) {
    if (!gsf_outfile_msole_set_class_id(GSF_OUTFILE_MSOLE(storage_), classId.data())) {
        throw StoredError("a class id cannot be set");
    }
}

void StorageWriter::stream(const std::u16string& name, const Bytes& content) {
    GsfOutput* stream = gsf_outfile_new_child(storage_, CheckedName(name).c_str(), FALSE);
    if (stream == nullptr) {
        throw StoredError("the stream \"" + ToUtf8(name) + "\" cannot be made");
    }
    const bool written = gsf_output_write(stream, content.size(), content.data());
    const bool closed = gsf_output_close(stream);
    g_object_unref(stream);
    if (!written || !closed) {
        throw StoredError("the stream \"" + ToUtf8(name) + "\" cannot be written");
    }
}

StorageWriter StorageWriter::storage(const std::u16string& name) {
    GsfOutput* storage = gsf_outfile_new_child(storage_, CheckedName(name).c_str(), TRUE);
    if (storage == nullptr) {
        throw StoredError("the storage \"" + ToUtf8(name) + "\" cannot be made");
    }
    return StorageWriter(GSF_OUTFILE(storage));
}

void StorageWriter::Close() {
    if (!gsf_output_close(GSF_OUTPUT(storage_))) {
        throw StoredError("a storage cannot be closed");
    }
}

CompoundFileWriter::CompoundFileWriter(SectorSize sectorSize)
    : sectorSize_(sectorSize), sink_(gsf_output_memory_new()) {
    GsfOutfile* file = gsf_outfile_msole_new_full(sink_, static_cast<guint>(sectorSize),
                                                  static_cast<guint>(kSmallSectorSize));
    root_.reset(new StorageWriter(file));
}

CompoundFileWriter::~CompoundFileWriter() {
    root_.reset();
    g_object_unref(sink_);
}

Bytes CompoundFileWriter::Finish() {
    root_->Close();
    const guint8* bytes = gsf_output_memory_get_bytes(GSF_OUTPUT_MEMORY(sink_));
    Bytes file(bytes, bytes + gsf_output_size(sink_));
    const bool small = sectorSize_ == SectorSize::Bytes512;
    const StoredAuid& signature = small ? kSignature512 : kSignature4096;
    std::copy(signature.begin(), signature.end(), file.begin() + kSignatureOffset);
    AppendMissingTable(file, static_cast<std::size_t>(sectorSize_));
    return file;
}

}  // namespace aaf::stored
