// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Stringout.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <cstring>
#include <limits>

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "reference_host/cliphost/AafClips.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/Digest.h"
#include "reference_host/cliphost/Failure.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

// Of editors' programs: a composition that is a sequence of its own, not a part of another.
constexpr aafUID_t kTopLevel = ncfGuid("0D010102-0101-0700-060E-2B3404010101");
constexpr aafFrameOffset_t kSecondsAtStart = 3600;

struct Part {
    aafSlotID_t slot;
    aafUID_t data;       // what the clip itself calls it
    aafLength_t frames;  // of the sequence
};

struct Clip {
    aafMobID_t id;
    std::vector<Part> pictures;
    std::vector<Part> sounds;

    aafLength_t Frames() const {
        aafLength_t most = 0;
        for (const auto* const parts : {&pictures, &sounds}) {
            for (const Part& part : *parts) {
                most = std::max(most, part.frames);
            }
        }
        // Sound that ends later than its picture is cut off with it.
        return pictures.empty() ? most : pictures.front().frames;
    }
};

// Whole frames of the sequence in a slot; 0 where it has no length.
aafLength_t FramesIn(IAAFMobSlot& slot, const aafRational_t& rate) {
    host::Ref<IAAFSegment> segment;
    aafRational_t own{};
    aafLength_t length = 0;
    const auto timeline = As<IAAFTimelineMobSlot>(&slot);
    if (!timeline || timeline->GetEditRate(&own) < 0 || slot.GetSegment(segment.Out()) < 0) {
        return 0;
    }
    const auto component = As<IAAFComponent>(segment.get());
    if (!component || component->GetLength(&length) < 0 || length <= 0 || own.numerator <= 0 ||
        own.denominator <= 0) {
        return 0;
    }
    __extension__ using Wide = __int128;  // 63 bits times two of 31
    const Wide frames =
        Wide{length} * own.denominator * rate.numerator / (Wide{own.numerator} * rate.denominator);
    constexpr aafLength_t kMost = std::numeric_limits<aafLength_t>::max() / 1'000'000;
    return static_cast<aafLength_t>(std::min<Wide>(std::max<Wide>(frames, 1), kMost));
}

Clip ClipOf(IAAFMob& mob, const aafRational_t& rate) {
    Clip clip{};
    mob.GetMobID(&clip.id);
    aafNumSlots_t count = 0;
    mob.CountSlots(&count);
    for (aafUInt32 i = 0; i < count; ++i) {
        host::Ref<IAAFMobSlot> slot;
        aafSlotID_t id = 0;
        if (mob.GetSlotAt(i, slot.Out()) < 0 || slot->GetSlotID(&id) < 0) {
            continue;
        }
        const SlotData data = DataOfSlot(*slot);
        const bool isPicture = data.kind == "picture";
        const aafLength_t frames = isPicture || data.kind == "sound" ? FramesIn(*slot, rate) : 0;
        if (frames > 0) {
            (isPicture ? clip.pictures : clip.sounds).push_back({id, data.id, frames});
        }
    }
    return clip;
}

// 24000/1001 and its like for 23.976, whole numbers, and thousandths for anything else.
aafRational_t RateOf(double rate) {
    const double nearest = std::round(rate);
    const double ntsc = std::round(rate * 1.001);
    if (std::fabs(rate - nearest) < 1e-6) {
        return {static_cast<aafInt32>(nearest), 1};
    }
    if (std::fabs(rate - ntsc / 1.001) < 0.002) {
        return {static_cast<aafInt32>(ntsc) * 1000, 1001};
    }
    return {static_cast<aafInt32>(std::round(rate * 1000)), 1000};
}

class Maker {
public:
    Maker(const AafLibrary& library, IAAFFile& file, const aafRational_t& rate)
        : library_(library), rate_(rate) {
        Check(file.GetDictionary(dictionary_.Out()));
        Check(file.GetHeader(header_.Out()));
    }

    void Make(const std::vector<Clip>& clips, const std::string& name) {
        const auto composition = New<IAAFCompositionMob>(AUID_AAFCompositionMob);
        const std::wstring wide = encodings::ToWideLossy(encodings::FromUtf8(name));
        Check(composition->Initialize(wide.c_str()));
        mob_ = As<IAAFMob>(composition.get());
        if (const auto mob = As<IAAFMob2>(composition.get())) {
            mob->SetUsageCode(kTopLevel);  // a library without it writes what it can
        }
        std::size_t sounds = 0;
        bool hasPictures = false;
        aafLength_t length = 0;
        for (const Clip& clip : clips) {
            sounds = std::max(sounds, clip.sounds.size());
            hasPictures = hasPictures || !clip.pictures.empty();
            length += clip.Frames();
        }
        if (hasPictures) {
            AddTrack(L"V1", 1, clips, &Clip::pictures, 0);
        }
        for (std::size_t i = 0; i < sounds; ++i) {
            AddTrack(L"A" + std::to_wstring(i + 1), static_cast<aafUInt32>(i + 1), clips,
                     &Clip::sounds, i);
        }
        AddTimecode(length);
        SetId(clips);
        Check(header_->AddMob(mob_.get()));
    }

private:
    void Check(HRESULT result) const {
        if (result < 0) {
            throw Failure(kExitFile, "--stringout",
                          "the AAF library does not take it: " + library_.TextOfResult(result));
        }
    }

    template <class Interface>
    host::Ref<Interface> New(const aafUID_t& id) {
        host::Ref<Interface> made;
        Check(dictionary_->CreateInstance(id, aafIdOf(static_cast<Interface*>(nullptr)),
                                          reinterpret_cast<IUnknown**>(made.Out())));
        return made;
    }

    host::Ref<IAAFDataDef> Data(const aafUID_t& id) {
        host::Ref<IAAFDataDef> data;
        Check(dictionary_->LookupDataDef(id, data.Out()));
        return data;
    }

    // The same clips at the same rate have the same id, whenever and by whomever they are put
    // together.
    void SetId(const std::vector<Clip>& clips) {
        std::string bytes;
        const auto add = [&](const auto& value) {
            bytes.append(reinterpret_cast<const char*>(&value), sizeof value);
        };
        add(rate_.numerator);
        add(rate_.denominator);
        for (const Clip& clip : clips) {
            add(clip.id);
            add(clip.Frames());
        }
        const Digest digest = DigestOf(bytes);
        aafMobID_t id{};
        Check(mob_->GetMobID(&id));
        static_assert(sizeof id.material == sizeof digest);
        std::memcpy(&id.material, digest.data(), sizeof digest);
        Check(mob_->SetMobID(id));
    }

    // A track of what it is in the first clip that has it.
    void AddTrack(const std::wstring& name, aafUInt32 number, const std::vector<Clip>& clips,
                  std::vector<Part> Clip::*parts, std::size_t which) {
        const auto first = std::find_if(clips.begin(), clips.end(), [&](const Clip& clip) {
            return (clip.*parts).size() > which;
        });
        const auto data = Data(((*first).*parts)[which].data);
        const auto sequence = New<IAAFSequence>(AUID_AAFSequence);
        Check(sequence->Initialize(data.get()));
        aafLength_t gap = 0;
        for (const Clip& clip : clips) {
            const std::vector<Part>& own = clip.*parts;
            const aafLength_t frames = clip.Frames();
            const aafLength_t used = which < own.size() ? std::min(own[which].frames, frames) : 0;
            if (used > 0) {
                AddFiller(*sequence, data.get(), gap);
                gap = 0;
                const auto source = New<IAAFSourceClip>(AUID_AAFSourceClip);
                Check(source->Initialize(data.get(), used, {clip.id, own[which].slot, 0}));
                Check(sequence->AppendComponent(As<IAAFComponent>(source.get()).get()));
            }
            gap += frames - used;
        }
        AddFiller(*sequence, data.get(), gap);
        AddSlot(As<IAAFSegment>(sequence.get()).get(), name, number);
    }

    void AddFiller(IAAFSequence& sequence, IAAFDataDef* data, aafLength_t length) {
        if (length == 0) {
            return;
        }
        const auto filler = New<IAAFFiller>(AUID_AAFFiller);
        Check(filler->Initialize(data, length));
        Check(sequence.AppendComponent(As<IAAFComponent>(filler.get()).get()));
    }

    void AddTimecode(aafLength_t length) {
        const auto fps =
            static_cast<aafUInt16>((rate_.numerator + rate_.denominator - 1) / rate_.denominator);
        aafTimecode_t start{kSecondsAtStart * fps, kAAFTcNonDrop, fps};
        const auto timecode = New<IAAFTimecode>(AUID_AAFTimecode);
        Check(timecode->Initialize(length, &start));
        AddSlot(As<IAAFSegment>(timecode.get()).get(), L"TC1", 1);
    }

    void AddSlot(IAAFSegment* segment, const std::wstring& name, aafUInt32 number) {
        host::Ref<IAAFTimelineMobSlot> timeline;
        Check(mob_->AppendNewTimelineSlot(rate_, segment, ++lastSlot_, name.c_str(), 0,
                                          timeline.Out()));
        Check(As<IAAFMobSlot>(timeline.get())->SetPhysicalNum(number));
    }

    const AafLibrary& library_;
    aafRational_t rate_;
    host::Ref<IAAFDictionary> dictionary_;
    host::Ref<IAAFHeader> header_;
    host::Ref<IAAFMob> mob_;
    aafSlotID_t lastSlot_ = 0;
};

}  // namespace

void AddStringout(const AafLibrary& library, Bin& bin, const std::string& name, double rate) {
    const aafRational_t frames = RateOf(rate);
    std::vector<Clip> clips;
    for (const host::Ref<IAAFMob>& mob : bin.clips()) {
        clips.push_back(ClipOf(*mob, frames));
        if (clips.back().Frames() == 0) {
            clips.pop_back();
        }
    }
    if (clips.empty()) {
        throw Failure(kExitFile, "--stringout", "no clip has pictures or sound of any length");
    }
    Maker(library, *bin.file(), frames).Make(clips, name);
}

}  // namespace cliphost
