// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Every call of the library that a picture descriptor makes, refused: the
// statement that is logged and the code that comes back.

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "tests/unit/aaf/support/VideoDescriptorTest.h"

namespace NMA::Impl {
namespace {

constexpr char kAddVideoDescriptor[] = "NMA::Impl::AddVideoDescriptor";

struct RefusedPictureCall {
    const char* code;
    const char* call;
    const char* statement;
};

void PrintTo(const RefusedPictureCall& refused, std::ostream* to) {
    *to << refused.call << (*refused.code ? " of " : "") << refused.code
        << (std::string(refused.statement).find("colorDetails.ref") != std::string::npos
                ? " with levels"
                : "");
}

class VideoRefusalTest : public VideoDescriptorTest,
                         public ::testing::WithParamInterface<RefusedPictureCall> {};

TEST_P(VideoRefusalTest, IsLoggedWithItsStatementAndReturned) {
    const RefusedPictureCall& refused = GetParam();
    if (*refused.code) {
        MakeNative(refused.code);
    }
    if (std::string(refused.statement).find("colorDetails.ref") != std::string::npos) {
        clip->color().refBlack = 1;
        clip->color().refWhite = 2;
    }
    aaf.refuse(refused.call, AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY, refused.statement, kAddVideoDescriptor));
}

INSTANTIATE_TEST_SUITE_P(
    EveryCall, VideoRefusalTest,
    ::testing::Values(
        RefusedPictureCall{
            "", "Dictionary.CreateInstance CDCIDescriptor",
            "pDictionary->CreateInstance(AUID_AAFCDCIDescriptor, IID_IAAFCDCIDescriptor, "
            "(IUnknown**)&pCDCIDescriptor)"},
        RefusedPictureCall{"", "CDCIDescriptor1.Initialize", "pCDCIDescriptor->Initialize()"},
        RefusedPictureCall{"", "CDCIDescriptor1.QueryInterface 44861701",
                           "pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor, (void "
                           "**)&pDigitalImageDescriptor)"},
        RefusedPictureCall{"", "CDCIDescriptor1.QueryInterface E58A8561",
                           "pCDCIDescriptor->QueryInterface(IID_IAAFFileDescriptor, (void "
                           "**)&pFileDescriptor)"},
        RefusedPictureCall{"", "CDCIDescriptor1.QueryInterface F7B9D3BE",
                           "pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2, (void "
                           "**)&pDigitalImageDescriptor2)"},
        RefusedPictureCall{
            "mpeg", "ClassDefMPEGVideoDescriptor1.CreateInstance",
            "defs.cdMPEGVideoDescriptor()->CreateInstance(IID_IAAFMPEGVideoDescriptor, "
            "(IUnknown **)&pMPEGDescriptor)"},
        RefusedPictureCall{"mpeg", "MPEGVideoDescriptor1.InitializeMPEG",
                           "pMPEGDescriptor->Initialize()"},
        RefusedPictureCall{"mpeg", "MPEGVideoDescriptor1.SetMaxGOP",
                           "pMPEGDescriptor->SetMaxGOP((aafUInt16)aafInfo.maxGOP)"},
        RefusedPictureCall{"mpeg", "MPEGVideoDescriptor1.SetBitRate",
                           "pMPEGDescriptor->SetBitRate(aafInfo.bitRate)"},
        RefusedPictureCall{"mpeg", "MPEGVideoDescriptor1.SetProfileAndLevel",
                           "pMPEGDescriptor->SetProfileAndLevel(aafInfo.levelAndProfile)"},
        RefusedPictureCall{"mpeg", "MPEGVideoDescriptor1.QueryInterface 44861703",
                           "pMPEGDescriptor->QueryInterface(IID_IAAFCDCIDescriptor, "
                           "(void**)&pCDCIDescriptor)"},
        RefusedPictureCall{
            "rgba", "ClassDefRGBADescriptor1.CreateInstance",
            "defs.cdRGBADescriptor()->CreateInstance(IID_IAAFRGBADescriptor2, (IUnknown "
            "**)&pRGBADescriptor)"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.QueryInterface 44861701",
                           "pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor, (void "
                           "**)&pDigitalImageDescriptor)"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.QueryInterface E58A8561",
                           "pRGBADescriptor->QueryInterface(IID_IAAFFileDescriptor, (void "
                           "**)&pFileDescriptor)"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.QueryInterface F7B9D3BE",
                           "pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2, (void "
                           "**)&pDigitalImageDescriptor2)"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.SetPixelLayout",
                           "pRGBADescriptor->SetPixelLayout((aafUInt32)aafInfo.pixelLayout.size(),"
                           "&aafInfo.pixelLayout[0])"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.SetComponentMinRef",
                           "pRGBADescriptor->SetComponentMinRef( aafInfo.blackRefLevel )"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.SetComponentMaxRef",
                           "pRGBADescriptor->SetComponentMaxRef( aafInfo.whiteRefLevel )"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.SetComponentMinRef",
                           "pRGBADescriptor->SetComponentMinRef( colorDetails.refBlack )"},
        RefusedPictureCall{"rgba", "RGBADescriptor1.SetComponentMaxRef",
                           "pRGBADescriptor->SetComponentMaxRef( colorDetails.refWhite )"},
        RefusedPictureCall{
            "cdci", "CDCIDescriptor1.SetFieldStartOffset",
            "pDigitalImageDescriptor2->SetFieldStartOffset( aafInfo.ImageStartOffset )"},
        RefusedPictureCall{"cdci", "CDCIDescriptor1.SetVideoLineMap",
                           "pDigitalImageDescriptor->SetVideoLineMap( "
                           "(aafUInt32)aafInfo.videoLineMapVect.size(), "
                           "(aafInt32*)&aafInfo.videoLineMapVect[0] )"},
        RefusedPictureCall{"cdci", "CDCIDescriptor1.SetComponentWidth",
                           "pCDCIDescriptor->SetComponentWidth( aafInfo.componentDepth )"},
        RefusedPictureCall{
            "cdci", "CDCIDescriptor1.SetHorizontalSubsampling",
            "pCDCIDescriptor->SetHorizontalSubsampling( aafInfo.horizontalSubsampling )"},
        RefusedPictureCall{
            "cdci", "CDCIDescriptor1.SetVerticalSubsampling",
            "pCDCIDescriptor->SetVerticalSubsampling( aafInfo.verticalSubsampling )"},
        RefusedPictureCall{
            "cdci", "CDCIDescriptor1.SetColorSiting",
            "pCDCIDescriptor->SetColorSiting( (aafColorSiting_t)aafInfo.colorSiting )"},
        RefusedPictureCall{"cdci", "CDCIDescriptor1.SetColorRange",
                           "pCDCIDescriptor->SetColorRange( aafInfo.colorRange )"},
        RefusedPictureCall{"cdci", "TypeDef1.CreateValue",
                           "SetAVCISliceCount(pHeader, pDictionary, pCDCIDescriptor, "
                           "aafInfo.sliceCounter)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetBlackReferenceLevel",
                           "pCDCIDescriptor->SetBlackReferenceLevel( colorDetails.refBlack )"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetWhiteReferenceLevel",
                           "pCDCIDescriptor->SetWhiteReferenceLevel( colorDetails.refWhite )"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetBlackReferenceLevel",
                           "pCDCIDescriptor->SetBlackReferenceLevel( aafInfo.blackRefLevel )"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetWhiteReferenceLevel",
                           "pCDCIDescriptor->SetWhiteReferenceLevel( aafInfo.whiteRefLevel )"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetCompression",
                           "pDigitalImageDescriptor->SetCompression(aafInfo.pictureEssenceCoding)"},
        RefusedPictureCall{
            "", "Dictionary.CreateInstance ContainerDef",
            "pDictionary->CreateInstance(AUID_AAFContainerDef, IID_IAAFContainerDef, "
            "(IUnknown**)&pContainerDef)"},
        RefusedPictureCall{
            "", "ContainerDef1.Initialize",
            "pContainerDef->Initialize(containerFormatUID, (const aafCharacter*)L\"\", "
            "(const aafCharacter*)L\"\")"},
        RefusedPictureCall{"", "Dictionary.RegisterContainerDef",
                           "pDictionary->RegisterContainerDef(pContainerDef)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetContainerFormat",
                           "pFileDescriptor->SetContainerFormat(pContainerDef)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetFrameLayout",
                           "pDigitalImageDescriptor->SetFrameLayout(aafInfo.frameLayout)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetStoredView",
                           "pDigitalImageDescriptor->SetStoredView(aafInfo.storedHeight, "
                           "aafInfo.storedWidth)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetSampledView",
                           "pDigitalImageDescriptor->SetSampledView(aafInfo.storedHeight, "
                           "aafInfo.sampledWidth, 0, 0)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetDisplayView",
                           "pDigitalImageDescriptor->SetDisplayView(aafInfo.displayHeight, "
                           "aafInfo.displayWidth, 0, aafInfo.displayYOffset)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetImageAspectRatio",
                           "pDigitalImageDescriptor->SetImageAspectRatio( aspectRatio )"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetSampleRate",
                           "pFileDescriptor->SetSampleRate(editRate)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetLength",
                           "pFileDescriptor->SetLength(movieLength)"},
        RefusedPictureCall{"", "CDCIDescriptor1.SetPropertyValue",
                           "PutBoxesToAAF(pDictionary, pDigitalImageDescriptor, geometryDetails)"},
        RefusedPictureCall{"", "MultipleDescriptor1.GetSampleRate",
                           "FixMultiDescSampleRate(pMultiDescriptor, editRate)"},
        RefusedPictureCall{"", "MultipleDescriptor1.AppendFileDescriptor",
                           "pMultiDescriptor->AppendFileDescriptor( pFileDescriptor )"}));

}  // namespace
}  // namespace NMA::Impl
