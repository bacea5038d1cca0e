// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the components make of the answers of a volume.

#include "source/components/QuickTimeMediaFormat.h"
#include "source/components/QuickTimeMediaVolume.h"
#include "tests/unit/components/ComponentFixture.h"
#include "tests/unit/components/doubles/Doubles.h"

namespace {

class Scans : public ComponentFixture {
protected:
    Scans() { volumeDouble = {}; }
    ~Scans() override {
        for (const NCFSmartPtr<INCFString>& name : volumeDouble.handedOut) {
            name->AddRef();
            EXPECT_EQ(name->Release(), 1u) << "a name was kept";
        }
        volumeDouble = {};
    }

    NCFSmartPtr<NMA::IVolumeInfo> info() {
        NCFSmartPtr<NMA::IVolumeInfo> made;
        EXPECT_EQ(volume->GetVolumeInfo(text("\\a").inArg(), made.outArg()), NCF_OK);
        return made;
    }

    NCFSmartPtr<NMA::IMediaVolume> volume =
        make<NMA::IMediaVolume>(CreateInstanceOf<NMA::Impl::QuickTimeMediaVolume>);
};

TEST_F(Scans, LookForMoviesAlone) {
    volumeDouble.names = {"a.mov"};
    ncfUInt32 date = 0;
    NCFSmartPtr<NMA::IMediaFormat> format;
    NCFSmartPtr<NMA::IAAFClips> clips;
    EXPECT_EQ(volume->IsMediaVolume(text("\\a").inArg()), 1);
    EXPECT_EQ(info()->GetModificationDate(&date), NCF_OK);
    EXPECT_EQ(volume->GetMediaFormat(text("\\a").inArg(), format.outArg()), NCF_OK);
    EXPECT_EQ(format->GetAAFClips(clips.outArg()), NCF_OK);
    EXPECT_EQ(volumeDouble.patterns, std::vector<std::string>(3, "*.mov"));
}

TEST_F(Scans, GoOverTheEmptyPathWhereNoneWasSet) {
    const auto format = make<NMA::IMediaFormat>(CreateInstanceOf<NMA::Impl::QuickTimeMediaFormat>);
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(format->GetAAFClips(clips.outArg()), NCF_OK);
    EXPECT_EQ(volumeDouble.paths, std::vector<std::string>{""});
}

TEST_F(Scans, AnswerNoWhenAResultIsThrown) {
    volumeDouble.throws = true;
    EXPECT_EQ(volume->IsMediaVolume(text("\\a").inArg()), 0);
}

TEST_F(Scans, GiveAThrownResultAsTheResultElsewhere) {
    volumeDouble.throws = true;
    ncfUInt32 date = 7;
    EXPECT_EQ(info()->GetModificationDate(&date), NCF_E_HANDLE);
    EXPECT_EQ(date, 7u);
    NCFSmartPtr<NMA::IMediaFormat> format;
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(volume->GetMediaFormat(text("\\a").inArg(), format.outArg()), NCF_OK);
    EXPECT_EQ(format->GetAAFClips(clips.outArg()), NCF_E_HANDLE);
    EXPECT_FALSE(clips.isNull()) << "the list was made before it was scanned";
}

TEST_F(Scans, CompareLowHalvesOfDatesAsUnsigned) {
    volumeDouble.names = {"a.mov", "b.mov", "c.mov"};
    volumeDouble.dates = {{"a.mov", 5}, {"b.mov", 0x80000001}, {"c.mov", 0x700000006}};
    ncfUInt32 date = 0;
    EXPECT_EQ(info()->GetModificationDate(&date), NCF_OK);
    EXPECT_EQ(date, 0x80000001u);
}

TEST_F(Scans, KeepTheOrderOfTheFileSystem) {
    volumeDouble.names = {"c.mov", ".a.mov", "a.mov", "b.mov"};
    NCFSmartPtr<NMA::IMediaFormat> format;
    NCFSmartPtr<NMA::IAAFClips> clips;
    volume->GetMediaFormat(text("\\f").inArg(), format.outArg());
    ASSERT_EQ(format->GetAAFClips(clips.outArg()), NCF_OK);
    ASSERT_EQ(clips->GetCount(), 3);
    const char* const paths[] = {"\\f\\c.mov", "\\f\\a.mov", "\\f\\b.mov"};
    for (ncfSInt32 i = 0; i < 3; ++i) {
        const auto place = text("");
        EXPECT_EQ(clips->GetClipPath(i, place.inArg()), NCF_OK);
        EXPECT_EQ(TextOf(place.inArg()), paths[i]);
    }
}

// As a file system may have them whose names are UTF-16 in name only.
TEST_F(Scans, KeepANameThatHasNoFormInUtf8) {
    volumeDouble.names = {"a.mov", "odd.mov", "b.mov"};
    const std::u16string odd = {u'o', 0xD800, u'.', u'm', u'o', u'v'};
    volumeDouble.change = [&](INCFString& name) {
        if (TextOf(&name) == "odd.mov") {
            name.AssignUTF16(kNCFUTF16, odd.data(), static_cast<ncfUInt32>(odd.size()));
        }
    };
    NCFSmartPtr<NMA::IMediaFormat> format;
    NCFSmartPtr<NMA::IAAFClips> clips;
    volume->GetMediaFormat(text("\\f").inArg(), format.outArg());
    ASSERT_EQ(format->GetAAFClips(clips.outArg()), NCF_OK);
    ASSERT_EQ(clips->GetCount(), 3);
    const std::u16string paths[] = {u"\\f\\a.mov", u"\\f\\" + odd, u"\\f\\b.mov"};
    for (ncfSInt32 i = 0; i < 3; ++i) {
        const auto place = text("");
        ASSERT_EQ(clips->GetClipPath(i, place.inArg()), NCF_OK);
        place->ConvertTo(kNCFUTF16);
        ncfUTF16* units = nullptr;
        ASSERT_EQ(place->GetRawUTF16(&units), NCF_OK);
        EXPECT_EQ(std::u16string(units, place->GetLength()), paths[i]) << i;
    }
}

TEST_F(Scans, PassTheVolumesFactsOn) {
    ncfUInt32 serial = 0;
    ncfUInt32 type = 0;
    NCFSmartPtr<INCFString> label;
    EXPECT_EQ(info()->GetSerialNumber(&serial), NCF_OK);
    EXPECT_EQ(info()->GetType(&type), NCF_OK);
    EXPECT_EQ(info()->GetLabel(label.outArg()), NCF_OK);
    EXPECT_EQ(serial, 0x12345678u);
    EXPECT_EQ(type, 4u);
    EXPECT_EQ(TextOf(label.inArg()), "a label");
}

}  // namespace
