// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Arrays.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/FileDescriptor.h"
#include "not_implemented/AAFDescriptors.h"
#include "not_implemented/AAFPictureDescriptors.h"
#include "not_implemented/AAFSoundDescriptors.h"

// File descriptors of formats that keep their own header beside the essence,
// and of data essence. This system only reads and copies them.

namespace aaf {

class AIFCDescriptor : public Implements<FileDescriptor, IAAFAIFCDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) override {
        return ReadArray(*this, prop::AIFCDescriptor_Summary, summary, size);
    }
    HRESULT GetSummaryBufferSize(aafUInt32* size) override {
        return ReadNativeSize(prop::AIFCDescriptor_Summary, size);
    }
    HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) override {
        return PutNative(prop::AIFCDescriptor_Summary, summary, size);
    }
};

class WAVEDescriptor : public Implements<FileDescriptor, IAAFWAVEDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) override {
        return ReadArray(*this, prop::WAVEDescriptor_Summary, summary, size);
    }
    HRESULT GetSummaryBufferSize(aafUInt32* size) override {
        return ReadNativeSize(prop::WAVEDescriptor_Summary, size);
    }
    HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) override {
        return PutNative(prop::WAVEDescriptor_Summary, summary, size);
    }
};

class TIFFDescriptor : public Implements<FileDescriptor, IAAFTIFFDescriptor> {
public:
    HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) override {
        return ReadArray(*this, prop::TIFFDescriptor_Summary, summary, size);
    }
    HRESULT GetSummaryBufferSize(aafUInt32* size) override {
        return ReadNativeSize(prop::TIFFDescriptor_Summary, size);
    }
    HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) override {
        return PutNative(prop::TIFFDescriptor_Summary, summary, size);
    }
    HRESULT SetIsUniform(aafBoolean_t uniform) override {
        return PutBoolean(prop::TIFFDescriptor_IsUniform, uniform);
    }
    HRESULT GetIsUniform(aafBoolean_t* uniform) override {
        return ReadInteger(prop::TIFFDescriptor_IsUniform, uniform);
    }
    HRESULT SetIsContiguous(aafBoolean_t contiguous) override {
        return PutBoolean(prop::TIFFDescriptor_IsContiguous, contiguous);
    }
    HRESULT GetIsContiguous(aafBoolean_t* contiguous) override {
        return ReadInteger(prop::TIFFDescriptor_IsContiguous, contiguous);
    }
    HRESULT SetLeadingLines(aafInt32 lines) override {
        return PutInteger(prop::TIFFDescriptor_LeadingLines, lines);
    }
    HRESULT GetLeadingLines(aafInt32* lines) override {
        return ReadInteger(prop::TIFFDescriptor_LeadingLines, lines);
    }
    HRESULT SetTrailingLines(aafInt32 lines) override {
        return PutInteger(prop::TIFFDescriptor_TrailingLines, lines);
    }
    HRESULT GetTrailingLines(aafInt32* lines) override {
        return ReadInteger(prop::TIFFDescriptor_TrailingLines, lines);
    }
    HRESULT SetJPEGTableID(aafJPEGTableID_t table) override {
        return PutInteger(prop::TIFFDescriptor_JPEGTableID, table);
    }
    HRESULT GetJPEGTableID(aafJPEGTableID_t* table) override {
        return ReadInteger(prop::TIFFDescriptor_JPEGTableID, table);
    }
};

class DataEssenceDescriptor : public Implements<FileDescriptor, IAAFDataEssenceDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetDataEssenceCoding(aafUID_constref coding) override {
        return PutStruct(prop::DataEssenceDescriptor_DataEssenceCoding, coding);
    }
    HRESULT GetDataEssenceCoding(aafUID_t* coding) override {
        return ReadStruct(prop::DataEssenceDescriptor_DataEssenceCoding, coding);
    }
};

}  // namespace aaf
