// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportFolder.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>
#include <nlohmann/json.hpp>
#include <string_view>
#include <utility>
#include <vector>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/report/PageText.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {
namespace {

constexpr std::size_t kLeastDigits = 5;
constexpr std::string_view kEndings[] = {"-poster.webp", "-poster.png", "-strip.webp",
                                         "-strip.png"};

// "00017-poster.webp"
std::string PictureName(std::size_t clip, const char* name, std::string_view type) {
    return fmt::format("{:0{}}-{}.{}", clip, kLeastDigits, name, type.substr(type.find('/') + 1));
}

bool IsPictureName(std::string_view file) {
    const std::size_t end = std::min(file.find_first_not_of("0123456789"), file.size());
    return end >= kLeastDigits && std::find(std::begin(kEndings), std::end(kEndings),
                                            file.substr(end)) != std::end(kEndings);
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
    const std::string file = PictureName(clip, name, picture.value("type", std::string()));
    const std::string bytes = report::FromBase64(picture.value("data", std::string()));
    WriteWholeFile(aside_->path() / file, {bytes.begin(), bytes.end()});
    names_.insert(file);
    picture.erase("data");
    picture["file"] =
        host::text::PercentEncoded(host::system::GenericPathText(folder_.filename() / file));
}

void ReportFolder::PutIntoPlace() {
    for (const std::string& name : names_) {
        std::error_code error;
        std::filesystem::rename(aside_->path() / name, folder_ / name, error);
        if (error) {
            throw Failure(kExitCaller,
                          NotWritten(folder_ / name, error.default_error_condition().value()));
        }
    }
}

void ReportFolder::RemoveOthers() const {
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
