// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Header.h"
#include "aaf_library/stored/StoredTree.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "not_implemented/AAFFile.h"

namespace aaf {

class ContentStorage;

// A file: a model with a header, and, unless it is transient, the path that it
// is saved to. It is open from the start; once closed it stays closed. What a
// caller still holds of its objects lives on.
//
// What another file saves into this one is written straight from that file's objects. They are
// copied when somebody looks at this file, or just before they change: most files are closed
// before either. Until then the two files belong to one thread.
class File : public Implements<Unknown, IAAFFile>, private Model::Copier {
public:
    static HRESULT OpenTransient(const aafProductIdentification_t* product, IAAFFile** file);
    // The file comes into being when it is saved, in place of one that is there.
    static HRESULT OpenNew(aafCharacter_constptr path, const aafUID_t& kind, aafUInt32 modeFlags,
                           const aafProductIdentification_t* product, IAAFFile** file);
    static HRESULT OpenToRead(aafCharacter_constptr path, aafUInt32 modeFlags, IAAFFile** file);
    static HRESULT OpenToModify(aafCharacter_constptr path, aafUInt32 modeFlags,
                                const aafProductIdentification_t* product, IAAFFile** file);

    // The content of an open file, else null.
    ContentStorage* OpenStorage();

    HRESULT Open() override;
    HRESULT SaveCopyAs(IAAFFile* destFile) override;
    HRESULT GetHeader(IAAFHeader** header) override;
    HRESULT GetRevision(aafFileRev_t* rev) override;
    HRESULT Save() override;
    HRESULT Close() override;
    HRESULT GetDictionary(IAAFDictionary** dictionary) override;

private:
    enum class Access { Transient, Read, Write };

    File() = default;
    ~File() override;
    bool IsOpen() const { return static_cast<bool>(header_); }
    stored::SectorSize SizeOfSectors() const;
    HRESULT MakeNew(const aafProductIdentification_t* product);
    HRESULT Load(aafCharacter_constptr path, aafUInt32 modeFlags);
    HRESULT CopyContentTo(File& target);
    bool CanSaveContentAs(const File& target) const;
    bool SaveContentAs(File& target, HRESULT* result);
    // -- Of the file that was saved into.
    void AwaitContentOf(Header& source);
    RefPtr<Header> StopAwaiting();
    HRESULT TakeContent();
    HRESULT TakeMobs(const ContentStorage& from);
    void CopyNow() override;
    // Before something of the file is given out.
    HRESULT PrepareToShow();

    RefPtr<Model> model_;
    RefPtr<Header> header_;
    Access access_ = Access::Transient;
    std::filesystem::path path_;
    bool largeSectors_ = false;
    bool failsUnsaved_ = false;  // Close fails while there is something to save
    bool saved_ = false;
    bool isShown_ = false;               // somebody may hold objects of the file
    RefPtr<Header> awaited_;             // of the file whose mobs are still to be copied
    HRESULT taken_ = AAFRESULT_SUCCESS;  // how that went, for all that need the copy
};

}  // namespace aaf
