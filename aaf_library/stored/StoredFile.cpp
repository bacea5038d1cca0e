// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/StoredFile.h"

#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "aaf_library/stored/WritePieces.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <fstream>
#include <new>
#include <system_error>

namespace aaf::stored {

const StoredAuid kRootClassId = {0xA5, 0x98, 0xB3, 0xB3, 0x90, 0x1C, 0xD4, 0x11,
                                 0x80, 0x53, 0x08, 0x00, 0x36, 0x21, 0x08, 0x04};

namespace {

FileResult Failed(FileFailure failure, const std::filesystem::path& path, const std::string& what) {
    return {failure, path.u8string() + ": " + what};
}

// What the last failed call of the C library left as its reason.
FileResult SystemFailure(const std::filesystem::path& path, const std::string& what) {
    const int reason = errno;
    const FileFailure failure = reason == ENOENT ? FileFailure::NotThere : FileFailure::NoAccess;
    std::string text = what;
    if (reason != 0) {
        text += ": " + std::generic_category().message(reason);
    }
    return Failed(failure, path, text);
}

// Removes the half-written file unless it was put in place.
class TemporaryFile {
public:
    explicit TemporaryFile(const std::filesystem::path& target) : path_(target) {
        path_ += ".part";
        std::error_code ignored;
        for (int i = 2; std::filesystem::exists(path_, ignored); ++i) {
            path_ = target;
            path_ += ".part" + std::to_string(i);
        }
    }
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;
    ~TemporaryFile() {
        if (exists_) {
            std::error_code ignored;
            std::filesystem::remove(path_, ignored);
        }
    }

    bool Write(const std::vector<Piece>& pieces) {
        exists_ = true;
        return WritePieces(path_, pieces);
    }

    std::error_code MoveTo(const std::filesystem::path& target) {
        std::error_code problem;
        std::filesystem::rename(path_, target, problem);
        exists_ = static_cast<bool>(problem);
        return problem;
    }

private:
    std::filesystem::path path_;
    bool exists_ = false;
};

FileResult ReplaceFile(const std::vector<Piece>& pieces, const std::filesystem::path& path) {
    TemporaryFile temporary(path);
    if (!temporary.Write(pieces)) {
        return SystemFailure(path, "cannot be written");
    }
    if (const std::error_code problem = temporary.MoveTo(path)) {
        return Failed(FileFailure::NoAccess, path,
                      "cannot be replaced: " + problem.default_error_condition().message());
    }
    return {};
}

FileResult ReadFile(const std::filesystem::path& path, Bytes& bytes) {
    std::error_code problem;
    if (std::filesystem::is_directory(path, problem)) {
        return Failed(FileFailure::NoAccess, path, "is a folder");
    }
    errno = 0;
    std::ifstream in(path, std::ios::binary);
    if (!in) {
        return SystemFailure(path, "cannot be opened");
    }
    constexpr std::size_t chunk = 1 << 20;
    while (in) {
        const std::size_t had = bytes.size();
        bytes.resize(had + chunk);
        in.read(reinterpret_cast<char*>(bytes.data() + had), chunk);
        bytes.resize(had + static_cast<std::size_t>(in.gcount()));
    }
    if (in.bad()) {
        return SystemFailure(path, "cannot be read");
    }
    return {};
}

bool CarriesSignature(const std::uint8_t* header, std::size_t size, SectorSize* kind) {
    if (size < kSignatureOffset + sizeof(StoredAuid) ||
        std::memcmp(header, kCompoundMagic, sizeof(kCompoundMagic)) != 0) {
        return false;
    }
    StoredAuid signature;
    std::memcpy(signature.data(), header + kSignatureOffset, signature.size());
    if (signature != kSignature512 && signature != kSignature4096) {
        return false;
    }
    if (kind != nullptr) {
        *kind = signature == kSignature512 ? SectorSize::Bytes512 : SectorSize::Bytes4096;
    }
    return true;
}

}  // namespace

FileResult SaveTree(const StoredObject& root, const std::filesystem::path& path,
                    SectorSize sectorSize) {
    try {
        return ReplaceFile(WriteTreeInPieces(root, sectorSize), path);
    } catch (const TooLargeError& problem) {
        return Failed(FileFailure::TooLarge, path, problem.what());
    } catch (const StoredError& problem) {
        return Failed(FileFailure::NotStorable, path, problem.what());
    } catch (const std::bad_alloc&) {
        return Failed(FileFailure::NoMemory, path, "not enough memory to write it");
    }
}

FileResult LoadTree(const std::filesystem::path& path, StoredObject& root) {
    try {
        Bytes bytes;
        if (FileResult result = ReadFile(path, bytes); !result) {
            return result;
        }
        if (!CarriesSignature(bytes.data(), bytes.size(), nullptr)) {
            return Failed(FileFailure::NotAaf, path, "is no AAF file");
        }
        root = ReadTree(bytes);
        return {};
    } catch (const StoredError& problem) {
        return Failed(FileFailure::Damaged, path, problem.what());
    } catch (const std::bad_alloc&) {
        return Failed(FileFailure::NoMemory, path, "not enough memory to read it");
    }
}

bool IsAafFile(const std::filesystem::path& path, SectorSize* kind) {
    std::uint8_t header[kSignatureOffset + sizeof(StoredAuid)] = {};
    std::ifstream in(path, std::ios::binary);
    in.read(reinterpret_cast<char*>(header), sizeof(header));
    return CarriesSignature(header, static_cast<std::size_t>(in.gcount()), kind);
}

}  // namespace aaf::stored
