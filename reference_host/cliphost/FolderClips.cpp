// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/FolderClips.h"

#include <fmt/format.h>

#include <algorithm>
#include <numeric>
#include <set>
#include <string_view>

#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/FolderTree.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

// The one ending that the module looks for in a folder.
constexpr std::string_view kClaimedEnding = ".mov";
// Endings of movies, as lists of endings have them.
const std::vector<std::string> kMovieEndings = {"mov", "mp4", "m4v", "mpg",  "mpe",   "mpeg", "m2t",
                                                "3gp", "3g2", "qt",  "moov", "movie", "avi",  "dv"};
constexpr std::size_t kMostNames = 3;  // shown of those left out

void Check(NCFRESULT result, const char* what) {
    if (result < 0) {
        throw Failure(kExitFile, Problem{{}, what, {}, result});
    }
}

host::Ref<NMA::IMediaVolume> Volume(Session& session) {
    host::Ref<NMA::IMediaVolume> volume;
    Check(session.host().Create(NMA::CompID_QuickTimeMediaVolume, volume),
          "the module makes no media volume");
    return volume;
}

// A name for the movie that the module claims and that is not taken.
std::filesystem::path ClaimedName(const std::filesystem::path& movie) {
    std::error_code ignored;
    std::string plain = host::system::PathText(movie.filename());
    std::replace(plain.begin(), plain.end(), '\\', '_');
    const std::filesystem::path folder = movie.parent_path();
    std::filesystem::path name = folder / host::system::PathOfText(plain);
    name.replace_extension(kClaimedEnding);
    if (std::filesystem::exists(name, ignored)) {
        name = folder / host::system::PathOfText(plain);
        name += kClaimedEnding;
    }
    return name.filename();
}

std::string NamesOf(const std::vector<std::filesystem::path>& movies) {
    std::string names;
    for (std::size_t i = 0; i < std::min(movies.size(), kMostNames); ++i) {
        names += (i == 0 ? "" : ", ") + host::DisplayPath(movies[i].filename());
    }
    return movies.size() > kMostNames ? names + ", ..." : names;
}

std::string HowToName(const std::vector<std::filesystem::path>& movies) {
    const auto holdsBackslash = [](const std::filesystem::path& movie) {
        return host::system::HoldsBackslash(movie.filename());
    };
    const bool canBeGiven = std::none_of(movies.begin(), movies.end(), holdsBackslash);
    return fmt::format("rename {} so that the name ends in .mov, in small letters, such as {}{}",
                       movies.size() == 1 ? "it" : "each",
                       host::DisplayPath(ClaimedName(movies[0])),
                       canBeGiven ? "; or give the file itself to `cliphost describe`" : "");
}

}  // namespace

OtherMovies FindOtherMovies(const std::filesystem::path& folder) {
    OtherMovies others;
    others.noFiles = ForEachByEnding(folder, kMovieEndings, [&](const std::filesystem::path& file) {
        if (file.extension() != kClaimedEnding) {
            others.otherEnding.push_back(file);
        } else if (host::system::HoldsBackslash(file.filename())) {
            others.withBackslash.push_back(file);
        }
    });
    std::sort(others.otherEnding.begin(), others.otherEnding.end());
    std::sort(others.withBackslash.begin(), others.withBackslash.end());
    return others;
}

Problem NotClaimed(const std::filesystem::path& folder) {
    const OtherMovies others = FindOtherMovies(folder);
    const std::vector<std::filesystem::path>& movies = others.otherEnding;
    for (const Problem& one : others.noFiles) {
        if (movies.empty()) {
            return {folder,
                    fmt::format("not claimed: {}: {}", host::DisplayPath(one.subject.filename()),
                                one.reason),
                    one.hint};
        }
    }
    if (movies.empty()) {
        return {folder, "not claimed: no file in it is named *.mov", {}};
    }
    return {folder,
            fmt::format("not claimed: no file in it is named *.mov, but it holds {} with {}: {}",
                        Counted(movies.size(), "movie"),
                        movies.size() == 1 ? "another ending" : "other endings", NamesOf(movies)),
            HowToName(movies)};
}

Problem LeftOut(const std::filesystem::path& folder, const OtherMovies& others) {
    const std::vector<std::filesystem::path>& movies = others.otherEnding;
    if (movies.empty()) {
        return {};
    }
    return {folder,
            fmt::format("{} {} left out, because the module only takes *.mov: {}",
                        Counted(movies.size(), "movie"), movies.size() == 1 ? "is" : "are",
                        NamesOf(movies)),
            HowToName(movies)};
}

bool IsClaimed(Session& session, INCFString* folder) {
    return Volume(session)->IsMediaVolume(folder) == 1;
}

host::Ref<NMA::IVolumeInfo> VolumeInfoOf(Session& session, INCFString* folder) {
    host::Ref<NMA::IVolumeInfo> info;
    Check(Volume(session)->GetVolumeInfo(folder, info.Out()), "no information on the volume");
    return info;
}

FolderClips::FolderClips(Session& session, const std::filesystem::path& folder)
    : others_(FindOtherMovies(folder)) {
    const auto path = PathForModule(folder);
    std::filesystem::path parent;
    Check(host::PathFrom(path.get(), parent), "a path that no folder can have");
    host::Ref<NMA::IMediaFormat> format;
    Check(Volume(session)->GetMediaFormat(path.get(), format.Out()), "no media format");
    Check(format->GetAAFClips(list_.Out()), "no list of movies");
    // What a backslash in a name makes of it: a path into another folder, or
    // that of another movie.
    std::set<std::filesystem::path> fromBackslash;
    for (const std::filesystem::path& movie : others_.withBackslash) {
        std::filesystem::path turned;
        const auto text = host::ModulePath(parent / movie.filename());
        Check(host::PathFrom(text.get(), turned), "a path that no file can have");
        fromBackslash.insert(turned);
    }
    const ncfSInt32 count = list_->GetCount();
    PathList paths;
    std::vector<ncfSInt32> indices;
    for (ncfSInt32 i = 0; i < count; ++i) {
        const auto text = host::MakeString(std::string_view());
        std::filesystem::path clip;
        Check(list_->GetClipPath(i, text.get()), "no path of a movie");
        Check(host::PathFrom(text.get(), clip), "a path that no file can have");
        if (fromBackslash.erase(clip) == 0) {
            paths.Add(clip.native());
            indices.push_back(i);
        }
    }
    clips_ = ClipsByName(std::move(paths), std::move(indices));
}

ClipsByName::ClipsByName(PathList paths, std::vector<ncfSInt32> indices)
    : paths_(std::move(paths)), indices_(std::move(indices)), order_(indices_.size()) {
    paths_.Close();
    indices_.shrink_to_fit();
    std::iota(order_.begin(), order_.end(), std::uint32_t{0});
    std::sort(order_.begin(), order_.end(),
              [&](std::uint32_t one, std::uint32_t other) { return paths_.IsBefore(one, other); });
}

}  // namespace cliphost
