// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A timecode slot holds a sequence:
//
//   TC1:     [ timecode                                        ]
//   AuxTCn:  [ filler startTime | timecode movieLength | filler ]  = maxLength

#include "source/aaf/Timecode.h"

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "source/aaf/AAFDefs.h"
#include "source/aaf/AAFGuard.h"
#include "source/aaf/AAFTrack.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/PluginLogger.h"
#include "source/plugin/ResultChecks.h"

// Calls the AAF library; anything but 0 is a failure, told to the process
// logger with the library's own result and returned as `code`.
#define TIMECODE_STEP(code, message, ...)                                           \
    do {                                                                            \
        if (const HRESULT hr = (__VA_ARGS__); hr != 0) {                            \
            PluginLogger().Write(1, message ", AAFResult = 0x%x, %s(%d)",           \
                                 static_cast<unsigned>(hr), kSourceName, __LINE__); \
            return code;                                                            \
        }                                                                           \
    } while (false)

namespace NMA::Impl {
namespace {

constexpr char kSourceName[] = "QuickTimeToAAF";

// The slot in the making.
struct TimecodeSequence {
    AAFDefs defs;
    IAAFSmartPointer<IAAFSequence> pSequence;

    NCFRESULT Start();
    NCFRESULT AppendTimecode(const aafTimecode_t& timecode, aafLength_t movieLength);
    NCFRESULT MakeFiller(aafLength_t length, IAAFSmartPointer<IAAFComponent>& pFillerComponent);
    NCFRESULT PrependFiller(aafLength_t length);
    NCFRESULT AppendFiller(aafLength_t length);
};

NCFRESULT TimecodeSequence::Start() {
    TIMECODE_STEP(NMA_E_AAF_CREATE, "Unable to create a new sequence",
                  defs.cdSequence()->CreateInstance(IID_IAAFSequence, (IUnknown**)&pSequence));
    TIMECODE_STEP(NCF_E_FAIL, "Unable to initialize the sequence",
                  pSequence->Initialize(defs.ddTimecode()));
    return NCF_OK;
}

NCFRESULT TimecodeSequence::AppendTimecode(const aafTimecode_t& timecode, aafLength_t movieLength) {
    IAAFSmartPointer<IAAFComponent> pComponent;
    TIMECODE_STEP(NMA_E_AAF_CREATE, "Unable to create a new component",
                  defs.cdTimecode()->CreateInstance(IID_IAAFComponent, (IUnknown**)&pComponent));
    IAAFSmartPointer<IAAFTimecode> pTimecode;
    TIMECODE_STEP(NMA_E_AAF_QUERY, "Unable to query timecode",
                  pComponent->QueryInterface(IID_IAAFTimecode, (void**)&pTimecode));
    aafTimecode_t start = timecode;
    TIMECODE_STEP(NCF_E_FAIL, "Unable to initialize the timecode component",
                  pTimecode->Initialize(0, &start));
    TIMECODE_STEP(NMA_E_AAF_ADD, "Unable to set the component type",
                  pComponent->SetDataDef(defs.ddTimecode()));
    TIMECODE_STEP(NMA_E_AAF_ADD, "Unable to set the timecode length",
                  pComponent->SetLength(movieLength));
    TIMECODE_STEP(NMA_E_AAF_ADD, "Unable to add the component",
                  pSequence->AppendComponent(pComponent));
    return NCF_OK;
}

NCFRESULT TimecodeSequence::MakeFiller(aafLength_t length,
                                       IAAFSmartPointer<IAAFComponent>& pFillerComponent) {
    IAAFSmartPointer<IAAFFiller> pFiller;
    TIMECODE_STEP(NMA_E_AAF_CREATE, "Unable to create a new filler",
                  defs.cdFiller()->CreateInstance(IID_IAAFFiller, (IUnknown**)&pFiller));
    TIMECODE_STEP(NCF_E_FAIL, "Unable to initialize the filler",
                  pFiller->Initialize(defs.ddTimecode(), length));
    TIMECODE_STEP(NMA_E_AAF_QUERY, "Unable to query component",
                  pFiller->QueryInterface(IID_IAAFComponent, (void**)&pFillerComponent));
    return NCF_OK;
}

NCFRESULT TimecodeSequence::PrependFiller(aafLength_t length) {
    IAAFSmartPointer<IAAFComponent> pFiller;
    const NCFRESULT made = MakeFiller(length, pFiller);
    if (made < 0) {
        return made;
    }
    TIMECODE_STEP(NMA_E_AAF_ADD, "Unable to add the component",
                  pSequence->PrependComponent(pFiller));
    return NCF_OK;
}

NCFRESULT TimecodeSequence::AppendFiller(aafLength_t length) {
    IAAFSmartPointer<IAAFComponent> pFiller;
    const NCFRESULT made = MakeFiller(length, pFiller);
    if (made < 0) {
        return made;
    }
    TIMECODE_STEP(NMA_E_AAF_ADD, "Unable to add the component",
                  pSequence->AppendComponent(pFiller));
    return NCF_OK;
}

NCFRESULT AddTimecodeSlot(TimecodeSequence& sequence, const aafRational_t& movieEditRate,
                          const aafCharacter* trackLabel, IAAFMob& mob, aafSlotID_t nSlotID,
                          ncfUInt32 timecodeTrackNum) {
    IAAFSmartPointer<IAAFSegment> pSegment;
    TIMECODE_STEP(NMA_E_AAF_QUERY, "Unable to query the sequence",
                  sequence.pSequence->QueryInterface(IID_IAAFSegment, (void**)&pSegment));
    IAAFSmartPointer<IAAFTimelineMobSlot> pTimelineSlot;
    TIMECODE_STEP(
        NMA_E_AAF_ADD, "Unable to add the timecode",
        mob.AppendNewTimelineSlot(movieEditRate, pSegment, nSlotID, trackLabel, 0, &pTimelineSlot));
    IAAFSmartPointer<IAAFMobSlot> pSlot;
    TIMECODE_STEP(NMA_E_AAF_ADD, "Unable to lookup slot", mob.LookupSlot(nSlotID, &pSlot));
    // The host knows the main timecode by 1 and auxiliary ones from 3 on.
    pSlot->SetPhysicalNum(timecodeTrackNum == 0 ? 1 : timecodeTrackNum + 2);
    return NCF_OK;
}

NCFRESULT MakeTimecodeSlot(const IAAFSmartPointer<IAAFDictionary>& pDictionary,
                           const aafRational_t& movieEditRate, const aafCharacter* trackLabel,
                           const IAAFSmartPointer<IAAFMob>& pMobSourceMob, aafSlotID_t nSlotID,
                           aafLength_t movieLength, aafLength_t maxLength, aafLength_t startTime,
                           const aafTimecode_t& timecode, ncfUInt32 timecodeTrackNum) {
    TimecodeSequence sequence{AAFDefs(pDictionary), {}};
    NCFRESULT result = sequence.Start();
    if (result == NCF_OK) {
        result = sequence.AppendTimecode(timecode, movieLength);
    }
    if (result == NCF_OK && timecodeTrackNum > 0) {
        result = sequence.PrependFiller(startTime);
        if (result == NCF_OK) {
            // Negative for a clip longer than a day: the library refuses it.
            result = sequence.AppendFiller(static_cast<aafLength_t>(
                static_cast<ncfUInt64>(maxLength) - static_cast<ncfUInt64>(movieLength) -
                static_cast<ncfUInt64>(startTime)));
        }
    }
    if (result != NCF_OK) {
        return result;
    }
    return AddTimecodeSlot(sequence, movieEditRate, trackLabel, *pMobSourceMob.operator->(),
                           nSlotID, timecodeTrackNum);
}

}  // namespace

NCFRESULT AddTimecode(IAAFSmartPointer<IAAFDictionary> pDictionary,
                      const aafRational_t& movieEditRate, const aafCharacter* trackLabel,
                      IAAFSmartPointer<IAAFMob> pMobSourceMob, aafSlotID_t nSlotID,
                      aafLength_t movieLength, aafLength_t maxLength, aafLength_t startTime,
                      const aafTimecode_t& timecode, ncfUInt32 timecodeTrackNum) {
    try {
        return MakeTimecodeSlot(pDictionary, movieEditRate, trackLabel, pMobSourceMob, nSlotID,
                                movieLength, maxLength, startTime, timecode, timecodeTrackNum);
    } catch (NCFRESULT result) {
        return result;
    } catch (...) {
        PluginLogger().Write(1, "Received an unknown exception, %s(%d)", kSourceName, __LINE__);
        slog::Error("NMA::Impl::AddTimecode") << "Received an unknown exception";
        return NCF_E_UNEXPECTED;
    }
}

NCFRESULT AddTimecodeAAFTrack(const aafTimecode_t& timecode, ncfUInt32 tcTrackNum,
                              ncfUInt32 slotIndex, const aafRational_t& aafEditRate,
                              const aafLength_t& movieLength, const aafLength_t& maxLength,
                              const aafLength_t& startTime,
                              IAAFSmartPointer<IAAFDictionary> pDictionary,
                              IAAFSmartPointer<IAAFMob> pMobSourceMob) {
    NCF_FUNCTION("NMA::Impl::AddTimecodeAAFTrack");
    return GuardAAF([&]() -> NCFRESULT {
        aafMobID_t sourceMobID{};
        ThrowIfFailed(pMobSourceMob->GetMobID(&sourceMobID));
        const aafSlotID_t nSlotID = slotIndex + 1;
        const std::wstring label =
            tcTrackNum == 0 ? L"TC1" : SlotLabel(L"AuxTC%d", tcTrackNum, 256);
        const aafCharacter* const trackLabel = label.c_str();
        const aafRational_t& movieEditRate = aafEditRate;
        const ncfUInt32 timecodeTrackNum = tcTrackNum;
        // clang-format off
        NCF_RETURN(AddTimecode( pDictionary, movieEditRate, trackLabel, pMobSourceMob, nSlotID, movieLength, maxLength, startTime, timecode, timecodeTrackNum));
        // clang-format on
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
