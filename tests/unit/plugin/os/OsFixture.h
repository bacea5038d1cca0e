// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <string>

#include "tests/support/TestFolder.h"

// A folder of files with their paths in the module's form.
class OsFixture : public ::testing::Test {
protected:
    std::u16string write(const std::string& name, const std::string& bytes) {
        testFolder.Write(name, bytes);
        return pathOf(name);
    }
    // Path in the module's form: backslashes.
    std::u16string pathOf(const std::string& name) const {
        std::u16string path = (folder / name).u16string();
        for (char16_t& c : path) {
            c = c == u'/' ? u'\\' : c;
        }
        return path;
    }

    const TestFolder testFolder;
    const std::filesystem::path folder = testFolder.path();
};
