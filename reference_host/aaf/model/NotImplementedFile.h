// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFFile> : public IAAFFile {
public:
    HRESULT Open() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SaveCopyAs(IAAFFile*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetHeader(IAAFHeader**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetRevision(aafFileRev_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Save() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Close() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDictionary(IAAFDictionary**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFHeader> : public IAAFHeader {
public:
    HRESULT LookupMob(aafMobID_constref, IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountMobs(aafMobKind_t, aafNumSlots_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMobs(aafSearchCrit_t*, IEnumAAFMobs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddMob(IAAFMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveMob(IAAFMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountEssenceData(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsEssenceDataPresent(aafMobID_constref, aafFileFormat_t, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT EnumEssenceData(IEnumAAFEssenceData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddEssenceData(IAAFEssenceData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveEssenceData(IAAFEssenceData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupEssenceData(aafMobID_constref, IAAFEssenceData**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDictionary(IAAFDictionary**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLastIdentification(IAAFIdentification**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupIdentification(aafUID_constref, IAAFIdentification**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountIdentifications(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIdentifications(IEnumAAFIdentifications**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendIdentification(IAAFIdentification*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIdentificationAt(aafUInt32, IAAFIdentification**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetRefImplVersion(aafProductVersion_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileRevision(aafVersionType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLastModified(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetContentStorage(IAAFContentStorage**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFHeader2> : public IAAFHeader2 {
public:
    HRESULT LookupMob(aafMobID_constref, IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountMobs(aafMobKind_t, aafNumSlots_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMobs(aafSearchCrit_t*, IEnumAAFMobs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddMob(IAAFMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveMob(IAAFMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountEssenceData(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsEssenceDataPresent(aafMobID_constref, aafFileFormat_t, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT EnumEssenceData(IEnumAAFEssenceData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddEssenceData(IAAFEssenceData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveEssenceData(IAAFEssenceData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupEssenceData(aafMobID_constref, IAAFEssenceData**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDictionary(IAAFDictionary**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLastIdentification(IAAFIdentification**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupIdentification(aafUID_constref, IAAFIdentification**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountIdentifications(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIdentifications(IEnumAAFIdentifications**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendIdentification(IAAFIdentification*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIdentificationAt(aafUInt32, IAAFIdentification**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetRefImplVersion(aafProductVersion_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileRevision(aafVersionType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLastModified(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetContentStorage(IAAFContentStorage**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPrimaryMob(IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPrimaryMob(IAAFMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetOperationalPattern(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetOperationalPattern(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT UpdateEssenceContainers() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountEssenceContainers(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEssenceContainers(aafUInt32, aafUID_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsEssenceContainerPresent(aafUID_constref, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountDescriptiveSchemes(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescriptiveSchemes(aafUInt32, aafUID_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsDescriptiveSchemePresent(aafUID_constref, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddDescriptiveScheme(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveDescriptiveScheme(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFContentStorage> : public IAAFContentStorage {
public:
    HRESULT LookupMob(aafMobID_constref, IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountMobs(aafMobKind_t, aafNumSlots_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMobs(aafSearchCrit_t*, IEnumAAFMobs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddMob(IAAFMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveMob(IAAFMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountEssenceData(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsEssenceDataPresent(aafMobID_constref, aafFileFormat_t, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT EnumEssenceData(IEnumAAFEssenceData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddEssenceData(IAAFEssenceData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveEssenceData(IAAFEssenceData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupEssenceData(aafMobID_constref, IAAFEssenceData**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFIdentification> : public IAAFIdentification {
public:
    HRESULT Initialize(aafCharacter_constptr, aafCharacter_constptr, aafCharacter_constptr,
                       aafUID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCompanyName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCompanyNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetProductName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetProductNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetProductVersionString(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetProductVersionStringBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetProductVersion(aafProductVersion_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetProductVersion(aafProductVersion_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetProductID(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDate(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetRefImplVersion(aafProductVersion_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPlatform(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPlatformBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetGenerationID(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFIdentifications> : public IEnumAAFIdentifications {
public:
    HRESULT NextOne(IAAFIdentification**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFIdentification**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFIdentifications**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEndian> : public IAAFEndian {
public:
    HRESULT GetStoredByteOrder(eAAFByteOrder_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNativeByteOrder(eAAFByteOrder_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFCachePageAllocator> : public IAAFCachePageAllocator {
public:
    HRESULT Initialize(aafUInt32, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Allocate(aafMemPtr_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Deallocate(aafMemPtr_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDiagnosticOutput> : public IAAFDiagnosticOutput {
public:
    HRESULT PutString(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFFileEncoding> : public IAAFFileEncoding {
public:
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescription(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescriptionBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileKind(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFGetFileBits> : public IAAFGetFileBits {
public:
    HRESULT ReadAt(aafMemPtr_t, aafUInt32, aafUInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSize(aafUInt64*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFProgress> : public IAAFProgress {
public:
    HRESULT ProgressCallback() override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFRandomFile> : public IAAFRandomFile {
public:
    HRESULT GetFileBits(IAAFGetFileBits**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Revert() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SaveAsFile(IAAFFile*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileBits(IAAFSetFileBits**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFRandomRawStorage> : public IAAFRandomRawStorage {
public:
    HRESULT ReadAt(aafUInt64, aafMemPtr_t, aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT WriteAt(aafUInt64, aafMemConstPtr_t, aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetSize(aafUInt64*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsExtendable(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetExtent(aafUInt64*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetExtent(aafUInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFRawStorage> : public IAAFRawStorage {
public:
    HRESULT IsReadable(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Read(aafMemPtr_t, aafUInt32, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsWriteable(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Write(aafMemConstPtr_t, aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Synchronize() override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSetFileBits> : public IAAFSetFileBits {
public:
    HRESULT WriteAt(aafMemPtr_t, aafUInt32, aafUInt64) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetSize(aafUInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFFileEncodings> : public IEnumAAFFileEncodings {
public:
    HRESULT NextOne(IAAFFileEncoding**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFFileEncoding**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFFileEncodings**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
