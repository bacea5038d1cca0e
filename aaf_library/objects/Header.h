// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "not_implemented/AAFFile.h"

namespace aaf {

class ContentStorage;

// Root of the objects of a file: its content, who wrote it, and when. Held by
// the file. The dictionary is the model's.
class Header : public Implements<Object, IAAFHeader, IAAFEndian, IAAFHeader2> {
public:
    // Makes content and values of a new file; not for one that is read.
    void SetDefaults() override;

    // Null when a caller has removed it.
    ContentStorage* content() const;
    // Appends an identification of the program that is about to write.
    HRESULT AddIdentification(const aafProductIdentification_t& product);
    // To be called when the file is saved.
    void Touch();

    // -- Content, see ContentStorage
    HRESULT LookupMob(aafMobID_constref mobID, IAAFMob** mob) override;
    HRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* result) override;
    HRESULT GetMobs(aafSearchCrit_t* searchCriteria, IEnumAAFMobs** enumerator) override;
    HRESULT AddMob(IAAFMob* mob) override;
    HRESULT RemoveMob(IAAFMob* mob) override;
    HRESULT CountEssenceData(aafUInt32* result) override;
    HRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt,
                                 aafBoolean_t* result) override;
    HRESULT EnumEssenceData(IEnumAAFEssenceData** enumerator) override;
    HRESULT AddEssenceData(IAAFEssenceData* essenceData) override;
    HRESULT RemoveEssenceData(IAAFEssenceData* essenceData) override;
    HRESULT LookupEssenceData(aafMobID_constref mobID, IAAFEssenceData** essenceData) override;

    // -- Identifications
    HRESULT GetLastIdentification(IAAFIdentification** identification) override;
    HRESULT LookupIdentification(aafUID_constref generation,
                                 IAAFIdentification** identification) override;
    HRESULT CountIdentifications(aafUInt32* result) override;
    HRESULT GetIdentifications(IEnumAAFIdentifications** enumerator) override;
    HRESULT AppendIdentification(IAAFIdentification* ident) override;
    HRESULT GetIdentificationAt(aafUInt32 index, IAAFIdentification** identification) override;

    // -- The file as such
    HRESULT GetDictionary(IAAFDictionary** dictionary) override;
    HRESULT GetRefImplVersion(aafProductVersion_t* version) override;
    HRESULT GetFileRevision(aafVersionType_t* revision) override;
    HRESULT GetLastModified(aafTimeStamp_t* timeStamp) override;
    HRESULT GetContentStorage(IAAFContentStorage** storage) override;
    HRESULT GetStoredByteOrder(eAAFByteOrder_t* order) override;
    HRESULT GetNativeByteOrder(eAAFByteOrder_t* order) override;
    HRESULT GetOperationalPattern(aafUID_t* operationalPatternID) override;
    HRESULT SetOperationalPattern(aafUID_constref operationalPatternID) override;

private:
    template <class Operation>
    HRESULT OnContent(Operation operation) const;
};

// This library's own version, as the header and the exports tell it.
aafProductVersion_t LibraryVersion();

}  // namespace aaf
