// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeMediaVolume.h"

#include "tests/support/TestFiles.h"
#include "tests/unit/components/ComponentFixture.h"

namespace {

class MediaVolume : public ComponentFixture {
protected:
    NCFSmartPtr<NMA::IMediaVolume> volume =
        make<NMA::IMediaVolume>(CreateInstanceOf<NMA::Impl::QuickTimeMediaVolume>);
};

TEST_F(MediaVolume, ClaimsAFolderByItsFirstMovieWhateverIsInIt) {
    EXPECT_EQ(volume->IsMediaVolume(path(folder).inArg()), 0);
    write("notes.txt");
    write("a.mp4");
    EXPECT_EQ(volume->IsMediaVolume(path(folder).inArg()), 0) << "only *.mov counts";
    write("a.mov", "no movie at all");
    EXPECT_EQ(volume->IsMediaVolume(path(folder).inArg()), 1);
}

TEST_F(MediaVolume, DoesNotClaimForAFolderNamedLikeAMovie) {
    std::filesystem::create_directory(folder / "x.mov");
    EXPECT_EQ(volume->IsMediaVolume(path(folder).inArg()), 0);
}

TEST_F(MediaVolume, DoesNotClaimWhatIsAbsent) {
    EXPECT_EQ(volume->IsMediaVolume(path(folder / "absent").inArg()), 0);
    EXPECT_EQ(volume->IsMediaVolume(nullptr), 0);
}

TEST_F(MediaVolume, DoesNotClaimWhatItCanNotList) {
    write("a.mov");
    // Without strings the scan has nothing to give its names in.
    host.refuseCreation(NCFCompID_NCFString, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(volume->IsMediaVolume(path(folder).inArg()), 0);
}

TEST_F(MediaVolume, MakesTheInformationOfAFolder) {
    NCFSmartPtr<NMA::IVolumeInfo> info;
    ASSERT_EQ(volume->GetVolumeInfo(path(folder / "clips").inArg(), info.outArg()), NCF_OK);
    NCFSmartPtr<NMA::IVolumeInfo2> info2;
    ASSERT_EQ(ncfQuery(info.inArg(), info2), NCF_OK);
    NCFSmartPtr<INCFString> name;
    ASSERT_EQ(info2->GetVolumeName(name.outArg()), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "clips");
}

TEST_F(MediaVolume, MakesTheFormatOfAFolder) {
    NCFSmartPtr<NMA::IMediaFormat> format;
    ASSERT_EQ(volume->GetMediaFormat(path(folder).inArg(), format.outArg()), NCF_OK);
    EXPECT_EQ(format->FormatFlagA(), 1);
}

TEST_F(MediaVolume, NamesTheContainerComponent) {
    GUID id{};
    EXPECT_EQ(volume->GetContainerComponentId(&id), NCF_OK);
    EXPECT_TRUE(id == ncfGuid("781F84B7-B989-4534-8A07-C595CB9A6FB8"));
}

TEST_F(MediaVolume, NeedsItsOutputs) {
    EXPECT_EQ(volume->GetVolumeInfo(path(folder).inArg(), nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(volume->GetMediaFormat(path(folder).inArg(), nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(volume->GetContainerComponentId(nullptr), NCF_E_INVALIDARG);
}

TEST_F(MediaVolume, NeedsAPathForWhatItMakes) {
    NCFSmartPtr<NMA::IVolumeInfo> info;
    NCFSmartPtr<NMA::IMediaFormat> format;
    EXPECT_EQ(volume->GetVolumeInfo(nullptr, info.outArg()), NCF_E_POINTER);
    EXPECT_EQ(volume->GetMediaFormat(nullptr, format.outArg()), NCF_E_POINTER);
}

TEST_F(MediaVolume, AnswersItsOwnInterfaceAlone) {
    NCFSmartPtr<NMA::IMediaFormat> format;
    EXPECT_EQ(ncfQuery(volume.inArg(), format), NCF_E_NOINTERFACE);
}

TEST_F(MediaVolume, GivesTheRefusalOfTheFactory) {
    host.refuseCreation(NMA::CompID_QuickTimeVolumeInfo, NCF_E_OUTOFMEMORY);
    host.refuseCreation(NMA::CompID_QuickTimeMediaFormat, NCF_E_HANDLE);
    NCFSmartPtr<NMA::IVolumeInfo> info;
    NCFSmartPtr<NMA::IMediaFormat> format;
    EXPECT_EQ(volume->GetVolumeInfo(path(folder).inArg(), info.outArg()), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(info.isNull());
    EXPECT_EQ(volume->GetMediaFormat(path(folder).inArg(), format.outArg()), NCF_E_HANDLE);
    EXPECT_TRUE(format.isNull());
}

// An object of another class behind the same interface.
struct ForeignInfo : FakeObject<NMA::IVolumeInfo> {
    NCFRESULT GetSerialNumber(ncfUInt32*) override { return NCF_OK; }
    NCFRESULT GetLabel(INCFString**) override { return NCF_OK; }
    NCFRESULT GetType(ncfUInt32*) override { return NCF_OK; }
    NCFRESULT GetModificationDate(ncfUInt32*) override { return NCF_OK; }
    NCFRESULT VolumeQueryA(void*) override { return NCF_OK; }
    NCFRESULT VolumeQueryB() override { return NCF_OK; }
    NCFRESULT VolumeQueryC() override { return NCF_OK; }
    NCFRESULT VolumeQueryD() override { return NCF_OK; }
};

TEST_F(MediaVolume, ForeignInformationIsUnexpected) {
    host.maker(NMA::CompID_QuickTimeVolumeInfo, [](const GUID&, void** out) {
        *out = static_cast<NMA::IVolumeInfo*>(new ForeignInfo);
        return NCF_OK;
    });
    NCFSmartPtr<NMA::IVolumeInfo> info;
    EXPECT_EQ(volume->GetVolumeInfo(path(folder).inArg(), info.outArg()), NCF_E_UNEXPECTED);
}

TEST_F(MediaVolume, NothingMadeIsUnexpected) {
    const auto nothing = [](const GUID&, void**) { return NCF_OK; };
    host.maker(NMA::CompID_QuickTimeVolumeInfo, nothing);
    host.maker(NMA::CompID_QuickTimeMediaFormat, nothing);
    NCFSmartPtr<NMA::IVolumeInfo> info;
    NCFSmartPtr<NMA::IMediaFormat> format;
    EXPECT_EQ(volume->GetVolumeInfo(path(folder).inArg(), info.outArg()), NCF_E_UNEXPECTED);
    EXPECT_EQ(volume->GetMediaFormat(path(folder).inArg(), format.outArg()), NCF_E_UNEXPECTED);
}

TEST_F(MediaVolume, NeedsAHostWithAFactory) {
    void* out = nullptr;
    EXPECT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeMediaVolume>(nullptr, nullptr,
                                                                NMA::IID_IMediaVolume, &out),
              NCF_E_POINTER);
    host.refuseQuery(IID_INCFComponentFactory, NCF_E_NOINTERFACE);
    EXPECT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeMediaVolume>(host.unknown(), nullptr,
                                                                NMA::IID_IMediaVolume, &out),
              NCF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
}

// --- volume information ------------------------------------------------------------

class VolumeInfo : public MediaVolume {
protected:
    NCFSmartPtr<NMA::IVolumeInfo2> infoFor(const NCFSmartPtr<INCFString>& path) {
        NCFSmartPtr<NMA::IVolumeInfo> info;
        EXPECT_EQ(volume->GetVolumeInfo(path.inArg(), info.outArg()), NCF_OK);
        NCFSmartPtr<NMA::IVolumeInfo2> info2;
        EXPECT_EQ(ncfQuery(info.inArg(), info2), NCF_OK);
        EXPECT_EQ(static_cast<NMA::IVolumeInfo*>(info2.inArg()), info.inArg())
            << "one interface answers to both ids";
        return info2;
    }
    std::string nameOf(const std::string& path) {
        NCFSmartPtr<INCFString> name;
        EXPECT_EQ(infoFor(text(path))->GetVolumeName(name.outArg()), NCF_OK);
        return TextOf(name.inArg());
    }
};

TEST_F(VolumeInfo, IsNamedAfterTheLastComponentOfItsPath) {
    EXPECT_EQ(nameOf("C:\\media\\clips"), "clips");
    EXPECT_EQ(nameOf("C:\\media\\clips\\"), "clips");
    EXPECT_EQ(nameOf("C:\\"), "");
    EXPECT_EQ(nameOf("clips"), "") << "without a backslash there is no last component";
    EXPECT_EQ(nameOf("\\m\\\xF0\x9F\x8E\xAC"), "\xF0\x9F\x8E\xAC");
}

TEST_F(VolumeInfo, DropsOneBackslashAtTheEndOfItsPathAlone) {
    EXPECT_EQ(nameOf("C:\\media\\clips\\\\"), "");
    EXPECT_EQ(nameOf("\\"), "");
}

TEST_F(VolumeInfo, TakesASlashForAPartOfItsName) {
    EXPECT_EQ(nameOf("/media/clips"), "") << "there is no backslash";
    EXPECT_EQ(nameOf("C:\\media/clips"), "media/clips");
    EXPECT_EQ(nameOf("C:\\media/clips/"), "media/clips/");
}

TEST_F(VolumeInfo, HasNoNameWithoutAPath) {
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(infoFor(text(""))->GetVolumeName(name.outArg()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(infoFor(text(""))->GetVolumeName(nullptr), NMA_E_NOTINITIALIZED)
        << "the path is looked at first";
    EXPECT_EQ(infoFor(text("\\a"))->GetVolumeName(nullptr), NCF_E_INVALIDARG);
}

TEST_F(VolumeInfo, GivesTheRefusalOfTheStringForItsName) {
    const auto info = infoFor(text("\\a"));
    host.refuseCreation(NCFCompID_NCFString, NCF_E_OUTOFMEMORY);
    auto* name = reinterpret_cast<INCFString*>(&host);
    EXPECT_EQ(info->GetVolumeName(&name), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(name, nullptr);
}

TEST_F(VolumeInfo, IsAsNewAsTheNewestMovie) {
    ncfUInt32 date = 7;
    EXPECT_EQ(infoFor(path(folder))->GetModificationDate(&date), NCF_OK);
    EXPECT_EQ(date, 0u);
    write("a.mov");
    write("b.mov");
    write("c.txt");
    SetDate(folder / "a.mov", 1700000000);
    SetDate(folder / "b.mov", 1600000000);
    SetDate(folder / "c.txt", 1800000000);
    EXPECT_EQ(infoFor(path(folder))->GetModificationDate(&date), NCF_OK);
    EXPECT_EQ(date, 1700000000u);
}

TEST_F(VolumeInfo, KeepsTheLowHalfOfADate) {
    write("a.mov");
    SetDate(folder / "a.mov", 0x100000005);
    ncfUInt32 date = 0;
    EXPECT_EQ(infoFor(path(folder))->GetModificationDate(&date), NCF_OK);
    EXPECT_EQ(date, 5u);
}

TEST_F(VolumeInfo, TellsTheVolume) {
    const auto info = infoFor(path(folder));
    ncfUInt32 serial = 0;
    ncfUInt32 type = 99;
    NCFSmartPtr<INCFString> label;
    EXPECT_EQ(info->GetSerialNumber(&serial), NCF_OK);
    EXPECT_EQ(info->GetLabel(label.outArg()), NCF_OK);
    EXPECT_FALSE(label.isNull());
    EXPECT_EQ(info->GetType(&type), NCF_OK);
    EXPECT_LE(type, 6u);
}

TEST_F(VolumeInfo, GivesItsFixedAnswers) {
    const auto info = infoFor(path(folder));
    int untouched = 7;
    EXPECT_EQ(info->VolumeQueryA(&untouched), NMA_E_NODATA);
    EXPECT_EQ(untouched, 7);
    EXPECT_EQ(info->VolumeQueryB(), 1);
    EXPECT_EQ(info->VolumeQueryC(), 1);
    EXPECT_EQ(static_cast<ncfUInt32>(info->VolumeQueryD()), 0xFFFFFFFFu);
}

TEST_F(VolumeInfo, NeedsItsOutputs) {
    const auto info = infoFor(path(folder));
    EXPECT_EQ(info->GetSerialNumber(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(info->GetLabel(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(info->GetType(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(info->GetModificationDate(nullptr), NCF_E_INVALIDARG);
}

}  // namespace
