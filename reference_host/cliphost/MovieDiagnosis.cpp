// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/MovieDiagnosis.h"

#include <fmt/format.h>

#include <array>
#include <cstring>
#include <fstream>
#include <optional>
#include <set>

#include "reference_host/header_parser/InspectHeaders.h"
#include "reference_host/quicktime/OpenProblem.h"

namespace cliphost {
namespace {

// What the top level of the file holds.
struct TopLevel {
    std::set<std::string> atoms;
    std::string cutAtom;  // the atom that is longer than the file, if any
    bool isFamily = false;
};

bool IsFourCharacters(const char* type) {
    for (int i = 0; i < 4; ++i) {
        const auto c = static_cast<unsigned char>(type[i]);
        if (c < 0x20 || c == 0x7F) {
            return false;
        }
    }
    return true;
}

TopLevel ReadTopLevel(std::ifstream& stream, std::uint64_t size) {
    static constexpr std::array kFamily = {"ftyp", "moov", "mdat", "wide", "free",
                                           "skip", "pnot", "moof", "styp", "uuid"};
    TopLevel top;
    std::uint64_t position = 0;
    while (position + 8 <= size && top.atoms.size() < 64) {
        std::array<unsigned char, 16> head{};
        stream.seekg(static_cast<std::streamoff>(position));
        stream.read(reinterpret_cast<char*>(head.data()), 16);
        stream.clear();
        std::uint64_t length = 0;
        for (int i = 0; i < 4; ++i) {
            length = length << 8 | head[static_cast<std::size_t>(i)];
        }
        const char* const type = reinterpret_cast<const char*>(head.data()) + 4;
        if (!IsFourCharacters(type)) {
            break;
        }
        const std::string name(type, 4);
        if (position == 0) {
            for (const char* const known : kFamily) {
                top.isFamily = top.isFamily || name == known;
            }
        }
        if (length == 1) {
            length = 0;
            for (int i = 8; i < 16; ++i) {
                length = length << 8 | head[static_cast<std::size_t>(i)];
            }
        } else if (length == 0) {
            length = size - position;
        }
        top.atoms.insert(name);
        if (length > size - position) {
            top.cutAtom = name;
            break;
        }
        if (length < 8) {
            break;
        }
        position += length;
    }
    return top;
}

}  // namespace

Problem DiagnoseMovie(const std::filesystem::path& movie) {
    std::error_code error;
    const auto status = std::filesystem::status(movie, error);
    if (std::filesystem::is_directory(status)) {
        return {movie, "this is a folder", "give a movie in it"};
    }
    // A pipe would keep us waiting.
    if (std::filesystem::exists(status) && !std::filesystem::is_regular_file(status)) {
        return {movie, "this is no file but a pipe or device",
                "copy what comes from it into a file"};
    }
    const std::uintmax_t size = std::filesystem::file_size(movie, error);
    std::ifstream stream(movie, std::ios::binary);
    if (error || !stream) {
        return {movie, "the file can't be read", "look at its permissions"};
    }
    if (size == 0) {
        return {movie, "the file is empty", "copy it again from where it came"};
    }
    const TopLevel top = ReadTopLevel(stream, size);
    const std::string opening = host::OpenProblem(movie);
    const char* const way = opening.empty() ? route::kLibrary : route::kNone;
    const auto because = [&](std::string reason, std::string hint) {
        return Problem{movie, std::move(reason), std::move(hint), NCF_OK, way};
    };
    if (!top.isFamily && !opening.empty()) {
        return because(
            fmt::format("the file is no movie of the QuickTime family, and can't be opened as "
                        "another kind of movie, sound or picture either ({})",
                        opening),
            "convert it to .mov or .mp4");
    }
    if (top.isFamily && top.cutAtom == "moov") {
        return because(fmt::format("the movie header is cut off at {} bytes", size),
                       "copy the file again");
    }
    if (top.isFamily && top.atoms.count("moov") == 0) {
        return top.cutAtom.empty()
                   ? because("the file holds no movie header ('moov'), so nothing tells its tracks",
                             {})
                   : because(
                         fmt::format("the file ends inside its '{}' atom, before any movie header",
                                     top.cutAtom),
                         "copy it again");
    }
    if (opening.empty() && top.atoms.count("moof") > 0) {
        return because("the movie is fragmented, and nothing of use is in its fragments",
                       "make it again from where it came");
    }
    if (opening.empty()) {
        return because(
            "the file can be opened, but it holds neither picture nor sound, or its length is not "
            "above 0, or it is longer than the 24 hours that its timecode can count",
            {});
    }
    return because(
        fmt::format("the movie header can't be used: {}; nor can it be read another way: {}",
                    header_parser::InspectHeaders(movie).refusal.Sentence(), opening),
        {});
}

}  // namespace cliphost
