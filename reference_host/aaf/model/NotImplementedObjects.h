// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFObjects.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFPropertyValue> : public IAAFPropertyValue {
public:
    HRESULT GetType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsDefinedType(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFObject> : public IAAFObject {
public:
    HRESULT GetGeneration(IAAFIdentification**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetGenerationAUID(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDefinition(IAAFClassDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetProperties(IEnumAAFProperties**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountProperties(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPropertyValue(IAAFPropertyDef*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPropertyValue(IAAFPropertyDef*, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsPropertyPresent(IAAFPropertyDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveOptionalProperty(IAAFPropertyDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateOptionalPropertyValue(IAAFPropertyDef*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDictionary(IAAFDictionary**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT EnableGenerationTracking() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT DisableGenerationTracking() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsGenerationTracked(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTaggedValue> : public IAAFTaggedValue {
public:
    HRESULT Initialize(aafCharacter_constptr, IAAFTypeDef*, aafUInt32, aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTypeDefinition(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetValue(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetValueBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetValue(aafUInt32, aafDataBuffer_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFTaggedValues> : public IEnumAAFTaggedValues {
public:
    HRESULT NextOne(IAAFTaggedValue**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFTaggedValue**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFTaggedValues**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFProperties> : public IEnumAAFProperties {
public:
    HRESULT NextOne(IAAFProperty**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFProperty**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFProperties**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFProperty> : public IAAFProperty {
public:
    HRESULT GetDefinition(IAAFPropertyDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetValue(IAAFPropertyValue**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFPropertyValues> : public IEnumAAFPropertyValues {
public:
    HRESULT NextOne(IAAFPropertyValue**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFPropertyValue**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFPropertyValues**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFKLVData> : public IEnumAAFKLVData {
public:
    HRESULT NextOne(IAAFKLVData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFKLVData**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFKLVData**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFKLVData> : public IAAFKLVData {
public:
    HRESULT Initialize(aafUID_t, aafUInt32, aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetKey(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetValue(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetValueBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetValue(aafUInt32, aafDataBuffer_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDescriptiveFramework> : public IAAFDescriptiveFramework {
protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDescriptiveObject> : public IAAFDescriptiveObject {
protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFRIFFChunk> : public IAAFRIFFChunk {
public:
    HRESULT Initialize(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetChunkID(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetChunkID(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Read(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Write(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLength(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFRIFFChunks> : public IEnumAAFRIFFChunks {
public:
    HRESULT NextOne(IAAFRIFFChunk**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFRIFFChunk**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFRIFFChunks**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
