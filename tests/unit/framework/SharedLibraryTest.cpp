// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/SharedLibrary.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>

namespace {

std::vector<std::string> ExportsOf(const std::string& module) {
    host::system::SharedLibrary library;
    std::string reason;
    EXPECT_TRUE(library.Open(std::filesystem::path(TINY_MODULES) / module, reason)) << reason;
    std::vector<std::string> exports = library.Exports();
    std::sort(exports.begin(), exports.end());
    return exports;
}

bool Has(const std::vector<std::string>& exports, const std::string& name) {
    return std::find(exports.begin(), exports.end(), name) != exports.end();
}

TEST(SharedLibraryExports, AreTheFunctionsThatOthersFind) {
    const std::vector<std::string> exports = ExportsOf("tiny_module_right.nvx");
    for (const char* const name : {"NCFCanUnloadNow", "NCFGetClassFactory", "NCFRegisterComponent",
                                   "NCFRegisterPlugin", "NCFShutdown", "NCFStartup"}) {
        EXPECT_TRUE(Has(exports, name)) << name;
    }
}

TEST(SharedLibraryExports, AreNotWhatTheLibraryItselfNeeds) {
    const std::vector<std::string> exports = ExportsOf("tiny_module_no_shutdown.nvx");
    EXPECT_FALSE(Has(exports, "NCFShutdown"));
    EXPECT_FALSE(Has(exports, "getenv"));
}

TEST(SharedLibraryExports, AreNoneOfALibraryThatIsNotOpen) {
    EXPECT_TRUE(host::system::SharedLibrary().Exports().empty());
}

}  // namespace
