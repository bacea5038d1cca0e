// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/File.h"

#include "aaf_library/model/Dictionary.h"
#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/Extensions.h"
#include "aaf_library/objects/Listeners.h"
#include "aaf_library/objects/Mob.h"
#include "aaf_library/objects/ObjectClasses.h"
#include "aaf_library/objects/Paths.h"
#include "aaf_library/stored/ModelFile.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/StoredError.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFExports.h"

namespace aaf {

namespace {

constexpr aafUInt32 kKnownFlags =
    AAF_FILE_MODE_LAZY_LOADING | AAF_FILE_MODE_REVERTABLE | AAF_FILE_MODE_UNBUFFERED |
    AAF_FILE_MODE_RECLAIMABLE | AAF_FILE_MODE_USE_LARGE_SS_SECTORS | AAF_FILE_MODE_CLOSE_FAIL_DIRTY;

struct FailureCode {
    stored::FileFailure failure;
    HRESULT code;
};

// What a failure of the stored form is called at the interfaces. Access is
// refused to a reader or to a writer; the caller tells which.
constexpr FailureCode kFailureCodes[] = {
    {stored::FileFailure::NotThere, AAFRESULT_FILE_NOT_FOUND},
    {stored::FileFailure::NotAaf, AAFRESULT_NOT_AAF_FILE},
    {stored::FileFailure::Damaged, AAFRESULT_READ_FAILURE},
    {stored::FileFailure::NotStorable, AAFRESULT_INVALID_OBJ},
    {stored::FileFailure::TooLarge, AAFRESULT_DATA_SIZE},
    {stored::FileFailure::NoMemory, AAFRESULT_NOMEMORY},
};

HRESULT ResultOf(const stored::FileResult& result, HRESULT noAccess) {
    for (const std::string& note : result.notes) {
        TellDiagnostic(note);
    }
    if (result) {
        return AAFRESULT_SUCCESS;
    }
    TellDiagnostic(result.message);
    for (const FailureCode& entry : kFailureCodes) {
        if (entry.failure == result.failure) {
            return entry.code;
        }
    }
    return noAccess;
}

HRESULT CheckFlags(aafUInt32 modeFlags) {
    return (modeFlags & ~kKnownFlags) == 0 ? AAFRESULT_SUCCESS : AAFRESULT_BAD_FLAGS;
}

}  // namespace

HRESULT File::OpenTransient(const aafProductIdentification_t* product, IAAFFile** file) {
    if (product == nullptr || file == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<File> made(new File);
    const HRESULT result = made->MakeNew(product);
    return result < 0 ? result : GiveOut(made.get(), file);
}

HRESULT File::OpenNew(aafCharacter_constptr path, const aafUID_t& kind, aafUInt32 modeFlags,
                      const aafProductIdentification_t* product, IAAFFile** file) {
    if (path == nullptr || product == nullptr || file == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    HRESULT result = CheckFlags(modeFlags);
    if (result < 0) {
        return result;
    }
    if (kind != kAAFFileKind_Aaf512Binary && kind != kAAFFileKind_Aaf4KBinary &&
        kind != kAAFFileKind_DontCare) {
        return AAFRESULT_FILEKIND_NOT_REGISTERED;
    }
    const RefPtr<File> made(new File);
    made->access_ = Access::Write;
    made->path_ = PathOf(path);
    made->largeSectors_ =
        kind == kAAFFileKind_Aaf4KBinary ||
        (kind == kAAFFileKind_DontCare && (modeFlags & AAF_FILE_MODE_USE_LARGE_SS_SECTORS) != 0);
    made->failsUnsaved_ = (modeFlags & AAF_FILE_MODE_CLOSE_FAIL_DIRTY) != 0;
    result = made->MakeNew(product);
    return result < 0 ? result : GiveOut(made.get(), file);
}

HRESULT File::OpenToRead(aafCharacter_constptr path, aafUInt32 modeFlags, IAAFFile** file) {
    if (path == nullptr || file == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<File> made(new File);
    made->access_ = Access::Read;
    const HRESULT result = made->Load(path, modeFlags);
    return result < 0 ? result : GiveOut(made.get(), file);
}

HRESULT File::OpenToModify(aafCharacter_constptr path, aafUInt32 modeFlags,
                           const aafProductIdentification_t* product, IAAFFile** file) {
    if (path == nullptr || product == nullptr || file == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<File> made(new File);
    made->access_ = Access::Write;
    HRESULT result = made->Load(path, modeFlags);
    if (result >= 0) {
        result = made->header_->AddIdentification(*product);
    }
    return result < 0 ? result : GiveOut(made.get(), file);
}

HRESULT File::MakeNew(const aafProductIdentification_t* product) {
    model_ = Model::Create(ObjectClasses());
    const RefPtr<Header> header = model_->NewObject<Header>(AUID_AAFHeader);
    const HRESULT result = header->AddIdentification(*product);
    if (result >= 0) {
        header_ = header;
    }
    return result;
}

HRESULT File::Load(aafCharacter_constptr path, aafUInt32 modeFlags) {
    HRESULT result = CheckFlags(modeFlags);
    if (result < 0) {
        return result;
    }
    path_ = PathOf(path);
    failsUnsaved_ = (modeFlags & AAF_FILE_MODE_CLOSE_FAIL_DIRTY) != 0;
    saved_ = true;
    model_ = Model::Create(ObjectClasses());
    RefPtr<Object> read;
    result = ResultOf(stored::LoadModel(path_, *model_, read), AAFRESULT_NOT_READABLE);
    if (result < 0) {
        return result;
    }
    const RefPtr<Header> header(dynamic_cast<Header*>(read.get()));
    if (!header || header->content() == nullptr) {
        return AAFRESULT_BADHEAD;
    }
    stored::SectorSize sectors{};
    largeSectors_ = stored::IsAafFile(path_, &sectors) && sectors == stored::SectorSize::Bytes4096;
    header_ = header;
    return AAFRESULT_SUCCESS;
}

stored::SectorSize File::SizeOfSectors() const {
    return largeSectors_ ? stored::SectorSize::Bytes4096 : stored::SectorSize::Bytes512;
}

File::~File() {
    StopAwaiting();
}

ContentStorage* File::OpenStorage() {
    return IsOpen() && PrepareToShow() >= 0 ? header_->content() : nullptr;
}

HRESULT File::Open() {
    return AAFRESULT_ALREADY_OPEN;
}

HRESULT File::GetHeader(IAAFHeader** header) {
    if (header == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsOpen()) {
        return AAFRESULT_NOT_OPEN;
    }
    const HRESULT result = PrepareToShow();
    return result < 0 ? result : GiveOut(header_.get(), header);
}

HRESULT File::GetDictionary(IAAFDictionary** dictionary) {
    if (dictionary == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsOpen()) {
        return AAFRESULT_NOT_OPEN;
    }
    const HRESULT result = PrepareToShow();
    return result < 0 ? result : GiveOut(&model_->dictionary(), dictionary);
}

HRESULT File::GetRevision(aafFileRev_t* rev) {
    if (rev == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsOpen()) {
        return AAFRESULT_NOT_OPEN;
    }
    *rev = kAAFRev2;
    return AAFRESULT_SUCCESS;
}

HRESULT File::Save() {
    if (!IsOpen()) {
        return AAFRESULT_NOT_OPEN;
    }
    if (access_ == Access::Read) {
        return AAFRESULT_WRONG_OPENMODE;
    }
    HRESULT result = TakeContent();
    if (result < 0) {
        return result;
    }
    header_->Touch();
    TellProgress();
    if (access_ == Access::Transient) {
        // Nothing is written, but what could not be written is told.
        try {
            stored::TreeOfModel(*model_, *header_);
        } catch (const stored::StoredError& problem) {
            TellDiagnostic(problem.what());
            result = AAFRESULT_INVALID_OBJ;
        }
    } else {
        result = ResultOf(stored::SaveModel(*model_, *header_, path_, SizeOfSectors()),
                          AAFRESULT_NOT_WRITEABLE);
    }
    saved_ = result >= 0;
    TellProgress();
    return result;
}

HRESULT File::Close() {
    if (!IsOpen()) {
        return AAFRESULT_NOT_OPEN;
    }
    if (failsUnsaved_ && access_ == Access::Write && !saved_) {
        return AAFRESULT_UNSAVED_CHANGES;
    }
    StopAwaiting();
    header_ = nullptr;
    model_ = nullptr;
    return AAFRESULT_SUCCESS;
}

HRESULT File::SaveCopyAs(IAAFFile* destFile) {
    if (destFile == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    File* const target = ImplementationAs<File>(destFile);
    if (target == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (!IsOpen() || !target->IsOpen()) {
        return AAFRESULT_NOT_OPEN;
    }
    if (target->access_ == Access::Read) {
        return AAFRESULT_WRONG_OPENMODE;
    }
    if (const HRESULT result = TakeContent(); result < 0) {
        return result;
    }
    HRESULT result = AAFRESULT_SUCCESS;
    if (target != this && CanSaveContentAs(*target) && SaveContentAs(*target, &result)) {
        return result;
    }
    if (OpenStorage() == nullptr || target->OpenStorage() == nullptr) {
        return AAFRESULT_OBJECT_NOT_FOUND;
    }
    if (target == this || target->OpenStorage()->MobCount() > 0) {
        return AAFRESULT_OPERATION_NOT_PERMITTED;
    }
    result = CopyContentTo(*target);
    return result < 0 ? result : target->Save();
}

HRESULT File::CopyContentTo(File& target) {
    HRESULT result = CopyExtensions(*model_, *target.model_);
    const aafUInt32 own = target.header_->IdentificationCount();
    if (result >= 0) {
        result = target.header_->AddIdentificationsOf(*header_);
    }
    if (result >= 0) {
        result = target.TakeMobs(*header_->content());
    }
    if (result < 0) {
        target.header_->KeepIdentifications(own);
    }
    if (result >= 0) {
        target.header_->AddSummaryOf(*header_);
    }
    return result;
}

HRESULT File::TakeMobs(const ContentStorage& from) {
    ContentStorage& to = *header_->content();
    HRESULT result = AAFRESULT_SUCCESS;
    for (aafUInt32 at = 0; result >= 0 && at < from.MobCount(); ++at) {
        RefPtr<Mob> copy;
        const Mob* const mob = from.MobAt(at);
        result = mob == nullptr ? AAFRESULT_INVALID_OBJ : to.AddCopy(*mob, true, copy);
    }
    // All or nothing.
    while (result < 0 && to.MobCount() > 0) {
        to.RemoveCopy(*RefPtr<Mob>(to.MobAt(0)));
    }
    return result;
}

// Whether the target is as it was made, so that all that goes into it comes from here, and whether
// it would hold the same bytes.
bool File::CanSaveContentAs(const File& target) const {
    const ContentStorage* const from = header_->content();
    const ContentStorage* const to = target.header_->content();
    return target.access_ == Access::Write && !target.saved_ && !target.isShown_ &&
           from != nullptr && to != nullptr && from->classId() == to->classId() &&
           from->HoldsMobsAlone() && AreExtensionsCopiedAlike(*model_);
}

// Writes the target without a copy of what goes into it. False, and nothing is told, where the
// content can't be stored: the way through a copy then finds out why, and leaves the target as it
// has to. A target that only can't be written has its content all the same.
bool File::SaveContentAs(File& target, HRESULT* result) {
    target.header_->AddSummaryOf(*header_);
    target.header_->Touch();
    const aafUInt32 own = target.header_->IdentificationCount();
    stored::FileResult saved{stored::FileFailure::NotStorable, {}};
    if (target.header_->AddIdentificationsOf(*header_) >= 0) {
        saved = stored::SaveModel(*model_, *target.header_, target.path_, target.SizeOfSectors(),
                                  header_->content());
    }
    if (saved.failure == stored::FileFailure::NotStorable ||
        saved.failure == stored::FileFailure::NoMemory) {
        target.header_->RemoveSummary();
        target.header_->KeepIdentifications(own);
        return false;
    }
    TellProgress();
    *result = ResultOf(saved, AAFRESULT_NOT_WRITEABLE);
    TellProgress();
    target.saved_ = *result >= 0;
    target.AwaitContentOf(*header_);
    return true;
}

void File::AwaitContentOf(Header& source) {
    awaited_ = RefPtr<Header>(&source);
    source.model()->LetWait(*this);
}

RefPtr<Header> File::StopAwaiting() {
    RefPtr<Header> source = std::move(awaited_);
    if (source) {
        source->model()->LetGo(*this);
    }
    return source;
}

// What was saved whole can't be had any more once its copy has failed: the file then stays as it
// is.
HRESULT File::TakeContent() {
    if (const RefPtr<Header> source = StopAwaiting()) {
        taken_ = CopyExtensions(*source->model(), *model_);
        if (taken_ >= 0) {
            taken_ = TakeMobs(*source->content());
        }
    }
    return taken_;
}

void File::CopyNow() {
    TakeContent();
}

HRESULT File::PrepareToShow() {
    isShown_ = true;
    return TakeContent();
}

}  // namespace aaf
