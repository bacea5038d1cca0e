// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafLibrary.h"

#include <fmt/format.h>

#include <system_error>

#include "host_interfaces/Version.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/ScratchFolder.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

using host::DisplayPath;

// Fixes what the library would take from the clock or at random; our own library
// exports this beside the published functions.
using PinTimeFunction = HRESULT (*)(const aafTimeStamp_t* time, const aafUID_t* generation);

constexpr aafUID_t kPinnedGeneration = ncfGuid("00000000-0000-0000-0000-000000000001");

// A path in the form that the library takes.
std::wstring WideName(const std::filesystem::path& path) {
    return encodings::ToWideLossy(host::system::FromSystemPath(path));
}

// Keeps the sentences that the library writes for people, while this lives.
class LibrarySentences final : public IAAFDiagnosticOutput {
public:
    explicit LibrarySentences(AAFSetDiagnosticOutputFunction set) : set_(set) {
        if (set_) {
            set_(this);
        }
    }
    ~LibrarySentences() {
        if (set_) {
            set_(nullptr);
        }
    }
    LibrarySentences(const LibrarySentences&) = delete;
    LibrarySentences& operator=(const LibrarySentences&) = delete;

    HRESULT QueryInterface(REFIID, void** out) override {
        *out = nullptr;
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    // It lives longer than it is set.
    ULONG AddRef() override { return 1; }
    ULONG Release() override { return 1; }
    HRESULT PutString(aafCharacter_constptr sentence) override {
        all_.push_back(Utf8(sentence));
        return AAFRESULT_SUCCESS;
    }

    const std::vector<std::string>& all() const { return all_; }
    std::string last() const { return all_.empty() ? std::string() : all_.back(); }

private:
    AAFSetDiagnosticOutputFunction set_;
    std::vector<std::string> all_;
};

// Makes a copy that can be written, whatever the permissions of its source.
void CopyForEdit(const std::filesystem::path& source, OutputFile& output) {
    std::error_code error;
    std::filesystem::copy_file(source, output.NameForOther(), error);
    if (!error) {
        std::filesystem::permissions(output.NameForOther(), std::filesystem::perms::owner_write,
                                     std::filesystem::perm_options::add, error);
    }
    if (error) {
        output.Fail(error.default_error_condition().value());
    }
}

// How files name this program as their writer.
class ThisProgram {
public:
    ThisProgram() {
        identification_.companyName = company_;
        identification_.productName = product_;
        identification_.productVersionString = versionText_;
        identification_.productID = ncfGuid("6E2E6B0C-53C1-4D4B-8B1D-2F9C6A7E1C55");
        identification_.platform = platform_;
        identification_.productVersion = &version_;
    }
    ThisProgram(const ThisProgram&) = delete;
    ThisProgram& operator=(const ThisProgram&) = delete;
    aafProductIdentification_t* identification() { return &identification_; }

private:
    aafCharacter company_[9] = L"Cliphost";
    aafCharacter product_[9] = L"cliphost";
    aafCharacter versionText_[sizeof PRODUCT_VERSION_TEXT] = L"" PRODUCT_VERSION_TEXT;
    aafCharacter platform_[1] = L"";
    aafProductVersion_t version_{PRODUCT_VERSION_NUMBERS, 0, kAAFVersionReleased};
    aafProductIdentification_t identification_{};
};

}  // namespace

AafLibrary::AafLibrary(const std::filesystem::path& file) : file_(file) {
    std::string reason;
    if (!library_.Open(file, reason)) {
        throw Failure(kExitCaller, file, "the AAF library can't be loaded: " + reason,
                      "name another with --aaf-library FILE");
    }
    for (const char* const name :
         {"AAFFileOpenTransient", "AAFFileOpenExistingRead", "AAFFileOpenNewModifyEx"}) {
        if (!library_.Find(name)) {
            throw Failure(kExitCaller, file,
                          fmt::format("is not an AAF library: it lacks {}", name),
                          "name another with --aaf-library FILE");
        }
    }
    // The module asks the system for the library by its name alone.
    if (!library_.IsFoundAs(kAAFLibraryName)) {
        throw Failure(
            kExitCaller, file,
            fmt::format("the module would not find this AAF library: it asks the system for {}",
                        kAAFLibraryName),
            fmt::format(
                "name a folder that can be written to in TMPDIR, or give the file that name "
                "and start again with LD_LIBRARY_PATH={}",
                DisplayPath(host::system::WholePath(file).parent_path())));
    }
}

bool AafLibrary::PinTime(const aafTimeStamp_t& time) {
    const auto pin = find<PinTimeFunction>("AAFCliphostPinTime");
    return pin && pin(&time, &kPinnedGeneration) >= 0;
}

// The library writes files alone, so a device takes the bytes of one.
void AafLibrary::WriteToDevice(const std::filesystem::path& device, const Write& write) const {
    std::error_code error;
    const host::system::ScratchFolder scratch(error);
    if (error) {
        throw Failure(kExitCaller, host::system::TemporaryFolder(),
                      "no folder can be made there: " + error.default_error_condition().message(),
                      "name another one in TMPDIR");
    }
    const std::filesystem::path clip = scratch.path() / "clip.aaf";
    write(clip);
    PutIntoPlace(clip, device);
}

// The steps of the library that write an output.
class AafLibrary::Steps {
public:
    Steps(const AafLibrary& library, OutputFile& output, const std::filesystem::path& path)
        : library_(library),
          output_(output),
          path_(path),
          said_(library.find<AAFSetDiagnosticOutputFunction>("AAFSetDiagnosticOutput")) {}

    // Throws a Failure that says why a step failed.
    void Check(HRESULT result, const char* step) {
        if (result >= 0) {
            return;
        }
        if (const int error = SystemErrorIn(said_.last())) {
            output_.Fail(error);
        }
        output_.TryPlace();
        const std::string reason =
            said_.last().empty() ? library_.TextOfResult(result) : said_.last();
        throw Failure(
            kExitCaller, path_,
            fmt::format(
                "not written: {} failed: {}", step,
                reason.empty() ? fmt::format("0x{:08X}", static_cast<ncfUInt32>(result)) : reason));
    }

private:
    const AafLibrary& library_;
    OutputFile& output_;
    const std::filesystem::path& path_;
    const LibrarySentences said_;
};

void AafLibrary::Save(IAAFFile* file, const std::filesystem::path& path) const {
    if (OutputFile::IsDevice(path)) {
        WriteToDevice(path, [&](const std::filesystem::path& clip) { Save(file, clip); });
        return;
    }
    const auto openNew = find<AAFFileOpenNewModifyExFunction>("AAFFileOpenNewModifyEx");
    ThisProgram program;
    OutputFile output(path, OutputFile::Writer::Other);
    Steps steps(*this, output, path);
    host::Ref<IAAFFile> copy;
    steps.Check(openNew(WideName(output.NameForOther()).c_str(), &kAAFFileKind_Aaf512Binary, 0,
                        program.identification(), copy.Out()),
                "opening a new file");
    // This saves the copy, too.
    steps.Check(file->SaveCopyAs(copy.get()), "copying the description");
    steps.Check(copy->Close(), "closing");
    output.Finish();
}

void AafLibrary::SaveAsItIs(const std::filesystem::path& source,
                            const std::filesystem::path& path) const {
    if (OutputFile::IsDevice(path)) {
        WriteToDevice(path, [&](const std::filesystem::path& clip) { SaveAsItIs(source, clip); });
        return;
    }
    OutputFile output(path, OutputFile::Writer::Other);
    CopyForEdit(source, output);
    output.Finish();
}

void AafLibrary::SaveEdited(const std::filesystem::path& source, const std::filesystem::path& path,
                            const std::function<void(IAAFFile*)>& edit) const {
    if (OutputFile::IsDevice(path)) {
        WriteToDevice(path,
                      [&](const std::filesystem::path& clip) { SaveEdited(source, clip, edit); });
        return;
    }
    const auto open = find<AAFFileOpenExistingModifyFunction>("AAFFileOpenExistingModify");
    if (!open) {
        throw Failure(kExitCaller, file_, "this AAF library edits no files",
                      "name another with --aaf-library FILE");
    }
    ThisProgram program;
    OutputFile output(path, OutputFile::Writer::Other);
    CopyForEdit(source, output);
    Steps steps(*this, output, path);
    host::Ref<IAAFFile> copy;
    steps.Check(
        open(WideName(output.NameForOther()).c_str(), 0, program.identification(), copy.Out()),
        "opening the copy");
    edit(copy.get());
    steps.Check(copy->Save(), "saving");
    steps.Check(copy->Close(), "closing");
    output.Finish();
}

void AafLibrary::TryToSave(const std::filesystem::path& path) const {
    if (!OutputFile::IsDevice(path)) {
        OutputFile(path, OutputFile::Writer::Other).TryPlace();
    }
}

host::Ref<IAAFFile> AafLibrary::OpenTransient() const {
    const auto open = find<AAFFileOpenTransientFunction>("AAFFileOpenTransient");
    ThisProgram program;
    host::Ref<IAAFFile> file;
    const HRESULT result = open(program.identification(), file.Out());
    if (result < 0) {
        throw Failure(kExitCaller, file_, "no file can be made in memory: " + TextOfResult(result));
    }
    return file;
}

host::Ref<IAAFFile> AafLibrary::Open(const std::filesystem::path& path) const {
    if (Problem problem = WhyUnreadable(path)) {
        if (std::filesystem::is_directory(path)) {
            problem.hint = "give an AAF file in it";
        }
        throw Failure(problem);
    }
    const auto openRead = find<AAFFileOpenExistingReadFunction>("AAFFileOpenExistingRead");
    const LibrarySentences said(find<AAFSetDiagnosticOutputFunction>("AAFSetDiagnosticOutput"));
    host::Ref<IAAFFile> file;
    const HRESULT result = openRead(WideName(path).c_str(), 0, file.Out());
    if (result < 0) {
        throw Failure(kExitFile, path, "can't be read as AAF: " + TextOfResult(result));
    }
    // What the library read all the same.
    for (const std::string& sentence : said.all()) {
        Notice("cliphost: {}: {}\n", DisplayPath(path), sentence);
    }
    return file;
}

std::string AafLibrary::TextOfResult(HRESULT result) const {
    const auto length = find<AAFResultToTextBufLenFunction>("AAFResultToTextBufLen");
    const auto text = find<AAFResultToTextFunction>("AAFResultToText");
    return !length || !text
               ? std::string()
               : TextInTwoSteps(
                     [&](aafUInt32* bytes) { return length(result, bytes); },
                     [&](aafCharacter* to, aafUInt32 bytes) { return text(result, to, bytes); });
}

std::string AafLibrary::Version() const {
    const auto get = find<AAFGetLibraryVersionFunction>("AAFGetLibraryVersion");
    aafProductVersion_t version{};
    if (!get || get(&version) < 0) {
        return "unknown";
    }
    return fmt::format("{}.{}.{}.{}", version.major, version.minor, version.tertiary,
                       version.patchLevel);
}

}  // namespace cliphost
