// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/aaf/support/DescriptionHost.h"

#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"

namespace {

constexpr char kMapper[] =
    "<FourCharMapper>"
    "<FourCharMapping FourChar='cdci' vcid='20001'/>"
    "<FourCharMapping FourChar='mpeg' vcid='20002'/>"
    "<FourCharMapping FourChar='rgba' vcid='20003'/>"
    "</FourCharMapper>";

constexpr char kCommon[] =
    " rp210:PictureEssenceCoding='060e2b34-0401010d-04010202-03060100'"
    " rp210:EssenceContainerLabel='060e2b34-0401010d-0d010301-021c0100'"
    " rp210:FrameLayout='0' rp210:ImageStartOffset='8' rp210:ImageAlignmentOffset='1'"
    " rp210:StoredWidth='1920' rp210:StoredHeight='1088' rp210:SampledWidth='1918'"
    " rp210:DisplayWidth='1900' rp210:DisplayHeight='1080' rp210:DisplayYOffset='4'";
constexpr char kComponents[] =
    " rp210:ComponentDepth='10' rp210:HorizontalSubsampling='2' rp210:VerticalSubsampling='1'"
    " rp210:ColorSiting='4' rp210:ColorRange='897' rp210:BlackRefLevel='64'"
    " rp210:WhiteReflevel='940'";
constexpr char kAspectAndLines[] =
    "<rp210:AspectRatio types:Numerator='16' types:Denominator='9'/>"
    "<rp210:VideoLineMap><rp210:Element>42</rp210:Element><rp210:Element>7</rp210:Element>"
    "</rp210:VideoLineMap>";

std::string Entry(const char* id, const std::string& body) {
    return std::string("<MediaDescriptorSignature><NivoInfo ResolutionID='") + id + "'/>" + body +
           "</MediaDescriptorSignature>";
}

std::string Records() {
    return std::string("<AAFInfo>") +
           Entry("20001", std::string("<groups:CDCIDescriptor") + kCommon + kComponents +
                              " AVCSliceCounter='10'>" + kAspectAndLines +
                              "</groups:CDCIDescriptor>") +
           Entry("20002", std::string("<groups:MPEG2VideoDescriptor") + kCommon + kComponents +
                              " rp210:ProfileAndLevel='0x82' rp210:BitRate='50000000'"
                              " rp210:MaxGOP='12'>" +
                              kAspectAndLines + "</groups:MPEG2VideoDescriptor>") +
           Entry("20003", std::string("<groups:RGBADescriptor") + kCommon +
                              " rp210:ComponentMaxRef='254' rp210:ComponentMinRef='1'>" +
                              kAspectAndLines +
                              "<rp210:PixelLayout>"
                              "<rp210:RGBALayout rp210:Code='R' rp210:Depth='8'/>"
                              "<rp210:RGBALayout rp210:Code='G' rp210:Depth='8'/>"
                              "<rp210:RGBALayout rp210:Code='B' rp210:Depth='8'/>"
                              "</rp210:PixelLayout></groups:RGBADescriptor>") +
           "</AAFInfo>";
}

}  // namespace

DescriptionHost::DescriptionHost() {
    host.name(COMPID_INCFNMAEditorSettings, "editor settings");
    host.name(QTWrapper::CompID_QuickTimeWrapper, "wrapper");
    host.maker(COMPID_INCFNMAEditorSettings, [this](const GUID& iid, void** out) {
        auto* const settings = new FakeEditorSettings(editor, &journal);
        const NCFRESULT result = settings->QueryInterface(iid, out);
        settings->Release();
        return result;
    });
    host.maker(QTWrapper::CompID_QuickTimeWrapper, [this](const GUID& iid, void** out) {
        auto* const made = new FakeWrapper(wrapper, &journal);
        const NCFRESULT result = made->QueryInterface(iid, out);
        made->Release();
        return result;
    });
    Write("FourCharMapper.xml", kMapper);
    Write("AAFInfo.xml", Records());
    MakeItTheModulesFolder();
    clip.reset(new FakeClip("\\media\\a clip.mov", host, &journal));
}

DescriptionHost::~DescriptionHost() {
    clip.reset();
    ShutDownInfoRetriever();
}

void DescriptionHost::StartRetriever() {
    NCFSmartPtr<INCFComponentFactory> factory(host.factory());
    ASSERT_EQ(
        QuickTimeToAAFInfoRetriever::Init(Console(), factory, "FourCharMapper.xml", "AAFInfo.xml"),
        NCF_OK);
}

void DescriptionHost::MakeNative(const char* code) {
    clip->askRetriever = true;
    clip->code = 0;
    for (int i = 0; i < 4; ++i) {
        clip->code = clip->code << 8 | static_cast<unsigned char>(code[i]);
    }
}
