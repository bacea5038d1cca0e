// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"

#include <atomic>
#include <mutex>
#include <sstream>
#include <string>

#include "source/descriptor_data/AAFInfoFields.h"
#include "source/descriptor_data/DataRecord.h"
#include "source/descriptor_data/ParseAAFInfoXML.h"
#include "source/plugin/FourCharText.h"
#include "source/plugin/PluginFolder.h"
#include "source/plugin/ResultChecks.h"

namespace {

constexpr char kGetInfo[] = "QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription";
constexpr ncfUInt32 kSeparateFields = 1;

// The object outlives the run-time's own clearing up: only ShutDownInfoRetriever
// deletes it. The generation counts objects, so that what a thread remembers of
// an earlier one is not taken for the present one's.
std::atomic<QuickTimeToAAFInfoRetriever*> retriever{nullptr};
std::atomic<ncfUInt32> generation{0};

// Kind of the record that a thread read last.
struct RecordKind {
    ncfUInt32 generation = 0;
    bool isMPEG = false;
    bool isRGBA = false;
};

RecordKind& LastRecord() {
    thread_local RecordKind kind;
    const ncfUInt32 current = generation.load(std::memory_order_relaxed);
    if (kind.generation != current) {
        kind = {current, false, false};
    }
    return kind;
}

// The text lies in the module's folder, which ends in a separator.
NMAString InPluginFolder(const char* fileName) {
    std::string path = NMAString(GetPluginFolder(), kNCFUTF8).GetUTF8String();
    path += fileName;
    return NMAString(path.c_str());
}

// The bytes of a code the other way round: first character first in memory.
ncfUInt32 InTextOrder(ncfUInt32 code) {
    ncfUInt32 word = 0;
    auto* const bytes = reinterpret_cast<unsigned char*>(&word);
    for (int i = 0; i < 4; ++i) {
        bytes[i] = static_cast<unsigned char>(code >> (24 - 8 * i));
    }
    return word;
}

}  // namespace

NCFRESULT QuickTimeToAAFInfoRetriever::Init(NCFSmartPtr<INCFConsole> pConsole,
                                            NCFSmartPtr<INCFComponentFactory> pComponentFactory,
                                            const char* fourCharXML, const char* AAFInfoXML) {
    static std::mutex mutex;
    const std::lock_guard<std::mutex> guard(mutex);
    if (GetInstance()) {
        return NCF_OK;
    }
    try {
        auto* const made = new QuickTimeToAAFInfoRetriever(pConsole, pComponentFactory.inArg(),
                                                           InPluginFolder(fourCharXML),
                                                           InPluginFolder(AAFInfoXML));
        generation.fetch_add(1, std::memory_order_relaxed);
        retriever.store(made, std::memory_order_release);
        return NCF_OK;
    } catch (...) {
        if (pConsole) {
            pConsole->Write(1, "Unable to init QuickTimeToAAFInfoRetriever.\n");
        }
        return NCF_E_UNEXPECTED;
    }
}

QuickTimeToAAFInfoRetriever* QuickTimeToAAFInfoRetriever::GetInstance() {
    return retriever.load(std::memory_order_acquire);
}

void ShutDownInfoRetriever() {
    delete retriever.exchange(nullptr);
}

QuickTimeToAAFInfoRetriever::QuickTimeToAAFInfoRetriever(const NCFSmartPtr<INCFConsole>& pConsole,
                                                         INCFComponentFactory* pComponentFactory,
                                                         const NMAString& fourCharPath,
                                                         const NMAString& aafInfoPath)
    : m_factory(pComponentFactory),
      m_fourCharReader(pComponentFactory, fourCharPath),
      m_console(pConsole) {
    ParseAAFInfoXML(m_factory, &m_dataContainer, aafInfoPath);
}

bool QuickTimeToAAFInfoRetriever::IsMPEGDescriptor() const {
    const bool isMPEG = LastRecord().isMPEG;
    if (isMPEG) {
        slog::Progress("QuickTimeToAAFInfoRetriever::IsMPEGDescriptor") << " : true!";
    }
    return isMPEG;
}

bool QuickTimeToAAFInfoRetriever::IsRGBADescriptor() const {
    const bool isRGBA = LastRecord().isRGBA;
    if (isRGBA) {
        slog::Progress("QuickTimeToAAFInfoRetriever::IsRGBADescriptor") << " : true!";
    }
    return isRGBA;
}

NCFRESULT QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription(const DescribedPicture* media,
                                                                   AAFInfo* aafInfo,
                                                                   ncfUInt32* vcid) {
    NCF_FUNCTION("QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription");
    CHK_INARG(media);
    CHK_INARG(vcid);
    ncfUInt32 fourCC = 0;
    ncfUInt32 vendor = 0;
    NCF_RETURN(media->GetDataFormat(&fourCC));
    NCF_RETURN(media->GetVendor(&vendor));

    AAFInfo thrownAway;
    if (!aafInfo) {
        aafInfo = &thrownAway;
    }
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    NCF_RETURN_TEXT("const_cast<BaseClip*>(media)->GetEncodedWidthAndHeight(&width, &height)",
                    media->GetEncodedWidthAndHeight(&width, &height));
    const NCFRESULT layoutResult = media->GetNMAFrameLayout(&aafInfo->frameLayout);
    if (layoutResult != NCF_OK && layoutResult != NCF_E_PARAMETERNOTAVAILABLE) {
        return layoutResult;
    }
    if (aafInfo->frameLayout == kSeparateFields) {
        height /= 2;
    }
    Rational movieEditRate;
    NCF_RETURN(media->GetEditRate(&movieEditRate));

    *vcid = 0;
    const auto layout = static_cast<ncfUInt8>(aafInfo->frameLayout);
    const NCFRESULT mapped = m_fourCharReader.GetVCID(
        InTextOrder(fourCC), width, height, &movieEditRate, &layout, InTextOrder(vendor), vcid);
    if (mapped == NCF_E_NOTSUPPORTED) {
        ReportUnknownCode(fourCC);
        return mapped;
    }
    if (*vcid == 0) {
        NCF_RETURN_TEXT("media->GetNivoResolution(&vcid)", media->GetNivoResolution(vcid));
    }
    if (mapped != NCF_OK && mapped != NCF_E_PARAMETERNOTAVAILABLE) {
        return NCF_OK;
    }
    return FillInfo({*vcid, movieEditRate, width, height}, *aafInfo);
}

NCFRESULT QuickTimeToAAFInfoRetriever::FillInfo(const Query& query, AAFInfo& aafInfo) {
    const char* failedCall = nullptr;
    const NCFRESULT result = ReadRecord(query, aafInfo, &failedCall);
    if (failedCall) {
        if (result == NCF_E_NOTSUPPORTED && failedCall == kContainerLabelGetter) {
            ReportUnknownId(query);
        }
        DataRecord(kDataNotice, kGetInfo)
            << "GetInfoFromImageDescription failed, Error of: " << HexResult{result}
            << " on call to: " << failedCall << "\n";
    }
    return result;
}

// A record that is not there, and one of another kind than its descriptor says,
// fail without a failed call.
NCFRESULT QuickTimeToAAFInfoRetriever::ReadRecord(const Query& query, AAFInfo& aafInfo,
                                                  const char** failedCall) {
    NCF_FUNCTION("QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription");
    AAFInfoDataContainerReader2 m_aafInfoReader(&m_dataContainer, query.vcid, query.editRate,
                                                query.width, query.height);
    bool isRGBADescr = false;
    NCF_RETURN(m_aafInfoReader.IsDescriptorRGBA(&isRGBADescr));
    if (isRGBADescr) {
        const NCFRESULT layout = m_aafInfoReader.GetPixelLayoutFromVCID(&aafInfo.pixelLayout);
        if (layout != NCF_OK) {
            *failedCall = "GetPixelLayoutFromVCID";
            return layout;
        }
    }
    LastRecord().isRGBA = isRGBADescr;
    const NCFRESULT picture = ReadPictureFields(m_aafInfoReader, isRGBADescr, aafInfo, failedCall);
    if (picture != NCF_OK) {
        return picture;
    }
    bool isMPEG2Descr = false;
    NCF_RETURN(m_aafInfoReader.IsDescriptorMPEG2(&isMPEG2Descr));
    LastRecord().isMPEG = isMPEG2Descr;
    return isMPEG2Descr ? ReadMPEG2Fields(m_aafInfoReader, aafInfo, failedCall) : NCF_OK;
}

void QuickTimeToAAFInfoRetriever::ReportUnknownCode(ncfUInt32 fourCC) {
    const std::string code = FourCharText(fourCC);
    DataRecord(kDataNotice, kGetInfo)
        << "The FOURCC video code of " << code.c_str() << " is not natively supported.";
    if (m_console) {
        m_console->Write(2, "The FOURCC video code of %s is not natively supported.\n",
                         code.c_str());
    }
}

void QuickTimeToAAFInfoRetriever::ReportUnknownId(const Query& query) {
    std::ostringstream text;
    text << "A video compression id of " << query.vcid << " with an edit rate of "
         << query.editRate.numerator << "/" << query.editRate.denominator << "\n"
         << " and a height of " << query.height << " was not found in the AAFInfo.xml\n";
    DataRecord(kDataNotice, kGetInfo) << text.str().c_str();
    if (m_console) {
        m_console->Write(2, "%s", text.str().c_str());
    }
}
