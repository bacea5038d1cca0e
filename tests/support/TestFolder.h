// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>

// A folder for one test, deleted with the object. It is where the system keeps
// temporary files, each has a name of its own, and the name contains what a user's
// may contain: a space, an accent, parentheses and both quotes, of which Windows forbids one.
class TestFolder {
public:
    TestFolder() {
#ifdef _WIN32
        const std::string name = "it's a t\xC3\xA9st (cliphost) ";
#else
        const std::string name = "it's a \"t\xC3\xA9st\" (cliphost) ";
#endif
        std::random_device numbers;
        do {
            path_ = std::filesystem::temp_directory_path() /
                    std::filesystem::u8path(name + std::to_string(numbers()));
        } while (!std::filesystem::create_directory(path_));
        std::filesystem::permissions(path_, std::filesystem::perms::owner_all);
    }
    ~TestFolder() {
        std::error_code ignored;
        std::filesystem::permissions(path_, std::filesystem::perms::owner_all, ignored);
        std::filesystem::remove_all(path_, ignored);
    }
    TestFolder(const TestFolder&) = delete;
    TestFolder& operator=(const TestFolder&) = delete;

    std::filesystem::path operator/(const std::filesystem::path& name) const {
        return path_ / name;
    }
    const std::filesystem::path& path() const {
        return path_;
    }
    std::filesystem::path Write(const std::filesystem::path& name,
                                const std::string& content = "x") const {
        std::ofstream(path_ / name, std::ios::binary) << content;
        return path_ / name;
    }
    std::size_t CountFiles() const {
        return static_cast<std::size_t>(
            std::distance(std::filesystem::directory_iterator(path_), {}));
    }

private:
    std::filesystem::path path_;
};
