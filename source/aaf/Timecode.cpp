// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A timecode slot holds a sequence:
//
//   TC1:     [ timecode                                        ]
//   AuxTCn:  [ filler startTime | timecode movieLength | filler ]  = maxLength

#include "source/aaf/Timecode.h"

#include <string>

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "source/aaf/AAFDefs.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/PluginLogger.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

constexpr char kSourceName[] = "QuickTimeToAAF";

// What is thrown when the AAF library answers anything but 0: `code`, after the library's
// own result and the line of the call went to the process logger.
void Require(HRESULT hr, NCFRESULT code, const char* message, int line = __builtin_LINE()) {
    if (hr != 0) {
        PluginLogger().Write(1, "%s, AAFResult = 0x%x, %s(%d)", message, static_cast<unsigned>(hr),
                             kSourceName, line);
        throw code;
    }
}

// The sequence of a slot in the making. Its steps throw their failures.
class TimecodeSequence {
public:
    explicit TimecodeSequence(const IAAFSmartPointer<IAAFDictionary>& pDictionary)
        : defs_(pDictionary) {
        Require(defs_.cdSequence()->CreateInstance(IID_IAAFSequence, (IUnknown**)&sequence_),
                NMA_E_AAF_CREATE, "Unable to create a new sequence");
        Require(sequence_->Initialize(defs_.ddTimecode()), NCF_E_FAIL,
                "Unable to initialize the sequence");
    }

    void AppendTimecode(aafTimecode_t timecode, aafLength_t length);
    void PrependFiller(aafLength_t length) {
        Require(sequence_->PrependComponent(MakeFiller(length)), NMA_E_AAF_ADD,
                "Unable to add the component");
    }
    void AppendFiller(aafLength_t length) {
        Require(sequence_->AppendComponent(MakeFiller(length)), NMA_E_AAF_ADD,
                "Unable to add the component");
    }
    void AddToMob(IAAFMob& mob, const aafRational_t& rate, const aafCharacter* label,
                  aafSlotID_t id, aafUInt32 physicalNumber);

private:
    IAAFSmartPointer<IAAFComponent> MakeFiller(aafLength_t length);

    AAFDefs defs_;
    IAAFSmartPointer<IAAFSequence> sequence_;
};

void TimecodeSequence::AppendTimecode(aafTimecode_t timecode, aafLength_t length) {
    IAAFSmartPointer<IAAFComponent> pComponent;
    Require(defs_.cdTimecode()->CreateInstance(IID_IAAFComponent, (IUnknown**)&pComponent),
            NMA_E_AAF_CREATE, "Unable to create a new component");
    IAAFSmartPointer<IAAFTimecode> pTimecode;
    Require(pComponent->QueryInterface(IID_IAAFTimecode, (void**)&pTimecode), NMA_E_AAF_QUERY,
            "Unable to query timecode");
    Require(pTimecode->Initialize(0, &timecode), NCF_E_FAIL,
            "Unable to initialize the timecode component");
    Require(pComponent->SetDataDef(defs_.ddTimecode()), NMA_E_AAF_ADD,
            "Unable to set the component type");
    Require(pComponent->SetLength(length), NMA_E_AAF_ADD, "Unable to set the timecode length");
    Require(sequence_->AppendComponent(pComponent), NMA_E_AAF_ADD, "Unable to add the component");
}

IAAFSmartPointer<IAAFComponent> TimecodeSequence::MakeFiller(aafLength_t length) {
    IAAFSmartPointer<IAAFFiller> pFiller;
    Require(defs_.cdFiller()->CreateInstance(IID_IAAFFiller, (IUnknown**)&pFiller),
            NMA_E_AAF_CREATE, "Unable to create a new filler");
    Require(pFiller->Initialize(defs_.ddTimecode(), length), NCF_E_FAIL,
            "Unable to initialize the filler");
    IAAFSmartPointer<IAAFComponent> pComponent;
    Require(pFiller->QueryInterface(IID_IAAFComponent, (void**)&pComponent), NMA_E_AAF_QUERY,
            "Unable to query component");
    return pComponent;
}

void TimecodeSequence::AddToMob(IAAFMob& mob, const aafRational_t& rate, const aafCharacter* label,
                                aafSlotID_t id, aafUInt32 physicalNumber) {
    IAAFSmartPointer<IAAFSegment> pSegment;
    Require(sequence_->QueryInterface(IID_IAAFSegment, (void**)&pSegment), NMA_E_AAF_QUERY,
            "Unable to query the sequence");
    IAAFSmartPointer<IAAFTimelineMobSlot> pTimelineSlot;
    Require(mob.AppendNewTimelineSlot(rate, pSegment, id, label, 0, &pTimelineSlot), NMA_E_AAF_ADD,
            "Unable to add the timecode");
    IAAFSmartPointer<IAAFMobSlot> pSlot;
    Require(mob.LookupSlot(id, &pSlot), NMA_E_AAF_ADD, "Unable to lookup slot");
    pSlot->SetPhysicalNum(physicalNumber);
}

}  // namespace

NCFRESULT AddTimecode(IAAFSmartPointer<IAAFDictionary> pDictionary,
                      const aafRational_t& movieEditRate, const aafCharacter* trackLabel,
                      IAAFSmartPointer<IAAFMob> pMobSourceMob, aafSlotID_t nSlotID,
                      aafLength_t movieLength, aafLength_t maxLength, aafLength_t startTime,
                      const aafTimecode_t& timecode, ncfUInt32 timecodeTrackNum) {
    const bool isMain = timecodeTrackNum == 0;
    try {
        TimecodeSequence sequence(pDictionary);
        sequence.AppendTimecode(timecode, movieLength);
        if (!isMain) {
            sequence.PrependFiller(startTime);
            // Negative for a clip longer than a day: the library refuses it.
            sequence.AppendFiller(static_cast<aafLength_t>(static_cast<ncfUInt64>(maxLength) -
                                                           static_cast<ncfUInt64>(movieLength) -
                                                           static_cast<ncfUInt64>(startTime)));
        }
        // The host knows the main timecode by 1 and auxiliary ones from 3 on.
        sequence.AddToMob(*pMobSourceMob.operator->(), movieEditRate, trackLabel, nSlotID,
                          isMain ? 1 : timecodeTrackNum + 2);
        return NCF_OK;
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
    return ResultOf([&]() -> NCFRESULT {
        aafMobID_t sourceMobID{};
        ThrowIfFailed(pMobSourceMob->GetMobID(&sourceMobID));
        const std::wstring label =
            tcTrackNum == 0 ? L"TC1"
                            : L"AuxTC" + std::to_wstring(static_cast<ncfSInt32>(tcTrackNum));
        NCF_RETURN_TEXT(
            "AddTimecode( pDictionary, movieEditRate, trackLabel, pMobSourceMob, nSlotID, "
            "movieLength, maxLength, startTime, timecode, timecodeTrackNum)",
            AddTimecode(pDictionary, aafEditRate, label.c_str(), pMobSourceMob, slotIndex + 1,
                        movieLength, maxLength, startTime, timecode, tcTrackNum));
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
