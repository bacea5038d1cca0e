// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ClipColumns.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstring>

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "reference_host/cliphost/AafClips.h"
#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/AafValue.h"
#include "reference_host/cliphost/Digest.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/TimecodeText.h"
#include "reference_host/cliphost/Words.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

constexpr char kBetweenValues[] = " | ";  // of columns with the same name

std::wstring Wide(const std::string& text) {
    return encodings::ToWideLossy(encodings::FromUtf8(text));
}

template <class Take>
void ForEachSlot(IAAFMob* mob, const Take& take) {
    aafNumSlots_t count = 0;
    if (mob != nullptr) {
        mob->CountSlots(&count);
    }
    for (aafUInt32 i = 0; i < count; ++i) {
        host::Ref<IAAFMobSlot> slot;
        host::Ref<IAAFSegment> segment;
        if (mob->GetSlotAt(i, slot.Out()) >= 0 && slot->GetSegment(segment.Out()) >= 0) {
            take(*slot, segment.get());
        }
    }
}

// A timecode that a segment is, or begins with.
host::Ref<IAAFTimecode> TimecodeIn(IAAFSegment* segment) {
    host::Ref<IAAFTimecode> timecode = As<IAAFTimecode>(segment);
    const auto sequence = As<IAAFSequence>(segment);
    aafUInt32 count = 0;
    if (sequence && sequence->CountComponents(&count) >= 0) {
        for (aafUInt32 i = 0; i < count && !timecode; ++i) {
            host::Ref<IAAFComponent> component;
            if (sequence->GetComponentAt(i, component.Out()) >= 0) {
                timecode = As<IAAFTimecode>(component.get());
            }
        }
    }
    return timecode;
}

// The chain of mobs of a clip, each empty where it has none.
struct Mobs {
    host::Ref<IAAFMob> master;
    host::Ref<IAAFMob> file;
    host::Ref<IAAFMob> source;  // what the file was imported from
    host::Ref<IAAFMob> tape;

    explicit Mobs(IAAFFile* description) {
        host::Ref<IAAFHeader> header;
        host::Ref<IEnumAAFMobs> mobs;
        if (description == nullptr || description->GetHeader(header.Out()) < 0 ||
            header->GetMobs(nullptr, mobs.Out()) < 0) {
            return;
        }
        host::Ref<IAAFMob> mob;
        while (mobs->NextOne(mob.Out()) >= 0) {
            host::Ref<IAAFEssenceDescriptor> descriptor;
            const auto withSource = As<IAAFSourceMob>(mob.get());
            if (As<IAAFMasterMob>(mob.get())) {
                master = mob;
            } else if (withSource && withSource->GetEssenceDescriptor(descriptor.Out()) >= 0) {
                auto& place = As<IAAFFileDescriptor>(descriptor.get())   ? file
                              : As<IAAFTapeDescriptor>(descriptor.get()) ? tape
                                                                         : source;
                place = mob;
            }
        }
    }

    // The first timecode of the source, which the file's start counts in.
    host::Ref<IAAFTimecode> Timecode() const {
        host::Ref<IAAFTimecode> first;
        ForEachSlot(source.get(), [&](IAAFMobSlot&, IAAFSegment* segment) {
            if (!first) {
                first = TimecodeIn(segment);
            }
        });
        return first;
    }
    int CountTimecodes() const {
        int count = 0;
        ForEachSlot(source.get(), [&](IAAFMobSlot&, IAAFSegment* segment) {
            count += TimecodeIn(segment) ? 1 : 0;
        });
        return count;
    }
};

struct Comment {
    host::Ref<IAAFTaggedValue> value;
    std::string name;
    std::string text;
};

std::vector<Comment> CommentsOf(IAAFMob& mob) {
    std::vector<Comment> comments;
    host::Ref<IEnumAAFTaggedValues> values;
    aafUInt32 count = 0;
    if (mob.CountComments(&count) < 0 || count == 0 || mob.GetComments(values.Out()) < 0) {
        return comments;
    }
    host::Ref<IAAFTaggedValue> value;
    while (values->NextOne(value.Out()) >= 0) {
        Comment comment;
        comment.name =
            TextOf(value.get(), &IAAFTaggedValue::GetNameBufLen, &IAAFTaggedValue::GetName);
        comment.text = TextInTwoSteps(
            [&](aafUInt32* bytes) { return value->GetValueBufLen(bytes); },
            [&](aafCharacter* to, aafUInt32 bytes) {
                aafUInt32 got = 0;
                return value->GetValue(bytes, reinterpret_cast<aafDataBuffer_t>(to), &got);
            });
        comment.value = std::move(value);
        comments.push_back(std::move(comment));
    }
    return comments;
}

ColumnValues ValuesOf(const std::vector<Comment>& comments) {
    ColumnValues values;
    for (const Comment& comment : comments) {
        values.emplace_back(comment.name, comment.text);
    }
    return values;
}

// As a bin shows it: the values of one name together.
ColumnValues Joined(const ColumnValues& columns) {
    ColumnValues values;
    for (const auto& column : columns) {
        const auto known = std::find_if(values.begin(), values.end(), [&](const auto& value) {
            return InSmallLetters(value.first) == InSmallLetters(column.first);
        });
        if (known == values.end()) {
            values.push_back(column);
        } else {
            known->second += kBetweenValues + column.second;
        }
    }
    return values;
}

class Writer {
public:
    Writer(IAAFFile* description, const MovieColumns& columns, const MovieColumns::Row& row)
        : file_(description), mobs_(description), columns_(columns), row_(row) {}

    void Write() {
        ForEachOf(ColumnUse::Name, [&] { SetName(); });
        ForEachOf(ColumnUse::Start, [&] { SetStart(); });
        ForEachOf(ColumnUse::Reel, [&] { SetReel(); });  // counts as the source does then
        ForEachOf(ColumnUse::Comment, [&] { SetComment(); });
    }

private:
    template <class Set>
    void ForEachOf(ColumnUse use, const Set& set) {
        for (const MovieColumns::Value& value : row_.values) {
            if (columns_.UseOf(value) == use) {
                value_ = &value;
                set();
            }
        }
    }

    [[noreturn]] void Refuse(int status, const std::string& reason) const {
        throw Failure(
            status, columns_.file(),
            fmt::format("row {}, column {}: {}", row_.number, columns_.NameOf(*value_), reason));
    }
    void Check(HRESULT result) const {
        if (result < 0) {
            Refuse(kExitFile, fmt::format("the AAF library does not take '{}' ({:#x})",
                                          value_->text, static_cast<unsigned>(result)));
        }
    }

    void SetName() {
        for (const auto& mob : {mobs_.master, mobs_.file, mobs_.source}) {
            if (mob) {
                Check(mob->SetName(Wide(value_->text).c_str()));
            }
        }
    }

    // What is there already stays as it is, its name too, which may differ in case from that of
    // the table.
    void SetComment() {
        std::string name = columns_.NameOf(*value_);
        const std::string small = InSmallLetters(name);
        const std::vector<Comment> comments = CommentsOf(*mobs_.master);
        for (const auto& [known, text] : Joined(ValuesOf(comments))) {
            if (InSmallLetters(known) == small) {
                if (text == value_->text) {
                    return;
                }
                name = known;
            }
        }
        for (const Comment& comment : comments) {
            if (InSmallLetters(comment.name) == small) {
                Check(mobs_.master->RemoveComment(comment.value.get()));
            }
        }
        std::wstring wide = Wide(name);
        Check(mobs_.master->AppendComment(wide.data(), Wide(value_->text).c_str()));
    }

    void SetStart() {
        const auto timecode = mobs_.Timecode();
        aafTimecode_t counted{};
        if (!timecode || timecode->GetTimecode(&counted) < 0) {
            Refuse(kExitFile, "the description has no timecode");
        }
        const WrittenTimecode time = ReadTimecode(value_->text).value_or(WrittenTimecode());
        const std::optional<std::int64_t> frames = FramesOf(time, counted.fps);
        if (!frames) {
            Refuse(kExitCaller, fmt::format("'{}' is no timecode at {} frames a second",
                                            value_->text, counted.fps));
        }
        counted.drop = time.drops ? kAAFTcDrop : kAAFTcNonDrop;
        Check(timecode->SetTimecode(&counted));
        ForEachSlot(mobs_.file.get(), [&](IAAFMobSlot&, IAAFSegment* segment) {
            const auto clip = As<IAAFSourceClip>(segment);
            aafSourceRef_t source{};
            if (clip && clip->GetSourceReference(&source) >= 0) {
                source.startTime = *frames;
                Check(clip->SetSourceReference(source));
            }
        });
    }

    template <class Interface>
    host::Ref<Interface> New(IAAFDictionary& dictionary, const aafUID_t& id) {
        host::Ref<Interface> made;
        Check(dictionary.CreateInstance(id, aafIdOf(static_cast<Interface*>(nullptr)),
                                        reinterpret_cast<IUnknown**>(made.Out())));
        return made;
    }

    // A tape of that name with the tracks of the source, which is what the source points to.
    void SetReel() {
        host::Ref<IAAFDictionary> dictionary;
        host::Ref<IAAFHeader> header;
        Check(file_->GetDictionary(dictionary.Out()));
        Check(file_->GetHeader(header.Out()));
        if (!mobs_.source) {
            Refuse(kExitFile, "the description has no source");
        }
        const auto tape = New<IAAFSourceMob>(*dictionary, AUID_AAFSourceMob);
        const auto mob = As<IAAFMob>(tape.get());
        const auto descriptor = New<IAAFTapeDescriptor>(*dictionary, AUID_AAFTapeDescriptor);
        Check(tape->Initialize());
        Check(descriptor->Initialize());
        Check(tape->SetEssenceDescriptor(As<IAAFEssenceDescriptor>(descriptor.get()).get()));
        Check(mob->SetName(Wide(value_->text).c_str()));

        std::string layout = value_->text;
        std::vector<std::pair<host::Ref<IAAFSourceClip>, aafSlotID_t>> clips;
        bool hasTimecode = false;
        ForEachSlot(mobs_.source.get(), [&](IAAFMobSlot& slot, IAAFSegment* segment) {
            aafSlotID_t id = 0;
            aafLength_t length = 0;
            aafRational_t rate{};
            const auto timeline = As<IAAFTimelineMobSlot>(&slot);
            const auto component = As<IAAFComponent>(segment);
            if (!timeline || !component || slot.GetSlotID(&id) < 0 ||
                timeline->GetEditRate(&rate) < 0 || component->GetLength(&length) < 0) {
                return;
            }
            const auto timecode = TimecodeIn(segment);
            const auto clip = As<IAAFSourceClip>(segment);
            if (timecode && !hasTimecode) {
                hasTimecode = true;
                const aafTimecode_t counted =
                    AddTimecode(*dictionary, *mob, *timecode, id, length, rate);
                layout += fmt::format("\n{} {} {}", counted.startFrame, counted.fps,
                                      counted.drop == kAAFTcDrop ? "drop" : "non-drop");
            } else if (clip) {
                host::Ref<IAAFDataDef> data;
                Check(slot.GetDataDef(data.Out()));
                host::Ref<IAAFMobSlot> added;
                Check(tape->AddNilReference(id, length, data.get(), rate));
                Check(mob->LookupSlot(id, added.Out()));
                Check(added->SetName(L""));  // the library gives it one
                clips.emplace_back(clip, id);
            } else {
                return;
            }
            layout += fmt::format("\n{} {} {}/{} {}", id, length, rate.numerator, rate.denominator,
                                  DataOfSlot(slot).kind);
        });
        // Movies of one reel with the same tracks and count lead to the same tape.
        const aafMobID_t id = IdOf(*mob, layout);
        Check(mob->SetMobID(id));
        Check(header->AddMob(mob.get()));
        for (const auto& [clip, slot] : clips) {
            Check(clip->SetSourceReference({id, slot, 0}));
        }
    }

    // Returns how it counts.
    aafTimecode_t AddTimecode(IAAFDictionary& dictionary, IAAFMob& mob, IAAFTimecode& like,
                              aafSlotID_t id, aafLength_t length, const aafRational_t& rate) {
        aafTimecode_t counted{};
        Check(like.GetTimecode(&counted));
        const auto timecode = New<IAAFTimecode>(dictionary, AUID_AAFTimecode);
        Check(timecode->Initialize(length, &counted));
        host::Ref<IAAFTimelineMobSlot> timeline;
        Check(mob.AppendNewTimelineSlot(rate, As<IAAFSegment>(timecode.get()).get(), id, L"TC1", 0,
                                        timeline.Out()));
        Check(As<IAAFMobSlot>(timeline.get())->SetPhysicalNum(1));
        return counted;
    }

    aafMobID_t IdOf(IAAFMob& mob, const std::string& layout) const {
        const Digest digest = DigestOf(layout);
        aafMobID_t id{};
        Check(mob.GetMobID(&id));
        static_assert(sizeof id.material == sizeof digest);
        std::memcpy(&id.material, digest.data(), sizeof digest);
        return id;
    }

    IAAFFile* const file_;
    const Mobs mobs_;
    const MovieColumns& columns_;
    const MovieColumns::Row& row_;
    const MovieColumns::Value* value_ = nullptr;
};

void ReadStart(const Mobs& mobs, ClipTexts& texts) {
    const auto timecode = mobs.Timecode();
    aafTimecode_t counted{};
    if (!timecode || timecode->GetTimecode(&counted) < 0) {
        return;
    }
    aafSourceRef_t source{};
    ForEachSlot(mobs.file.get(), [&](IAAFMobSlot&, IAAFSegment* segment) {
        const auto clip = As<IAAFSourceClip>(segment);
        aafSourceRef_t one{};
        if (clip && clip->GetSourceReference(&one) >= 0) {
            source.startTime = std::max(source.startTime, one.startTime);
        }
    });
    texts.start = TimecodeText(source.startTime, counted.fps, counted.drop == kAAFTcDrop);
    // Two timecodes that begin with 0 are those of a movie without one of its own.
    texts.hasOwnStart = source.startTime != 0 || mobs.CountTimecodes() <= 1;
}

std::string NameOfMob(IAAFMob* mob) {
    return mob ? TextOf(mob, &IAAFMob::GetNameBufLen, &IAAFMob::GetName) : std::string();
}

std::string RateOf(const aafRational_t& rate) {
    return rate.denominator == 1 ? std::to_string(rate.numerator) : ToText(rate);
}

}  // namespace

void SetColumns(IAAFFile* description, const MovieColumns& columns, const MovieColumns::Row& row) {
    Writer(description, columns, row).Write();
}

ClipTexts TextsOf(IAAFFile* description) {
    const Mobs mobs(description);
    ClipTexts texts;
    texts.name = NameOfMob(mobs.master.get());
    texts.reel = NameOfMob(mobs.tape.get());
    ReadStart(mobs, texts);
    if (mobs.master) {
        texts.binColumns = ValuesOf(CommentsOf(*mobs.master));
    }
    return texts;
}

ColumnValues ColumnsOf(IAAFFile* description, const std::string& codec) {
    const ClipTexts texts = TextsOf(description);
    const std::vector<AafClip> clips = ClipsOf(description);
    const std::vector<SlotFacts> slots = clips.empty() ? std::vector<SlotFacts>() : clips[0].slots;
    std::size_t pictures = 0;
    std::size_t sounds = 0;
    for (const SlotFacts& slot : slots) {
        pictures += slot.kind == "picture" ? 1 : 0;
        sounds += slot.kind == "sound" ? 1 : 0;
    }
    ColumnValues values = {
        {"name", texts.name},
        {"reel", texts.reel},
        {"start timecode", texts.hasOwnStart ? texts.start : ""},
        {"length", slots.empty() ? "" : std::to_string(slots[0].length)},
        {"rate", slots.empty() ? "" : RateOf(slots[0].rate)},
        {"tracks", fmt::format("{}, {}", Counted(pictures, "picture"), Counted(sounds, "sound"))},
        {"codec", codec}};
    for (const auto& [name, value] : Joined(texts.binColumns)) {
        if (!name.empty() && name[0] != '_' && UseOf(name) == ColumnUse::Comment) {
            values.emplace_back(name, value);
        }
    }
    return values;
}

}  // namespace cliphost
