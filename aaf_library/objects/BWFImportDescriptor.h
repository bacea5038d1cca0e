// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/objects/PhysicalDescriptors.h"
#include "aaf_library/objects/StreamAccess.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "not_implemented/AAFObjects.h"
#include "not_implemented/AAFSoundDescriptors.h"

namespace aaf {

// A piece of a broadcast wave file that its importer did not understand.
class RIFFChunk : public Implements<Object, IAAFRIFFChunk> {
public:
    // Makes an empty chunk, also of one that held something.
    HRESULT Initialize(aafUInt32 chunkID) override {
        RemoveValue(prop::RIFFChunk_ChunkData);
        RequireValue(prop::RIFFChunk_ChunkData);
        PutInteger(prop::RIFFChunk_ChunkLength, 0);
        return SetChunkID(chunkID);
    }
    HRESULT SetChunkID(aafUInt32 chunkID) override {
        return PutInteger(prop::RIFFChunk_ChunkID, chunkID);
    }
    HRESULT GetChunkID(aafUInt32* chunkID) override {
        return ReadInteger(prop::RIFFChunk_ChunkID, chunkID);
    }

    // What the chunk holds behind its head. Its length follows what is written.
    HRESULT Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) override {
        return ReadStream(*this, Required(*this, prop::RIFFChunk_ChunkData), bytes, buffer,
                          bytesRead);
    }
    HRESULT Write(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesWritten) override {
        const HRESULT result =
            WriteStream(*this, prop::RIFFChunk_ChunkData, bytes, buffer, bytesWritten);
        aafLength_t length = 0;
        ReadStreamSize(*this, prop::RIFFChunk_ChunkData, &length);
        return result < 0 ? result : PutInteger(prop::RIFFChunk_ChunkLength, length);
    }
    HRESULT SetPosition(aafPosition_t offset) override {
        return SetStreamPosition(*this, Required(*this, prop::RIFFChunk_ChunkData), offset);
    }
    HRESULT GetPosition(aafPosition_t* offset) override {
        return ReadStreamPosition(*this, Required(*this, prop::RIFFChunk_ChunkData), offset);
    }
    HRESULT GetLength(aafLength_t* length) override {
        return ReadInteger(prop::RIFFChunk_ChunkLength, length);
    }
};

// Sound imported from a broadcast wave file, with the notes of that file.
class BWFImportDescriptor : public Implements<ImportDescriptor, IAAFBWFImportDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetFileSecurityReport(aafUInt32 report) override {
        return PutInteger(prop::BWFImportDescriptor_QltyFileSecurityReport, report);
    }
    HRESULT GetFileSecurityReport(aafUInt32* report) override {
        return ReadInteger(prop::BWFImportDescriptor_QltyFileSecurityReport, report);
    }
    HRESULT SetFileSecurityWave(aafUInt32 wave) override {
        return PutInteger(prop::BWFImportDescriptor_QltyFileSecurityWave, wave);
    }
    HRESULT GetFileSecurityWave(aafUInt32* wave) override {
        return ReadInteger(prop::BWFImportDescriptor_QltyFileSecurityWave, wave);
    }

    HRESULT CountUnknownBWFChunks(aafUInt32* numData) override {
        return ReadCount(prop::BWFImportDescriptor_UnknownBWFChunks, numData);
    }
    HRESULT AppendUnknownBWFChunk(IAAFRIFFChunk* data) override {
        return AppendObject(prop::BWFImportDescriptor_UnknownBWFChunks, data);
    }
    HRESULT PrependUnknownBWFChunk(IAAFRIFFChunk* data) override {
        return PrependObject(prop::BWFImportDescriptor_UnknownBWFChunks, data);
    }
    HRESULT InsertUnknownBWFChunkAt(aafUInt32 index, IAAFRIFFChunk* data) override {
        return InsertObjectAt(prop::BWFImportDescriptor_UnknownBWFChunks, index, data);
    }
    HRESULT GetUnknownBWFChunkAt(aafUInt32 index, IAAFRIFFChunk** data) override {
        return ReadObjectAt(prop::BWFImportDescriptor_UnknownBWFChunks, index, data);
    }
    HRESULT RemoveUnknownBWFChunkAt(aafUInt32 index) override {
        return RemoveObjectAt(prop::BWFImportDescriptor_UnknownBWFChunks, index);
    }
    HRESULT GetUnknownBWFChunks(IEnumAAFRIFFChunks** enumerator) override {
        return MakeEnumerator<IAAFRIFFChunk>(this, prop::BWFImportDescriptor_UnknownBWFChunks,
                                             enumerator);
    }

    HRESULT SetCodingHistory(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_BextCodingHistory, text);
    }
    HRESULT GetCodingHistory(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_BextCodingHistory, text, bufSize);
    }
    HRESULT GetCodingHistoryBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_BextCodingHistory, bufSize);
    }
    HRESULT SetBasicData(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_QltyBasicData, text);
    }
    HRESULT GetBasicData(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_QltyBasicData, text, bufSize);
    }
    HRESULT GetBasicDataBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_QltyBasicData, bufSize);
    }
    HRESULT SetStartOfModulation(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_QltyStartOfModulation, text);
    }
    HRESULT GetStartOfModulation(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_QltyStartOfModulation, text, bufSize);
    }
    HRESULT GetStartOfModulationBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_QltyStartOfModulation, bufSize);
    }
    HRESULT SetQualityEvent(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_QltyQualityEvent, text);
    }
    HRESULT GetQualityEvent(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_QltyQualityEvent, text, bufSize);
    }
    HRESULT GetQualityEventBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_QltyQualityEvent, bufSize);
    }
    HRESULT SetEndOfModulation(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_QltyEndOfModulation, text);
    }
    HRESULT GetEndOfModulation(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_QltyEndOfModulation, text, bufSize);
    }
    HRESULT GetEndOfModulationBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_QltyEndOfModulation, bufSize);
    }
    HRESULT SetQualityParameter(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_QltyQualityParameter, text);
    }
    HRESULT GetQualityParameter(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_QltyQualityParameter, text, bufSize);
    }
    HRESULT GetQualityParameterBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_QltyQualityParameter, bufSize);
    }
    HRESULT SetOperatorComment(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_QltyOperatorComment, text);
    }
    HRESULT GetOperatorComment(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_QltyOperatorComment, text, bufSize);
    }
    HRESULT GetOperatorCommentBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_QltyOperatorComment, bufSize);
    }
    HRESULT SetCueSheet(aafCharacter_constptr text) override {
        return PutString(prop::BWFImportDescriptor_QltyCueSheet, text);
    }
    HRESULT GetCueSheet(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::BWFImportDescriptor_QltyCueSheet, text, bufSize);
    }
    HRESULT GetCueSheetBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::BWFImportDescriptor_QltyCueSheet, bufSize);
    }
};

}  // namespace aaf
