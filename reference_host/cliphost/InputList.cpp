// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/InputList.h"

#include <cerrno>
#include <cstdio>
#include <memory>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/system/Access.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {
namespace {

bool BeginsWith(std::string_view text, std::string_view start) {
    return text.substr(0, start.size()) == start;
}

class ListReader {
public:
    ListReader(const std::filesystem::path& list, ListForm form)
        : isStandardInput_(list == "-"),
          name_(isStandardInput_ ? std::filesystem::path("standard input") : list),
          form_(form) {}

    std::vector<std::filesystem::path::string_type> Read() {
        const std::unique_ptr<std::FILE, int (*)(std::FILE*)> opened(
            isStandardInput_ ? nullptr : host::system::OpenToRead(name_), CloseIfOpen);
        std::FILE* const file = isStandardInput_ ? stdin : opened.get();
        if (file == nullptr) {
            const int error = errno;
            std::error_code ignored;
            // Windows says that a folder is not permitted.
            FailForSystem(std::filesystem::is_directory(name_, ignored) ? EISDIR : error);
        }
        char piece[65536];
        for (std::size_t got; (got = std::fread(piece, 1, sizeof piece, file)) > 0;) {
            Take(std::string_view(piece, got));
        }
        if (std::ferror(file) != 0) {
            FailForSystem(errno);
        }
        EndPath();
        return std::move(paths_);
    }

private:
    static int CloseIfOpen(std::FILE* file) { return file != nullptr ? std::fclose(file) : 0; }

    [[noreturn]] void FailForSystem(int error) const {
        throw Failure(kExitCaller, name_,
                      "the list can't be read: " + std::generic_category().message(error));
    }

    void Take(std::string_view piece) {
        if (isAtStart_ && form_ == ListForm::Lines &&
            (BeginsWith(piece, "\xFF\xFE") || BeginsWith(piece, "\xFE\xFF"))) {
            throw Failure(kExitCaller, name_, "the list is in UTF-16", "save it as UTF-8");
        }
        if (form_ == ListForm::Lines && piece.find('\0') != std::string_view::npos) {
            throw Failure(kExitCaller, name_, "the list has a byte of zero in it",
                          "give -0 where its paths end with one");
        }
        isAtStart_ = false;
        const char end = form_ == ListForm::Nulls ? '\0' : '\n';
        for (std::size_t at = 0; at < piece.size();) {
            const std::size_t next = piece.find(end, at);
            path_ += piece.substr(at, next - at);
            if (next == std::string_view::npos) {
                break;
            }
            EndPath();
            at = next + 1;
        }
    }

    void EndPath() {
        if (form_ == ListForm::Lines) {
            if (isFirst_ && BeginsWith(path_, kByteOrderMark)) {
                path_.erase(0, kByteOrderMark.size());
            }
            if (!path_.empty() && path_.back() == '\r') {
                path_.pop_back();
            }
        }
        isFirst_ = false;
        if (!path_.empty()) {
            if (host::text::IsFileUrl(path_)) {
                host::system::PathTextOfUrl(path_, path_);  // what it leaves is told as no file
            }
            paths_.push_back(host::system::PathOfText(path_).native());
        }
        path_.clear();
    }

    const bool isStandardInput_;
    const std::filesystem::path name_;
    const ListForm form_;
    bool isAtStart_ = true;
    bool isFirst_ = true;
    std::string path_;
    std::vector<std::filesystem::path::string_type> paths_;
};

}  // namespace

std::vector<std::filesystem::path::string_type> ReadInputList(const std::filesystem::path& list,
                                                              ListForm form) {
    return ListReader(list, form).Read();
}

}  // namespace cliphost
