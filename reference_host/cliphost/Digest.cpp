// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Digest.h"

#include <fmt/format.h>

#include <cstring>
#include <fstream>
#include <new>

#include "host_interfaces/util/NMAUtil.h"

namespace cliphost {
namespace {

class DigestMaker {
public:
    DigestMaker() { Check(GenerateUMIDFromData_Begin(&state_)); }
    ~DigestMaker() {
        if (state_ != nullptr) {
            GenerateUMIDFromData_Finish(&state_, nullptr);
        }
    }
    DigestMaker(const DigestMaker&) = delete;
    DigestMaker& operator=(const DigestMaker&) = delete;

    void Add(const char* bytes, std::size_t size) {
        Check(GenerateUMIDFromData_AddData(&state_, static_cast<ncfUInt32>(size),
                                           reinterpret_cast<const unsigned char*>(bytes)));
    }
    Digest Finish() {
        GUID id{};
        Check(GenerateUMIDFromData_Finish(&state_, &id));
        Digest digest{};
        static_assert(sizeof id == sizeof digest);
        std::memcpy(digest.data(), &id, sizeof id);
        return digest;
    }

private:
    static void Check(NCFRESULT result) {
        if (result < 0) {
            throw std::bad_alloc();  // nothing else fails there
        }
    }

    void* state_ = nullptr;
};

}  // namespace

Digest DigestOf(std::string_view bytes) {
    DigestMaker maker;
    maker.Add(bytes.data(), bytes.size());
    return maker.Finish();
}

std::optional<Digest> DigestOfFile(const std::filesystem::path& file) {
    std::ifstream from(file, std::ios::binary);
    DigestMaker maker;
    char piece[65536];
    while (from.read(piece, sizeof piece), from.gcount() > 0) {
        maker.Add(piece, static_cast<std::size_t>(from.gcount()));
    }
    if (!from.eof() || from.bad()) {
        return std::nullopt;
    }
    return maker.Finish();
}

std::uint64_t FirstBitsOf(const Digest& digest) {
    std::uint64_t number = 0;
    for (std::size_t i = 0; i < sizeof number; ++i) {
        number = number << 8 | digest[i];
    }
    return number;
}

std::string TextOf(const Digest& digest) {
    std::string text;
    for (const unsigned char byte : digest) {
        text += fmt::format("{:02x}", byte);
    }
    return text;
}

}  // namespace cliphost
