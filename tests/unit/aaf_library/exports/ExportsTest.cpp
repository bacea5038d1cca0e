// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFPluginDefinitions.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

namespace {

std::wstring ResultText(AAFRESULT result) {
    aafUInt32 bytes = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, AAFResultToTextBufLen(result, &bytes));
    std::vector<aafCharacter> text(bytes / sizeof(aafCharacter) + 1);
    EXPECT_EQ(AAFRESULT_SUCCESS, AAFResultToText(result, text.data(), bytes));
    return text.data();
}

// Counts its references and what it is told.
class Listener final : public IAAFDiagnosticOutput, public IAAFProgress {
public:
    virtual ~Listener() = default;
    HRESULT QueryInterface(REFIID, void** out) override {
        *out = nullptr;
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    ULONG AddRef() override { return ++references; }
    ULONG Release() override { return --references; }
    HRESULT PutString(aafCharacter_constptr string) override {
        lines.emplace_back(string);
        return AAFRESULT_SUCCESS;
    }
    HRESULT ProgressCallback() override {
        ++calls;
        return AAFRESULT_SUCCESS;
    }

    ULONG references = 1;
    int calls = 0;
    std::vector<std::wstring> lines;
};

}  // namespace

TEST(Exports, TellTheVersionOfTheLibrary) {
    aafProductVersion_t version{};
    EXPECT_EQ(AAFRESULT_SUCCESS, AAFGetLibraryVersion(&version));
    EXPECT_EQ(1, version.major);
    EXPECT_EQ(1, version.minor);
    EXPECT_EQ(6, version.tertiary);
    EXPECT_EQ(kAAFVersionBeta, version.type);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFGetLibraryVersion(nullptr));
}

TEST(Exports, TellWhereTheLibraryLies) {
    aafUInt32 bytes = 0;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFGetLibraryPathNameBufLen(&bytes));
    std::vector<aafCharacter> path(bytes / sizeof(aafCharacter) + 1);
    EXPECT_EQ(AAFRESULT_SMALLBUF, AAFGetLibraryPathName(path.data(), bytes - sizeof(aafCharacter)));
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFGetLibraryPathName(path.data(), bytes));
    EXPECT_NE(std::wstring::npos, std::wstring(path.data()).find(L"com-api"));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFGetLibraryPathNameBufLen(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFGetLibraryPathName(nullptr, bytes));
}

TEST(Exports, NameResults) {
    EXPECT_EQ(L"AAFRESULT_PROP_NOT_PRESENT: The property has no value.",
              ResultText(AAFRESULT_PROP_NOT_PRESENT));
    EXPECT_EQ(L"AAFRESULT_SUCCESS: The operation succeeded.", ResultText(AAFRESULT_SUCCESS));
    EXPECT_EQ(L"AAFRESULT_NOT_IMPLEMENTED: The operation is not implemented.",
              ResultText(AAFRESULT_NOT_IMPLEMENTED));
    // Known, but not of this library.
    EXPECT_EQ(L"AAFRESULT_BADQTABLE", ResultText(static_cast<AAFRESULT>(0x801200A4u)));
}

TEST(Exports, RefuseResultsThatTheyDoNotKnow) {
    aafUInt32 bytes = 0;
    aafCharacter text[4];
    EXPECT_EQ(static_cast<AAFRESULT>(0x80120501u),
              AAFResultToTextBufLen(static_cast<AAFRESULT>(0x8012FFFFu), &bytes));
    EXPECT_EQ(static_cast<AAFRESULT>(0x80120500u),
              AAFResultToText(static_cast<AAFRESULT>(0x80070057u), text, sizeof text));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFResultToTextBufLen(0, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFResultToText(0, nullptr, 0));
    EXPECT_EQ(AAFRESULT_SMALLBUF, AAFResultToText(0, text, sizeof text));
}

TEST(Exports, HaveNoPlugInsToManage) {
    IAAFPluginManager* manager = reinterpret_cast<IAAFPluginManager*>(1);
    EXPECT_EQ(AAFRESULT_NOT_IMPLEMENTED, AAFGetPluginManager(&manager));
    EXPECT_EQ(nullptr, manager);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFGetPluginManager(nullptr));
}

TEST(Exports, ListTheKindsOfFilesThatCanBeWritten) {
    Ptr<IEnumAAFFileEncodings> all;
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFGetFileEncodings(nullptr));
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFGetFileEncodings(all.Out()));
    Ptr<IAAFFileEncoding> encoding = Get(all, &IEnumAAFFileEncodings::NextOne);
    EXPECT_EQ(kAAFFileKind_Aaf512Binary, Get(encoding, &IAAFFileEncoding::GetFileKind));
    EXPECT_EQ(L"AAF-512", TextOf<IAAFFileEncoding>(encoding, &IAAFFileEncoding::GetNameBufLen,
                                                   &IAAFFileEncoding::GetName));
    EXPECT_NE(L"", TextOf<IAAFFileEncoding>(encoding, &IAAFFileEncoding::GetDescriptionBufLen,
                                            &IAAFFileEncoding::GetDescription));
    ASSERT_EQ(AAFRESULT_SUCCESS, all->NextOne(encoding.Out()));
    EXPECT_EQ(kAAFFileKind_Aaf4KBinary, Get(encoding, &IAAFFileEncoding::GetFileKind));
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, all->NextOne(encoding.Out()));
}

TEST(Exports, TellListenersWhyAFileCanNotBeRead) {
    Listener listener;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFSetDiagnosticOutput(&listener));
    EXPECT_EQ(2u, listener.references);
    Ptr<IAAFFile> file;
    EXPECT_EQ(AAFRESULT_FILE_NOT_FOUND,
              AAFFileOpenExistingRead(L"/no such folder/\x00E4.aaf", 0, file.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFSetDiagnosticOutput(nullptr));
    EXPECT_EQ(1u, listener.references);
    ASSERT_EQ(1u, listener.lines.size());
    EXPECT_EQ(0u, listener.lines[0].find(L"/no such folder/\x00E4.aaf: "));
}

TEST(Exports, ReportProgressOfSaving) {
    Product product;
    Ptr<IAAFFile> file;
    Listener listener;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product.ident, file.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFSetProgressCallback(&listener));
    EXPECT_EQ(AAFRESULT_SUCCESS, file->Save());
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFSetProgressCallback(nullptr));
    EXPECT_EQ(2, listener.calls);
    EXPECT_EQ(1u, listener.references);
}

TEST(Exports, PinTimeAndGenerationUntilTheyAreFreed) {
    const aafTimeStamp_t time{{2001, 2, 3}, {4, 5, 6, 0}};
    const aafUID_t generation = ncfGuid("ABCDEF00-0000-0000-0000-000000000006");
    Product product;
    for (bool pinned : {true, false}) {
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  AAFCliphostPinTime(pinned ? &time : nullptr, pinned ? &generation : nullptr));
        Ptr<IAAFFile> file;
        Ptr<IAAFMob> mob;
        aafTimeStamp_t found{};
        aafUID_t id{};
        ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product.ident, file.Out()));
        Ptr<IAAFHeader> header = Get(file, &IAAFFile::GetHeader);
        Ptr<IAAFDictionary> dictionary = Get(file, &IAAFFile::GetDictionary);
        EXPECT_EQ(AAFRESULT_SUCCESS, header->GetLastModified(&found));
        EXPECT_EQ(pinned, found.date.year == 2001);
        Ptr<IAAFIdentification> last = Get(header, &IAAFHeader::GetLastIdentification);
        EXPECT_EQ(AAFRESULT_SUCCESS, last->GetGenerationID(&id));
        EXPECT_EQ(pinned, id == generation);
        EXPECT_EQ(AAFRESULT_SUCCESS, last->GetDate(&found));
        EXPECT_EQ(pinned, found.date.year == 2001);
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  dictionary->CreateInstance(AUID_AAFMasterMob, IID_IAAFMob, mob.OutUnknown()));
        EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetCreateTime(&found));
        EXPECT_EQ(pinned, found.time.second == 6 && found.date.year == 2001);
    }
}

}  // namespace aaf_test
