// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportFolder.h"

#include <fmt/format.h>

#include <algorithm>
#include <initializer_list>
#include <nlohmann/json.hpp>
#include <string_view>
#include <utility>

#include "reference_host/cliphost/Digest.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/report/PageText.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {
namespace {

constexpr std::size_t kLeastDigits = 5;
constexpr std::size_t kDigestDigits = 12;

// "00017-poster-0f3a52b1c9d4.webp"
std::string PictureName(std::size_t clip, const char* name, std::string_view bytes,
                        std::string_view type) {
    return fmt::format("{:0{}}-{}-{}.{}", clip, kLeastDigits, name,
                       TextOf(DigestOf(bytes)).substr(0, kDigestDigits),
                       type.substr(type.find('/') + 1));
}

// Takes these characters off the beginning; how many they were.
std::size_t Skip(std::string_view& text, std::string_view characters) {
    const std::size_t count = std::min(text.find_first_not_of(characters), text.size());
    text.remove_prefix(count);
    return count;
}

bool SkipOneOf(std::string_view& text, std::initializer_list<std::string_view> words) {
    for (const std::string_view word : words) {
        if (text.substr(0, word.size()) == word) {
            text.remove_prefix(word.size());
            return true;
        }
    }
    return false;
}

// Those of earlier versions have no digest.
bool IsPictureName(std::string_view file) {
    if (Skip(file, "0123456789") < kLeastDigits || !SkipOneOf(file, {"-poster", "-strip"})) {
        return false;
    }
    const bool hasDigest = SkipOneOf(file, {"-"});
    return (!hasDigest || Skip(file, "0123456789abcdef") == kDigestDigits) &&
           (file == ".webp" || file == ".png");
}

}  // namespace

ReportFolder::ReportFolder(std::filesystem::path folder)
    : folder_(std::move(folder)), made_(folder_) {
    std::error_code error;
    aside_.emplace(folder_, error);
    if (error) {
        throw Failure(kExitCaller, FolderNotMade(folder_, error.default_error_condition().value()));
    }
}

void ReportFolder::Take(nlohmann::ordered_json& picture, std::size_t clip, const char* name) {
    const std::string bytes = report::FromBase64(picture.value("data", std::string()));
    const std::string file = PictureName(clip, name, bytes, picture.value("type", std::string()));
    WriteWholeFile(aside_->path() / file, {bytes.begin(), bytes.end()});
    names_.insert(file);
    picture.erase("data");
    picture["file"] =
        host::text::PercentEncoded(host::system::GenericPathText(folder_.filename() / file));
}

ReportFolder::~ReportFolder() {
    std::error_code ignored;
    for (const std::filesystem::path& picture : withoutPage_) {
        std::filesystem::remove(picture, ignored);
    }
}

void ReportFolder::PutIntoPlace() {
    for (const std::string& name : names_) {
        std::error_code error;
        const std::filesystem::path place = folder_ / name;
        if (!std::filesystem::exists(place, error)) {
            withoutPage_.push_back(place);
        }
        std::filesystem::rename(aside_->path() / name, place, error);
        if (error) {
            throw Failure(kExitCaller, NotWritten(place, error.default_error_condition().value()));
        }
    }
}

void ReportFolder::PageIsInPlace() {
    withoutPage_.clear();
    std::error_code ignored;
    std::vector<std::filesystem::path> others;
    for (std::filesystem::directory_iterator entry(folder_, ignored), end; entry != end;
         entry.increment(ignored)) {
        const std::string name = host::system::PathText(entry->path().filename());
        if (IsPictureName(name) && names_.count(name) == 0) {
            others.push_back(entry->path());
        }
    }
    for (const std::filesystem::path& other : others) {
        std::filesystem::remove(other, ignored);
    }
}

}  // namespace cliphost
