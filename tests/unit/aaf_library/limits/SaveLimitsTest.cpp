// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the caller of Save and SaveCopyAs is told of content that no file of the kind can hold.

#include <filesystem>

#include "host_interfaces/aaf/AAFFile.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/aaf_library/limits/SmallLimits.h"
#include "tests/unit/aaf_library/objects/Sentences.h"

namespace aaf_test {

class SaveLimits : public TransientFile {
protected:
    Ptr<IAAFFile> NewFile(const aafUID_t& kind) {
        Ptr<IAAFFile> made;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  AAFFileOpenNewModifyEx(path_.c_str(), &kind, 0, &product_.ident, made.Out()));
        return made;
    }

    SmallLimits limits_;
    const TestFolder folder_;
    const std::wstring path_ = [this] {
        const std::u32string path = (folder_ / "clip.aaf").u32string();
        return std::wstring(path.begin(), path.end());
    }();
};

TEST_F(SaveLimits, AFileThatWouldBeTooLargeIsRefusedWithItsNameAndLimit) {
    limits_.largestFile = 6000;
    Ptr<IAAFFile> small = NewFile(kAAFFileKind_Aaf512Binary);
    Ptr<IAAFFile> large = NewFile(kAAFFileKind_Aaf4KBinary);
    Sentences told;
    EXPECT_EQ(AAFRESULT_DATA_SIZE, small->Save());
    EXPECT_EQ(AAFRESULT_DATA_SIZE, large->Save());
    const std::wstring most =
        L": takes more than 6000 bytes, the most that a file with sectors of ";
    const std::vector<std::wstring> wanted = {
        path_ + most + L"512 bytes may have; one with sectors of 4096 bytes may have 6000",
        path_ + most + L"4096 bytes may have"};
    EXPECT_EQ(told.all, wanted);
    EXPECT_EQ(folder_.CountFiles(), 0u) << "nothing was written";
}

TEST_F(SaveLimits, ACopyThatWouldBeTooLargeIsRefusedTheSameWay) {
    limits_.largestFile = 6000;
    Ptr<IAAFFile> target = NewFile(kAAFFileKind_Aaf512Binary);
    Sentences told;
    EXPECT_EQ(AAFRESULT_DATA_SIZE, file_->SaveCopyAs(target));
    ASSERT_EQ(told.all.size(), 1u);
    EXPECT_EQ(told.all[0].find(path_ + L": takes more than 6000 bytes"), 0u);
    EXPECT_EQ(folder_.CountFiles(), 0u);
}

TEST_F(SaveLimits, TheFileThatWasThereStays) {
    folder_.Write("clip.aaf", "old");
    limits_.largestFile = 6000;
    EXPECT_EQ(AAFRESULT_DATA_SIZE, NewFile(kAAFFileKind_Aaf512Binary)->Save());
    EXPECT_EQ(std::filesystem::file_size(folder_ / "clip.aaf"), 3u);
    EXPECT_EQ(folder_.CountFiles(), 1u);
}

TEST_F(SaveLimits, AFileWithinTheLimitIsSavedAfterARefusal) {
    Ptr<IAAFFile> file = NewFile(kAAFFileKind_Aaf512Binary);
    limits_.largestFile = 6000;
    EXPECT_EQ(AAFRESULT_DATA_SIZE, file->Save());
    limits_.largestFile = 1000000;
    EXPECT_EQ(AAFRESULT_SUCCESS, file->Save());
    EXPECT_EQ(folder_.CountFiles(), 1u);
}

TEST_F(SaveLimits, TheResultHasAText) {
    aafUInt32 bytes = 0;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFResultToTextBufLen(AAFRESULT_DATA_SIZE, &bytes));
    std::wstring text(bytes / sizeof(wchar_t), L'\0');
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFResultToText(AAFRESULT_DATA_SIZE, text.data(), bytes));
    EXPECT_NE(text.find(L"takes more bytes than a file of that kind may have"), std::wstring::npos);
}

}  // namespace aaf_test
