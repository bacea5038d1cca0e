// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Object.h"
#include "aaf_library/objects/Fresh.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFEssenceData.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMobs.h"
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
    // Puts copies of those of another file behind this one's.
    HRESULT AddIdentificationsOf(const Header& other);
    aafUInt32 IdentificationCount() const { return CountObjects(prop::Header_IdentificationList); }
    // Drops those behind the first ones.
    void KeepIdentifications(aafUInt32 count);
    // Takes over what another file tells of the content that it hands on: its operational pattern,
    // and its wrappings and schemes beside the own ones.
    void AddSummaryOf(const Header& other);
    void RemoveSummary();
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
    HRESULT CountIdentifications(aafUInt32* result) override {
        return ReadCount(prop::Header_IdentificationList, result);
    }
    HRESULT GetIdentifications(IEnumAAFIdentifications** enumerator) override;
    HRESULT AppendIdentification(IAAFIdentification* ident) override {
        return AppendObject(prop::Header_IdentificationList, ident);
    }
    HRESULT GetIdentificationAt(aafUInt32 index, IAAFIdentification** identification) override {
        return ReadObjectAt(prop::Header_IdentificationList, index, identification);
    }

    // -- The file as such
    HRESULT GetDictionary(IAAFDictionary** dictionary) override {
        return Object::GetDictionary(dictionary);
    }
    HRESULT GetRefImplVersion(aafProductVersion_t* version) override;
    HRESULT GetFileRevision(aafVersionType_t* revision) override {
        return ReadStruct(prop::Header_Version, revision);
    }
    HRESULT GetLastModified(aafTimeStamp_t* timeStamp) override {
        return ReadStruct(prop::Header_LastModified, timeStamp);
    }
    HRESULT GetContentStorage(IAAFContentStorage** storage) override {
        return ReadObject(prop::Header_Content, storage);
    }
    HRESULT GetStoredByteOrder(eAAFByteOrder_t* order) override;
    HRESULT GetNativeByteOrder(eAAFByteOrder_t* order) override;
    HRESULT GetOperationalPattern(aafUID_t* operationalPatternID) override {
        return ReadStruct(prop::Header_OperationalPattern, operationalPatternID);
    }
    HRESULT SetOperationalPattern(aafUID_constref operationalPatternID) override {
        return PutStruct(prop::Header_OperationalPattern, operationalPatternID);
    }

    // -- The wrappings of the essence that the file tells of. They are those of the last update.
    HRESULT UpdateEssenceContainers() override;
    HRESULT CountEssenceContainers(aafUInt32* count) override;
    HRESULT GetEssenceContainers(aafUInt32 maximum, aafUID_t* ids) override;
    HRESULT IsEssenceContainerPresent(aafUID_constref id, aafBoolean_t* isPresent) override;

    // -- The schemes of its descriptive metadata
    HRESULT CountDescriptiveSchemes(aafUInt32* count) override;
    HRESULT GetDescriptiveSchemes(aafUInt32 maximum, aafUID_t* ids) override;
    HRESULT IsDescriptiveSchemePresent(aafUID_constref id, aafBoolean_t* isPresent) override;
    HRESULT AddDescriptiveScheme(aafUID_constref id) override;
    HRESULT RemoveDescriptiveScheme(aafUID_constref id) override;

private:
    template <class Operation>
    HRESULT OnContent(Operation operation) const;
};

// This library's own version, as the header and the exports tell it.
aafProductVersion_t LibraryVersion();

}  // namespace aaf
