// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/BinColumns.h"

#include <array>
#include <cstdio>

#include "host_interfaces/util/NMAStringUtils.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

constexpr ncfUInt32 kFormatAAC = 0x61616320u;  // 'aac '

constexpr char kUnknownCompression[20] = "Unknown Compression";
using UnknownName = std::array<aafCharacter, sizeof(kUnknownCompression) / 2 + 1>;

// The cell of a codec without a name. Hosts have always seen the letters of
// the literal taken two by two as characters, low byte first, so that is the
// value; it is the same on every platform, whatever a wide character's size.
UnknownName MakeUnknownName() {
    UnknownName name{};
    for (std::size_t i = 0; i + 1 < name.size(); ++i) {
        const auto low = static_cast<unsigned char>(kUnknownCompression[2 * i]);
        const auto high = static_cast<unsigned char>(kUnknownCompression[2 * i + 1]);
        name[i] = static_cast<aafCharacter>(low | high << 8);
    }
    return name;
}

const char* AudioFormatName(ncfUInt32 formatID) {
    switch (formatID) {
        case kFormatAAC:
            return "AAC";
        case kFormatLPCM:
            return "LPCM";
        default:
            return "QT-NMA Audio";
    }
}

}  // namespace

NCFRESULT AddBinColumnEntry(IAAFSmartPointer<IAAFMob> pMobMasterMob,
                            NCFSmartPtr<INCFConsole> pConsole, const aafCharacter* pBinColumnEntry,
                            const aafCharacter* pBinColumnValue) {
    NCF_FUNCTION("NMA::Impl::AddBinColumnEntry");
    CHK_INARG(pMobMasterMob);
    CHK_INARG(pBinColumnEntry);
    CHK_INARG(pBinColumnValue);
    // The published operation takes the name as writable text but only reads it.
    if (pMobMasterMob->AppendComment(const_cast<aafCharacter*>(pBinColumnEntry), pBinColumnValue) !=
        0) {
        const NMAString entry = NMAStringUtils::CreateWCharNMAString(pBinColumnEntry, -1);
        const NMAString value = NMAStringUtils::CreateWCharNMAString(pBinColumnValue, -1);
        pConsole->Write(2, "AppendComment failed for %s with value %s.\n", entry.GetUTF8String(),
                        value.GetUTF8String());
        return NCF_E_FAIL;
    }
    return NCF_OK;
}

void AddAspectRatioBinColumnEntry(IAAFSmartPointer<IAAFMob> pMobMasterMob,
                                  NCFSmartPtr<INCFConsole> pConsole, AAFInfo& aafInfo,
                                  ncfUInt32 numerator, ncfUInt32 denominator,
                                  aafRational_t& aspectRatioOut) {
    NCF_FUNCTION("NMA::Impl::AddAspectRatioBinColumnEntry");
    aafInfo.aspectNumerator = numerator;
    aafInfo.aspectDenominator = denominator;
    if (aafInfo.swapAspectRatio) {
        std::swap(aafInfo.aspectNumerator, aafInfo.aspectDenominator);
    }
    aspectRatioOut = {(aafInt32)aafInfo.aspectNumerator, (aafInt32)aafInfo.aspectDenominator};

    char text[32];
    std::snprintf(text, sizeof(text), "%d:%d", (int)aafInfo.aspectNumerator,
                  (int)aafInfo.aspectDenominator);
    const NMAString arStr(text);
    const aafCharacter iar[] = L"Image Aspect Ratio";
    NCF_SKIP(AddBinColumnEntry(pMobMasterMob, pConsole, &iar[0],
                               (aafCharacter *) arStr.GetWCHARString()));
}

NCFRESULT AddVideoBinColumnEntry(std::tr1::shared_ptr<BaseClip> media,
                                 IAAFSmartPointer<IAAFMob> pMobMasterMob,
                                 NCFSmartPtr<INCFConsole> pConsole) {
    NCF_FUNCTION("NMA::Impl::AddVideoBinColumnEntry");
    ncfUInt32 codecType = 0;
    NCF_RETURN(media->GetDataFormat(&codecType));
    NCFSmartPtr<INCFString> codecName;
    if (media->GetCodecName(codecType, codecName) < 0) {
        slog::Error(ncfFunction) << "Appropriate QuickTime decompressor wasn't found!";
        pConsole->Write(1, "Appropriate QuickTime decompressor wasn't found!\n");
        return NCF_E_FAIL;
    }
    const aafCharacter vff[] = L"Video";
    if (codecName->IsEmpty()) {
        const UnknownName name = MakeUnknownName();
        const aafCharacter* const unknown_name = name.data();
        NCF_SKIP(AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0],(aafCharacter *)unknown_name));
        return NCF_OK;
    }

    NCF_RETURN(codecName->ConvertTo(kNCFWCHAR));
    ncfWCHAR* p_buffer = nullptr;
    NCF_RETURN(codecName->GetRawWCHAR(&p_buffer));
    const ncfWCHAR badSeed[] = L"Apple";
    ncfSInt32 findIndex = -1;
    NCF_RETURN(codecName->FindWCHAR(badSeed,5,0,&findIndex));
    if (findIndex < 0) {
        NCF_SKIP(AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0],(aafCharacter *) p_buffer));
        return NCF_OK;
    }
    // All up to the word and the character behind it is cut; a name that ends
    // with the word leaves nothing.
    const ncfUInt32 start = 6 + (ncfUInt32)findIndex;
    const aafCharacter* const cell = start <= codecName->GetLength() ? p_buffer + start : L"";
    NCF_SKIP_TEXT(
        "AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0],(aafCharacter "
        "*)(&p_buffer[6+findIndex]))",
        AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0], cell));
    return NCF_OK;
}

void AddAudioFormatBinColumnEntry(IAAFSmartPointer<IAAFMob> pMobMasterMob,
                                  NCFSmartPtr<INCFConsole> pConsole, ncfUInt32 formatID) {
    NCF_FUNCTION("NMA::Impl::AddAudioFormatBinColumnEntry");
    const NMAString arStr(AudioFormatName(formatID));
    const aafCharacter aff[] = L"Audio Format";
    NCF_SKIP(AddBinColumnEntry(pMobMasterMob, pConsole, &aff[0],
                               (aafCharacter *) arStr.GetWCHARString()));
}

}  // namespace NMA::Impl
