// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFEssenceData.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IEnumAAFEssenceData> : public IEnumAAFEssenceData {
public:
    HRESULT NextOne(IAAFEssenceData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFEssenceData**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFEssenceData**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEssenceData> : public IAAFEssenceData {
public:
    HRESULT Initialize(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Write(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Read(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileMob(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMob(IAAFSourceMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMobID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEssenceData2> : public IAAFEssenceData2 {
public:
    HRESULT Initialize(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Write(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Read(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT WriteSampleIndex(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ReadSampleIndex(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetSampleIndexPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleIndexPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleIndexSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileMob(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMob(IAAFSourceMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMobID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPlainEssenceData(aafUInt32, IAAFPlainEssenceData**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEssenceAccess> : public IAAFEssenceAccess {
public:
    HRESULT SetEssenceCodecFlavour(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT WriteSamples(aafUInt32, aafUInt32, aafDataBuffer_t, aafUInt32*, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetLargestSampleSize(IAAFDataDef*, aafLength_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetIndexedSampleSize(IAAFDataDef*, aafPosition_t, aafLength_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetTransformParameters(IAAFEssenceFormat*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountSamples(IAAFDataDef*, aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT ReadSamples(aafUInt32, aafUInt32, aafDataBuffer_t, aafUInt32*, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Seek(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileFormat(IAAFEssenceFormat*, IAAFEssenceFormat**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFileFormatParameterList(IAAFEssenceFormat**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetEmptyFileFormat(IAAFEssenceFormat**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PutFileFormat(IAAFEssenceFormat*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCodecName(aafUInt32, aafCharacter*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCodecID(aafCodecID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CompleteWrite() override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEssenceDataEx> : public IAAFEssenceDataEx {
public:
    HRESULT Initialize(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Write(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Read(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT WriteSampleIndex(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ReadSampleIndex(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetSampleIndexPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleIndexPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleIndexSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileMob(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMob(IAAFSourceMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMobID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEssenceFormat> : public IAAFEssenceFormat {
public:
    HRESULT AddFormatSpecifier(aafUID_constref, aafInt32, aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFormatSpecifier(aafUID_constref, aafInt32, aafDataBuffer_t, aafInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT NumFormatSpecifiers(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIndexedFormatSpecifier(aafInt32, aafUID_t*, aafInt32, aafDataBuffer_t,
                                      aafInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEssenceMultiAccess> : public IAAFEssenceMultiAccess {
public:
    HRESULT WriteMultiSamples(aafUInt16, aafmMultiXfer_t*, aafmMultiResult_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ReadMultiSamples(aafUInt16, aafmMultiXfer_t*, aafmMultiResult_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFKLVEssenceDataParameters> : public IAAFKLVEssenceDataParameters {
public:
    HRESULT GetEssenceElementKey(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEssenceElementKey(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFKLVStreamParameters> : public IAAFKLVStreamParameters {
public:
    HRESULT GetEssenceElementKey(IAAFPropertyValue*, aafUID_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetEssenceElementKey(IAAFPropertyValue*, aafUID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPlainEssenceData> : public IAAFPlainEssenceData {
public:
    HRESULT Initialize(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Write(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Read(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT WriteSampleIndex(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ReadSampleIndex(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetSampleIndexPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleIndexPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleIndexSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileMob(IAAFSourceMob*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMob(IAAFSourceMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileMobID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPlainStreamData> : public IAAFPlainStreamData {
public:
    HRESULT GetSize(IAAFPropertyValue*, aafInt64*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSize(IAAFPropertyValue*, aafInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(IAAFPropertyValue*, aafInt64*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(IAAFPropertyValue*, aafInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Read(IAAFPropertyValue*, aafUInt32, aafMemPtr_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Write(IAAFPropertyValue*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Append(IAAFPropertyValue*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT HasStoredByteOrder(IAAFPropertyValue*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetStoredByteOrder(IAAFPropertyValue*, eAAFByteOrder_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetStoredByteOrder(IAAFPropertyValue*, eAAFByteOrder_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ClearStoredByteOrder(IAAFPropertyValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT ReadElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t,
                         aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT WriteElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFStreamAccess> : public IAAFStreamAccess {
public:
    HRESULT WriteStream(IAAFPropertyValue*, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
