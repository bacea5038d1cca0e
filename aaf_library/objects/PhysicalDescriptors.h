// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/EssenceDescriptor.h"
#include "not_implemented/AAFDescriptors.h"

// Essence that is not, or no longer, in a file of this kind: where a file mob's
// essence came from.

namespace aaf {

class PhysicalDescriptor : public Implements<EssenceDescriptor, IAAFPhysicalDescriptor> {};

// Essence imported from a file of some other kind, told by its locators.
class ImportDescriptor : public Implements<PhysicalDescriptor, IAAFImportDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
};

class RecordingDescriptor : public Implements<PhysicalDescriptor, IAAFRecordingDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
};

class AuxiliaryDescriptor : public Implements<PhysicalDescriptor, IAAFAuxiliaryDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetMimeType(aafCharacter_constptr mimeType) override {
        return PutString(prop::AuxiliaryDescriptor_MimeType, mimeType);
    }
    HRESULT GetMimeType(aafCharacter* mimeType, aafUInt32 bufSize) override {
        return ReadString(prop::AuxiliaryDescriptor_MimeType, mimeType, bufSize);
    }
    HRESULT GetMimeTypeBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::AuxiliaryDescriptor_MimeType, bufSize);
    }
    HRESULT SetCharSet(aafCharacter_constptr charSet) override {
        return PutString(prop::AuxiliaryDescriptor_CharSet, charSet);
    }
    HRESULT GetCharSet(aafCharacter* charSet, aafUInt32 bufSize) override {
        return ReadString(prop::AuxiliaryDescriptor_CharSet, charSet, bufSize);
    }
    HRESULT GetCharSetBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::AuxiliaryDescriptor_CharSet, bufSize);
    }
};

class TapeDescriptor : public Implements<EssenceDescriptor, IAAFTapeDescriptor> {
public:
    aafMobKind_t MobKind() const override { return kAAFTapeMob; }

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetTapeManufacturer(aafCharacter_constptr manufacturer) override {
        return PutString(prop::TapeDescriptor_ManufacturerID, manufacturer);
    }
    HRESULT GetTapeManufacturer(aafCharacter* manufacturer, aafUInt32 bufSize) override {
        return ReadString(prop::TapeDescriptor_ManufacturerID, manufacturer, bufSize);
    }
    HRESULT GetTapeManufacturerBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::TapeDescriptor_ManufacturerID, bufSize);
    }
    HRESULT SetTapeModel(aafCharacter_constptr model) override {
        return PutString(prop::TapeDescriptor_Model, model);
    }
    HRESULT GetTapeModel(aafCharacter* model, aafUInt32 bufSize) override {
        return ReadString(prop::TapeDescriptor_Model, model, bufSize);
    }
    HRESULT GetTapeModelBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::TapeDescriptor_Model, bufSize);
    }
    HRESULT SetTapeFormFactor(aafTapeCaseType_t formFactor) override {
        if (!(IsWithin(formFactor, 0, 7))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::TapeDescriptor_FormFactor, formFactor);
    }
    HRESULT GetTapeFormFactor(aafTapeCaseType_t* formFactor) override {
        return ReadInteger(prop::TapeDescriptor_FormFactor, formFactor);
    }
    HRESULT SetSignalType(aafVideoSignalType_t signal) override {
        if (!(IsWithin(signal, kAAFVideoSignalNull, kAAFSECAMSignal))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::TapeDescriptor_VideoSignal, signal);
    }
    HRESULT GetSignalType(aafVideoSignalType_t* signal) override {
        return ReadInteger(prop::TapeDescriptor_VideoSignal, signal);
    }
    HRESULT SetTapeFormat(aafTapeFormatType_t format) override {
        if (!(IsWithin(format, 0, 6))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::TapeDescriptor_TapeFormat, format);
    }
    HRESULT GetTapeFormat(aafTapeFormatType_t* format) override {
        return ReadInteger(prop::TapeDescriptor_TapeFormat, format);
    }
    HRESULT SetTapeLength(aafUInt32 length) override {
        return PutInteger(prop::TapeDescriptor_Length, length);
    }
    HRESULT GetTapeLength(aafUInt32* length) override {
        return ReadInteger(prop::TapeDescriptor_Length, length);
    }
};

class FilmDescriptor : public Implements<EssenceDescriptor, IAAFFilmDescriptor> {
public:
    aafMobKind_t MobKind() const override { return kAAFFilmMob; }

    HRESULT SetFilmManufacturer(aafCharacter_constptr manufacturer) override {
        return PutString(prop::FilmDescriptor_Manufacturer, manufacturer);
    }
    HRESULT GetFilmManufacturer(aafCharacter* manufacturer, aafUInt32 bufSize) override {
        return ReadString(prop::FilmDescriptor_Manufacturer, manufacturer, bufSize);
    }
    HRESULT GetFilmManufacturerBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::FilmDescriptor_Manufacturer, bufSize);
    }
    HRESULT SetFilmModel(aafCharacter_constptr model) override {
        return PutString(prop::FilmDescriptor_Model, model);
    }
    HRESULT GetFilmModel(aafCharacter* model, aafUInt32 bufSize) override {
        return ReadString(prop::FilmDescriptor_Model, model, bufSize);
    }
    HRESULT GetFilmModelBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::FilmDescriptor_Model, bufSize);
    }
    HRESULT SetFilmFormat(aafFilmType_t format) override {
        if (!(IsWithin(format, kAAFFtNull, kAAFFt65MM))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::FilmDescriptor_FilmFormat, format);
    }
    HRESULT GetFilmFormat(aafFilmType_t* format) override {
        return ReadInteger(prop::FilmDescriptor_FilmFormat, format);
    }
    HRESULT SetFrameRate(aafUInt32 rate) override {
        return PutInteger(prop::FilmDescriptor_FrameRate, rate);
    }
    HRESULT GetFrameRate(aafUInt32* rate) override {
        return ReadInteger(prop::FilmDescriptor_FrameRate, rate);
    }
    HRESULT SetPerfPerFrame(aafUInt8 perforations) override {
        return PutInteger(prop::FilmDescriptor_PerforationsPerFrame, perforations);
    }
    HRESULT GetPerfPerFrame(aafUInt8* perforations) override {
        return ReadInteger(prop::FilmDescriptor_PerforationsPerFrame, perforations);
    }
    HRESULT SetFilmAspectRatio(aafRational_t aspectRatio) override {
        return PutStruct(prop::FilmDescriptor_FilmAspectRatio, aspectRatio);
    }
    HRESULT GetFilmAspectRatio(aafRational_t* aspectRatio) override {
        return ReadStruct(prop::FilmDescriptor_FilmAspectRatio, aspectRatio);
    }
};

}  // namespace aaf
