// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/AafClips.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <set>
#include <unordered_map>

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafValue.h"

namespace cliphost {
namespace {

constexpr int kDeepestSegment = 32;         // segments inside segments
constexpr std::size_t kMostSources = 1000;  // that a clip leads to; more is nobody's clip

// How the ids of a clip of ours begin: what they hold behind comes from the movie's content.
constexpr aafUInt8 kLabelOfIds[] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01,
                                    0x01, 0x01, 0x01, 0x01, 0x0F, 0x00};
constexpr aafUInt8 kLengthOfId = 0x13;
constexpr aafUInt8 kMasterMob = 0x00;
constexpr aafUInt8 kFileMob = 0xB1;

struct KindOfData {
    aafUID_t id;
    const char* name;
};
constexpr KindOfData kKinds[] = {
    {kAAFDataDef_Picture, "picture"},   {kAAFDataDef_LegacyPicture, "picture"},
    {kAAFDataDef_Sound, "sound"},       {kAAFDataDef_LegacySound, "sound"},
    {kAAFDataDef_Timecode, "timecode"}, {kAAFDataDef_LegacyTimecode, "timecode"},
};

SlotFacts FactsOfSlot(IAAFMobSlot& slot) {
    SlotFacts facts;
    slot.GetSlotID(&facts.id);
    const SlotData data = DataOfSlot(slot);
    facts.kind = !data.kind.empty() || data.id == aafUID_t{} ? data.kind : ToText(data.id);
    facts.rate = {0, 1};
    if (const auto timeline = As<IAAFTimelineMobSlot>(&slot)) {
        timeline->GetEditRate(&facts.rate);
    } else if (const auto event = As<IAAFEventMobSlot>(&slot)) {
        event->GetEditRate(&facts.rate);
    }
    host::Ref<IAAFSegment> segment;
    slot.GetSegment(segment.Out());
    const auto component = As<IAAFComponent>(segment.get());
    if (!component || component->GetLength(&facts.length) < 0) {
        facts.length = -1;
    }
    return facts;
}

template <class Take>
void ForEachSlot(IAAFMob& mob, const Take& take) {
    host::Ref<IEnumAAFMobSlots> slots;
    host::Ref<IAAFMobSlot> slot;
    if (mob.GetSlots(slots.Out()) < 0) {
        return;
    }
    while (slots->NextOne(slot.Out()) >= 0) {
        take(*slot);
    }
}

bool IsMasterMob(const host::Ref<IAAFMob>& mob) {
    return As<IAAFMasterMob>(mob.get()).get() != nullptr;
}

// A file's mobs, and what they lead to.
class MobsOfFile {
public:
    explicit MobsOfFile(IAAFFile* file) {
        host::Ref<IAAFHeader> header;
        host::Ref<IEnumAAFMobs> mobs;
        if (!file || file->GetHeader(header.Out()) < 0 ||
            header->GetMobs(nullptr, mobs.Out()) < 0) {
            return;
        }
        host::Ref<IAAFMob> mob;
        while (mobs->NextOne(mob.Out()) >= 0) {
            Entry entry;
            mob->GetMobID(&entry.id);
            entry.mob = std::move(mob);
            byId_.emplace(KeyOf(entry.id), entries_.size());
            entries_.push_back(std::move(entry));
        }
    }

    std::vector<AafClip> Clips() {
        std::vector<AafClip> clips;
        for (std::size_t at = 0; at < entries_.size(); ++at) {
            if (IsMasterMob(entries_[at].mob)) {
                clips.push_back(ClipAt(at));
            }
        }
        for (std::size_t at = 0; at < entries_.size(); ++at) {
            if (!entries_[at].isLedTo && As<IAAFSourceMob>(entries_[at].mob.get())) {
                AafClip clip = ClipAt(at);
                if (!clip.urls.empty()) {
                    clips.push_back(std::move(clip));
                }
            }
        }
        std::stable_sort(clips.begin(), clips.end(),
                         [](const AafClip& a, const AafClip& b) { return a.name < b.name; });
        return clips;
    }

private:
    struct Entry {
        aafMobID_t id{};
        host::Ref<IAAFMob> mob;
        bool isLedTo = false;
        bool isRead = false;
        std::vector<std::size_t> leadsTo;  // source mobs of the file
        std::vector<std::string> urls;
    };

    AafClip ClipAt(std::size_t first) {
        AafClip clip;
        IAAFMob& mob = *entries_[first].mob;
        clip.id = entries_[first].id;
        clip.name = TextOf(&mob, &IAAFMob::GetNameBufLen, &IAAFMob::GetName);
        ForEachSlot(mob, [&](IAAFMobSlot& slot) { clip.slots.push_back(FactsOfSlot(slot)); });
        std::set<std::string> known;
        std::set<std::size_t> met = {first};
        std::vector<std::size_t> open = {first};
        // Mobs may lead to each other in a circle, and on and on.
        for (std::size_t next = 0; next < open.size(); ++next) {
            const Entry& entry = Read(open[next]);
            if (!IsMasterMob(entry.mob)) {
                clip.sources.push_back(entry.id);
                clip.isOurs = clip.isOurs || (IsOfSameClip(clip.id, entry.id) &&
                                              clip.id.instanceHigh == kMasterMob &&
                                              entry.id.instanceHigh == kFileMob);
            }
            for (const std::string& url : entry.urls) {
                if (known.insert(url).second) {
                    clip.urls.push_back(url);
                }
            }
            for (const std::size_t other : entry.leadsTo) {
                if (open.size() <= kMostSources && met.insert(other).second) {
                    open.push_back(other);
                }
            }
        }
        return clip;
    }

    const Entry& Read(std::size_t at) {
        Entry& entry = entries_[at];
        entry.isLedTo = true;
        if (!entry.isRead) {
            entry.isRead = true;
            ForEachSlot(*entry.mob, [&](IAAFMobSlot& slot) {
                FindSources(As<IAAFObject>(&slot).get(), entry.leadsTo, 0);
            });
            ForEachLocatorOf(*entry.mob, [&](IAAFMob&, IAAFLocator& locator) {
                entry.urls.push_back(PathOf(locator));
            });
        }
        return entry;
    }

    // The source mobs that an object or what it holds leads to.
    void FindSources(IAAFObject* object, std::vector<std::size_t>& found, int depth) {
        if (const auto reference = As<IAAFSourceReference>(object)) {
            aafMobID_t id{};
            reference->GetSourceID(&id);
            const auto there = byId_.find(KeyOf(id));
            if (there != byId_.end() && As<IAAFSourceMob>(entries_[there->second].mob.get())) {
                found.push_back(there->second);
            }
        }
        host::Ref<IEnumAAFProperties> properties;
        if (!object || depth > kDeepestSegment || object->GetProperties(properties.Out()) < 0) {
            return;
        }
        host::Ref<IAAFProperty> property;
        while (properties->NextOne(property.Out()) >= 0) {
            host::Ref<IAAFPropertyValue> value;
            if (property->GetValue(value.Out()) >= 0) {
                values_.TypeOf(value.get()).TakeObjects(value.get(), [&](IAAFObject* part) {
                    FindSources(part, found, depth + 1);
                });
            }
        }
    }

    std::vector<Entry> entries_;
    std::unordered_map<std::string, std::size_t> byId_;
    ValueReader values_;
};

std::string ShownOf(const aafRational_t& rate) {
    return rate.numerator == 0 ? "none" : ToText(rate);
}

std::string ShownOf(aafLength_t length) {
    return length < 0 ? "none" : std::to_string(length);
}

bool IsSameRate(const aafRational_t& a, const aafRational_t& b) {
    const bool isSameForm = a.numerator == b.numerator && a.denominator == b.denominator;
    // Nothing is known of what divides by nought.
    const bool areRates = a.denominator != 0 && b.denominator != 0;
    return isSameForm || (areRates && std::int64_t{a.numerator} * b.denominator ==
                                          std::int64_t{b.numerator} * a.denominator);
}

// Differences, each with the slots that have it.
class Differences {
public:
    void Compare(const SlotFacts& before, const SlotFacts& after) {
        if (before.kind != after.kind) {
            Add(fmt::format("{} -> {}", before.kind, after.kind), before.id);
        }
        if (!IsSameRate(before.rate, after.rate)) {
            Add(fmt::format("rate {} -> {}", ShownOf(before.rate), ShownOf(after.rate)), before.id);
        }
        if (before.length != after.length) {
            Add(fmt::format("length {} -> {}", ShownOf(before.length), ShownOf(after.length)),
                before.id);
        }
    }

    void Add(const std::string& what, aafSlotID_t slot) {
        const auto found = std::find_if(all_.begin(), all_.end(),
                                        [&](const auto& one) { return one.what == what; });
        if (found == all_.end()) {
            all_.push_back({what, std::to_string(slot), 1});
        } else {
            found->slots += fmt::format(", {}", slot);
            ++found->count;
        }
    }

    std::string Text() const {
        std::string text;
        for (const One& one : all_) {
            text += fmt::format("{}{} in {} {}", text.empty() ? "" : "; ", one.what,
                                one.count > 1 ? "slots" : "slot", one.slots);
        }
        return text;
    }

private:
    struct One {
        std::string what;
        std::string slots;
        int count;
    };
    std::vector<One> all_;
};

}  // namespace

std::string KindOfDataNamed(const std::string& id) {
    for (const KindOfData& kind : kKinds) {
        if (ToText(kind.id) == id) {
            return kind.name;
        }
    }
    return {};
}

SlotData DataOfSlot(IAAFMobSlot& slot) {
    SlotData found;
    host::Ref<IAAFDataDef> data;
    slot.GetDataDef(data.Out());
    const auto definition = As<IAAFDefObject>(data.get());
    if (!definition || definition->GetAUID(&found.id) < 0) {
        return found;
    }
    for (const KindOfData& kind : kKinds) {
        if (kind.id == found.id) {
            found.kind = kind.name;
        }
    }
    return found;
}

std::vector<AafClip> ClipsOf(IAAFFile* file) {
    return MobsOfFile(file).Clips();
}

std::string KeyOf(const aafMobID_t& id) {
    return std::string(reinterpret_cast<const char*>(&id), sizeof id);
}

bool IsOfSameClip(const aafMobID_t& a, const aafMobID_t& b) {
    const auto isOurs = [](const aafMobID_t& id) {
        return std::equal(std::begin(kLabelOfIds), std::end(kLabelOfIds), id.SMPTELabel) &&
               id.length == kLengthOfId && id.instanceMid == 0 && id.instanceLow == 0;
    };
    return isOurs(a) && isOurs(b) && a.material == b.material;
}

std::string DifferencesOf(const std::vector<SlotFacts>& before,
                          const std::vector<SlotFacts>& after) {
    std::map<aafSlotID_t, const SlotFacts*> now;
    for (const SlotFacts& slot : after) {
        now.emplace(slot.id, &slot);
    }
    Differences differences;
    for (const SlotFacts& slot : before) {
        const auto found = now.find(slot.id);
        if (found == now.end()) {
            differences.Add(slot.kind + " -> none", slot.id);
        } else {
            differences.Compare(slot, *found->second);
            now.erase(found);
        }
    }
    for (const SlotFacts& slot : after) {
        if (now.count(slot.id) != 0) {
            differences.Add("none -> " + slot.kind, slot.id);
        }
    }
    return differences.Text();
}

}  // namespace cliphost
