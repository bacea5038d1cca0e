// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/AafClips.h"

#include "tests/unit/aaf_library/objects/TransientFile.h"

#define MUST(expression) ASSERT_EQ(AAFRESULT_SUCCESS, expression)

namespace {

using aaf_test::As;
using aaf_test::Ptr;
using cliphost::AafClip;
using cliphost::ClipsOf;
using cliphost::DifferencesOf;
using cliphost::SlotFacts;
using Texts = std::vector<std::string>;

// An id of the form that clips of ours have.
aafMobID_t OurId(aafUInt8 instance, aafUInt8 material = 7) {
    aafMobID_t id{{0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x0F, 0x00},
                  0x13,
                  instance,
                  0,
                  0,
                  {}};
    id.material.Data1 = material;
    return id;
}

class AafClips : public aaf_test::TransientFile {
protected:
    // A mob that was added to the file; a source mob names the URL.
    Ptr<IAAFMob> Master(const aafMobID_t& id, const wchar_t* name = L"master") {
        Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFMasterMob>(mob)->Initialize());
        Add(mob, id, name);
        return mob;
    }
    Ptr<IAAFMob> Source(const aafMobID_t& id, const wchar_t* url, const wchar_t* name = L"source") {
        Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
        Ptr<IAAFEssenceDescriptor> descriptor =
            Make<IAAFEssenceDescriptor>(AUID_AAFImportDescriptor);
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceMob>(mob)->Initialize());
        if (url != nullptr) {
            Ptr<IAAFLocator> locator = Make<IAAFLocator>(AUID_AAFNetworkLocator);
            EXPECT_EQ(AAFRESULT_SUCCESS, locator->SetPath(url));
            EXPECT_EQ(AAFRESULT_SUCCESS, descriptor->AppendLocator(locator));
        }
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceMob>(mob)->SetEssenceDescriptor(descriptor));
        Add(mob, id, name);
        return mob;
    }
    Ptr<IAAFSourceClip> ClipTo(const aafMobID_t& to, aafLength_t length = 10) {
        Ptr<IAAFSourceClip> clip = Clip(length);
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceReference>(clip)->SetSourceID(to));
        return clip;
    }
    void AddSlot(const Ptr<IAAFMob>& mob, IAAFSegment* segment, aafSlotID_t slot = 1,
                 aafRational_t rate = {25, 1}) {
        Ptr<IAAFTimelineMobSlot> added;
        MUST(mob->AppendNewTimelineSlot(rate, segment, slot, L"", 0, added.Out()));
    }
    void Lead(const Ptr<IAAFMob>& from, const aafMobID_t& to, aafSlotID_t slot = 1) {
        AddSlot(from, As<IAAFSegment>(ClipTo(to)), slot);
    }
    std::vector<AafClip> Clips() { return ClipsOf(file_); }

private:
    void Add(const Ptr<IAAFMob>& mob, const aafMobID_t& id, const wchar_t* name) {
        MUST(mob->SetMobID(id));
        MUST(mob->SetName(name));
        MUST(header_->AddMob(mob));
    }
};

TEST_F(AafClips, LeadFromAMasterMobToAllItsSources) {
    Lead(Master(OurId(0x00)), OurId(0xB1));
    Lead(Source(OurId(0xB1), L"file:///a.mov"), OurId(0xA1));
    Source(OurId(0xA1), L"file:///a.mov");
    const std::vector<AafClip> clips = Clips();
    ASSERT_EQ(clips.size(), 1u);
    EXPECT_EQ(clips[0].name, "master");
    EXPECT_TRUE(clips[0].isOurs);
    EXPECT_EQ(clips[0].sources.size(), 2u);
    EXPECT_EQ(clips[0].urls, Texts{"file:///a.mov"}) << "each once";
    ASSERT_EQ(clips[0].slots.size(), 1u);
    EXPECT_EQ(clips[0].slots[0].id, 1u);
    EXPECT_EQ(clips[0].slots[0].kind, "picture");
    EXPECT_EQ(clips[0].slots[0].rate.numerator, 25);
    EXPECT_EQ(clips[0].slots[0].length, 10);
}

TEST_F(AafClips, EndWhereSourcesLeadInACircle) {
    Lead(Master(OurId(0x00)), OurId(0xB1));
    Lead(Source(OurId(0xB1), L"file:///a.mov"), OurId(0xA1));
    const Ptr<IAAFMob> last = Source(OurId(0xA1), L"file:///b.mov");
    Lead(last, OurId(0xB1), 1);
    Lead(last, OurId(0xA1), 2);
    const std::vector<AafClip> clips = Clips();
    ASSERT_EQ(clips.size(), 1u);
    EXPECT_EQ(clips[0].urls, (Texts{"file:///a.mov", "file:///b.mov"}));
}

TEST_F(AafClips, LeadNowhereWhereAMobIsMissing) {
    Lead(Master(OurId(0x00)), OurId(0xB1));
    const std::vector<AafClip> clips = Clips();
    ASSERT_EQ(clips.size(), 1u);
    EXPECT_TRUE(clips[0].urls.empty());
    EXPECT_FALSE(clips[0].isOurs) << "nothing tells that its id comes from a content";
}

TEST_F(AafClips, AreOursByAllOfTheirIds) {
    // Another material, another label, and another maker's master of our file mob.
    aafMobID_t label = OurId(0x00, 2);
    label.SMPTELabel[11] = 0x20;
    Lead(Master(OurId(0x00, 1), L"1"), OurId(0xB1, 9));
    Lead(Master(label, L"2"), OurId(0xB1, 2));
    Lead(Master(OurId(0x05, 9), L"3"), OurId(0xB1, 9));
    Lead(Master(OurId(0x00, 9), L"4"), OurId(0xB1, 9));
    Source(OurId(0xB1, 9), L"file:///a.mov");
    Source(OurId(0xB1, 2), L"file:///b.mov");
    const std::vector<AafClip> clips = Clips();
    ASSERT_EQ(clips.size(), 4u);
    for (int i = 0; i < 4; ++i) {
        EXPECT_EQ(clips[static_cast<std::size_t>(i)].isOurs, i == 3) << i + 1;
    }
}

TEST_F(AafClips, AreSourceMobsThatNoMasterLeadsTo) {
    Source(aaf_test::MobId(1), L"file:///a.mov", L"alone");
    Source(aaf_test::MobId(2), nullptr, L"tape");
    const std::vector<AafClip> clips = Clips();
    ASSERT_EQ(clips.size(), 1u) << "one without a place is nobody's clip";
    EXPECT_EQ(clips[0].name, "alone");
    EXPECT_EQ(clips[0].urls, Texts{"file:///a.mov"});
    EXPECT_FALSE(clips[0].isOurs);
}

TEST_F(AafClips, FindSourcesHoweverDeepTheyAre) {
    // A sequence in a sequence, and so on.
    Ptr<IAAFComponent> inner = As<IAAFComponent>(ClipTo(OurId(0xB1)));
    for (int depth = 0; depth < 10; ++depth) {
        const Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
        MUST(sequence->Initialize(DataDef(kAAFDataDef_LegacyPicture)));
        MUST(sequence->AppendComponent(inner));
        inner = As<IAAFComponent>(sequence);
    }
    AddSlot(Master(OurId(0x00)), As<IAAFSegment>(inner));
    Source(OurId(0xB1), L"file:///a.mov");
    const std::vector<AafClip> clips = Clips();
    ASSERT_EQ(clips.size(), 1u);
    EXPECT_EQ(clips[0].urls, Texts{"file:///a.mov"});
}

TEST_F(AafClips, AreBoundedInWhatTheyLeadTo) {
    const auto idOf = [](int number) {
        aafMobID_t id = OurId(0x55);
        id.material.Data2 = static_cast<aafUInt16>(number);
        return id;
    };
    constexpr int kLong = 1500;
    Lead(Master(OurId(0x00)), idOf(0));
    for (int i = 0; i < kLong; ++i) {
        Lead(Source(idOf(i), L"file:///a.mov"), idOf(i + 1));
    }
    const std::vector<AafClip> clips = Clips();
    ASSERT_GE(clips.size(), 1u);
    for (const AafClip& clip : clips) {
        EXPECT_LE(clip.sources.size(), 1001u);
    }
}

TEST_F(AafClips, AreNoneInAnEmptyFile) {
    EXPECT_TRUE(Clips().empty());
    EXPECT_TRUE(ClipsOf(nullptr).empty());
}

TEST(SlotDifferences, NameWhatIsOtherAndWhere) {
    const std::vector<SlotFacts> before = {{1, "picture", {25, 1}, 250},
                                           {2, "sound", {25, 1}, 250}};
    EXPECT_EQ(DifferencesOf(before, before), "");
    EXPECT_EQ(DifferencesOf(before, {{2, "sound", {50, 2}, 250}, {1, "picture", {25, 1}, 250}}), "")
        << "neither the order nor how a rate is written";
    EXPECT_EQ(DifferencesOf(before, {{1, "picture", {25, 1}, 251}, {2, "sound", {25, 1}, 251}}),
              "length 250 -> 251 in slots 1, 2");
    EXPECT_EQ(DifferencesOf(before, {{1, "timecode", {30, 1}, 250}, {2, "sound", {25, 1}, -1}}),
              "picture -> timecode in slot 1; rate 25/1 -> 30/1 in slot 1; length 250 -> none in "
              "slot 2");
    EXPECT_EQ(DifferencesOf(before, {{1, "picture", {25, 1}, 250}, {3, "sound", {25, 1}, 250}}),
              "sound -> none in slot 2; none -> sound in slot 3");
}

TEST(SlotDifferences, CompareRatesThatNoSlotCanHave) {
    constexpr aafInt32 kMost = 0x7FFFFFFF;
    EXPECT_EQ(DifferencesOf({{1, "picture", {kMost, kMost}, 1}}, {{1, "picture", {1, 1}, 1}}), "");
    EXPECT_NE(DifferencesOf({{1, "picture", {0, 0}, 1}}, {{1, "picture", {1, 1}, 1}}), "");
    EXPECT_EQ(DifferencesOf({{1, "picture", {0, 0}, 1}}, {{1, "picture", {0, 0}, 1}}), "");
    EXPECT_NE(DifferencesOf({{1, "picture", {0, 1}, 1}}, {{1, "picture", {1, 1}, 1}}), "");
}

}  // namespace
