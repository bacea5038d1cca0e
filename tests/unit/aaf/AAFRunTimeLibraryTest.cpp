// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AAFRunTimeLibrary.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <vector>

#include "host_interfaces/aaf/AAFResultCodes.h"

namespace NMA::Impl {
namespace {

std::vector<std::string> asked;  // names of libraries
std::set<std::string> exported;  // what the fake library has
bool isThere = true;
IAAFFile* const kSomeFile = reinterpret_cast<IAAFFile*>(&isThere);

HRESULT OpenTransient(aafProductIdentification_t*, IAAFFile** file) {
    *file = kSomeFile;
    return 5;
}

void* Load(const char* name) {
    asked.push_back(name);
    return isThere ? &isThere : nullptr;
}

void* Find(void* library, const char* symbol) {
    EXPECT_EQ(library, &isThere);
    if (!exported.count(symbol)) {
        return nullptr;
    }
    return std::string(symbol) == "AAFFileOpenTransient" ? reinterpret_cast<void*>(&OpenTransient)
                                                         : &isThere;
}

const std::vector<std::string> kRequired = {"AAFFileOpenExistingRead", "AAFFileOpenExistingModify",
                                            "AAFFileOpenNewModify",    "AAFFileOpenTransient",
                                            "AAFFileIsAAFFile",        "AAFGetPluginManager"};

class AAFRunTimeLibraryTest : public ::testing::Test {
protected:
    AAFRunTimeLibraryTest() {
        asked.clear();
        exported = {kRequired.begin(), kRequired.end()};
        isThere = true;
    }
    HRESULT Open() {
        file = nullptr;
        return library.OpenTransient(nullptr, &file);
    }

    AAFRunTimeLibrary library{{Load, Find}};
    IAAFFile* file = nullptr;
};

TEST_F(AAFRunTimeLibraryTest, IsNotLoadedBeforeTheFirstCall) {
    EXPECT_TRUE(asked.empty());
}

TEST_F(AAFRunTimeLibraryTest, IsAskedForByItsBareNameOnce) {
    EXPECT_EQ(Open(), 5);
    EXPECT_EQ(file, kSomeFile);
    EXPECT_EQ(Open(), 5);
    EXPECT_EQ(asked, std::vector<std::string>{kAAFLibraryName});
    EXPECT_EQ(asked[0].find_first_of("/\\"), std::string::npos);
}

TEST_F(AAFRunTimeLibraryTest, AnswersLoadFailedWithoutALibraryAndTriesAgain) {
    isThere = false;
    EXPECT_EQ(Open(), AAFRESULT_DLL_LOAD_FAILED);
    EXPECT_EQ(static_cast<ncfUInt32>(AAFRESULT_DLL_LOAD_FAILED), 0x80120400u);
    isThere = true;
    EXPECT_EQ(Open(), 5);
}

TEST_F(AAFRunTimeLibraryTest, AnswersSymbolNotFoundWhenAnyRequiredFunctionIsMissing) {
    EXPECT_EQ(static_cast<ncfUInt32>(AAFRESULT_DLL_SYMBOL_NOT_FOUND), 0x80120401u);
    for (const std::string& name : kRequired) {
        exported.erase(name);
        EXPECT_EQ(Open(), AAFRESULT_DLL_SYMBOL_NOT_FOUND) << name;
        exported.insert(name);
    }
    EXPECT_EQ(Open(), 5);
}

TEST_F(AAFRunTimeLibraryTest, WantsAllOrNoneOfTheMemoryStorageFunctions) {
    exported.insert("AAFCreateRawStorageMemory");
    EXPECT_EQ(Open(), AAFRESULT_DLL_SYMBOL_NOT_FOUND);
    exported.insert("AAFCreateRawStorageDisk");
    EXPECT_EQ(Open(), AAFRESULT_DLL_SYMBOL_NOT_FOUND);
    exported.insert("AAFCreateAAFFileOnRawStorage");
    EXPECT_EQ(Open(), 5);
}

TEST_F(AAFRunTimeLibraryTest, MayLackEverythingElse) {
    exported.erase("AAFCreateRawStorageMemory");
    exported.insert("AAFCreateRawStorageDisk");
    EXPECT_EQ(Open(), 5);
}

TEST_F(AAFRunTimeLibraryTest, LooksAnewThroughAnotherAccess) {
    EXPECT_EQ(Open(), 5);
    const LibraryAccess before =
        library.SetAccess({[](const char*) -> void* { return nullptr; }, Find});
    EXPECT_EQ(before.load, &Load);
    EXPECT_EQ(Open(), AAFRESULT_DLL_LOAD_FAILED);
}

}  // namespace
}  // namespace NMA::Impl
