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

constexpr char kFunction[] = "NMA::Impl::AddVideoDescriptor";

struct RefusedCall {
    const char* code;
    const char* call;
    const char* statement;
};

void PrintTo(const RefusedCall& refused, std::ostream* to) {
    *to << refused.call << (*refused.code ? " of " : "") << refused.code
        << (std::string(refused.statement).find("colorDetails.ref") != std::string::npos
                ? " with levels"
                : "");
}

class VideoRefusalTest : public VideoDescriptorTest,
                         public ::testing::WithParamInterface<RefusedCall> {};

TEST_P(VideoRefusalTest, IsLoggedWithItsStatementAndReturned) {
    const RefusedCall& refused = GetParam();
    if (*refused.code) {
        MakeNative(refused.code);
    }
    if (std::string(refused.statement).find("colorDetails.ref") != std::string::npos) {
        clip->color().refBlack = 1;
        clip->color().refWhite = 2;
    }
    aaf.refuse(refused.call, AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY, refused.statement, kFunction));
}

INSTANTIATE_TEST_SUITE_P(
    EveryCall, VideoRefusalTest,
    ::testing::Values(
        RefusedCall{"", "Dictionary.CreateInstance CDCIDescriptor",
                    "pDictionary->CreateInstance(AUID_AAFCDCIDescriptor, IID_IAAFCDCIDescriptor, "
                    "(IUnknown**)&pCDCIDescriptor)"},
        RefusedCall{"", "CDCIDescriptor1.Initialize", "pCDCIDescriptor->Initialize()"},
        RefusedCall{"", "CDCIDescriptor1.QueryInterface 44861701",
                    "pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor, (void "
                    "**)&pDigitalImageDescriptor)"},
        RefusedCall{"", "CDCIDescriptor1.QueryInterface E58A8561",
                    "pCDCIDescriptor->QueryInterface(IID_IAAFFileDescriptor, (void "
                    "**)&pFileDescriptor)"},
        RefusedCall{"", "CDCIDescriptor1.QueryInterface F7B9D3BE",
                    "pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2, (void "
                    "**)&pDigitalImageDescriptor2)"},
        RefusedCall{"mpeg", "ClassDefMPEGVideoDescriptor1.CreateInstance",
                    "defs.cdMPEGVideoDescriptor()->CreateInstance(IID_IAAFMPEGVideoDescriptor, "
                    "(IUnknown **)&pMPEGDescriptor)"},
        RefusedCall{"mpeg", "MPEGVideoDescriptor1.InitializeMPEG", "pMPEGDescriptor->Initialize()"},
        RefusedCall{"mpeg", "MPEGVideoDescriptor1.SetMaxGOP",
                    "pMPEGDescriptor->SetMaxGOP((aafUInt16)aafInfo.maxGOP)"},
        RefusedCall{"mpeg", "MPEGVideoDescriptor1.SetBitRate",
                    "pMPEGDescriptor->SetBitRate(aafInfo.bitRate)"},
        RefusedCall{"mpeg", "MPEGVideoDescriptor1.SetProfileAndLevel",
                    "pMPEGDescriptor->SetProfileAndLevel(aafInfo.levelAndProfile)"},
        RefusedCall{"mpeg", "MPEGVideoDescriptor1.QueryInterface 44861703",
                    "pMPEGDescriptor->QueryInterface(IID_IAAFCDCIDescriptor, "
                    "(void**)&pCDCIDescriptor)"},
        RefusedCall{"rgba", "ClassDefRGBADescriptor1.CreateInstance",
                    "defs.cdRGBADescriptor()->CreateInstance(IID_IAAFRGBADescriptor2, (IUnknown "
                    "**)&pRGBADescriptor)"},
        RefusedCall{"rgba", "RGBADescriptor1.QueryInterface 44861701",
                    "pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor, (void "
                    "**)&pDigitalImageDescriptor)"},
        RefusedCall{"rgba", "RGBADescriptor1.QueryInterface E58A8561",
                    "pRGBADescriptor->QueryInterface(IID_IAAFFileDescriptor, (void "
                    "**)&pFileDescriptor)"},
        RefusedCall{"rgba", "RGBADescriptor1.QueryInterface F7B9D3BE",
                    "pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2, (void "
                    "**)&pDigitalImageDescriptor2)"},
        RefusedCall{"rgba", "RGBADescriptor1.SetPixelLayout",
                    "pRGBADescriptor->SetPixelLayout((aafUInt32)aafInfo.pixelLayout.size(),"
                    "&aafInfo.pixelLayout[0])"},
        RefusedCall{"rgba", "RGBADescriptor1.SetComponentMinRef",
                    "pRGBADescriptor->SetComponentMinRef( aafInfo.blackRefLevel )"},
        RefusedCall{"rgba", "RGBADescriptor1.SetComponentMaxRef",
                    "pRGBADescriptor->SetComponentMaxRef( aafInfo.whiteRefLevel )"},
        RefusedCall{"rgba", "RGBADescriptor1.SetComponentMinRef",
                    "pRGBADescriptor->SetComponentMinRef( colorDetails.refBlack )"},
        RefusedCall{"rgba", "RGBADescriptor1.SetComponentMaxRef",
                    "pRGBADescriptor->SetComponentMaxRef( colorDetails.refWhite )"},
        RefusedCall{"cdci", "CDCIDescriptor1.SetFieldStartOffset",
                    "pDigitalImageDescriptor2->SetFieldStartOffset( aafInfo.ImageStartOffset )"},
        RefusedCall{"cdci", "CDCIDescriptor1.SetVideoLineMap",
                    "pDigitalImageDescriptor->SetVideoLineMap( "
                    "(aafUInt32)aafInfo.videoLineMapVect.size(), "
                    "(aafInt32*)&aafInfo.videoLineMapVect[0] )"},
        RefusedCall{"cdci", "CDCIDescriptor1.SetComponentWidth",
                    "pCDCIDescriptor->SetComponentWidth( aafInfo.componentDepth )"},
        RefusedCall{"cdci", "CDCIDescriptor1.SetHorizontalSubsampling",
                    "pCDCIDescriptor->SetHorizontalSubsampling( aafInfo.horizontalSubsampling )"},
        RefusedCall{"cdci", "CDCIDescriptor1.SetVerticalSubsampling",
                    "pCDCIDescriptor->SetVerticalSubsampling( aafInfo.verticalSubsampling )"},
        RefusedCall{"cdci", "CDCIDescriptor1.SetColorSiting",
                    "pCDCIDescriptor->SetColorSiting( (aafColorSiting_t)aafInfo.colorSiting )"},
        RefusedCall{"cdci", "CDCIDescriptor1.SetColorRange",
                    "pCDCIDescriptor->SetColorRange( aafInfo.colorRange )"},
        RefusedCall{"cdci", "TypeDef1.CreateValue",
                    "SetAVCISliceCount(pHeader, pDictionary, pCDCIDescriptor, "
                    "aafInfo.sliceCounter)"},
        RefusedCall{"", "CDCIDescriptor1.SetBlackReferenceLevel",
                    "pCDCIDescriptor->SetBlackReferenceLevel( colorDetails.refBlack )"},
        RefusedCall{"", "CDCIDescriptor1.SetWhiteReferenceLevel",
                    "pCDCIDescriptor->SetWhiteReferenceLevel( colorDetails.refWhite )"},
        RefusedCall{"", "CDCIDescriptor1.SetBlackReferenceLevel",
                    "pCDCIDescriptor->SetBlackReferenceLevel( aafInfo.blackRefLevel )"},
        RefusedCall{"", "CDCIDescriptor1.SetWhiteReferenceLevel",
                    "pCDCIDescriptor->SetWhiteReferenceLevel( aafInfo.whiteRefLevel )"},
        RefusedCall{"", "CDCIDescriptor1.SetCompression",
                    "pDigitalImageDescriptor->SetCompression(aafInfo.pictureEssenceCoding)"},
        RefusedCall{"", "Dictionary.CreateInstance ContainerDef",
                    "pDictionary->CreateInstance(AUID_AAFContainerDef, IID_IAAFContainerDef, "
                    "(IUnknown**)&pContainerDef)"},
        RefusedCall{"", "ContainerDef1.Initialize",
                    "pContainerDef->Initialize(containerFormatUID, (const aafCharacter*)L\"\", "
                    "(const aafCharacter*)L\"\")"},
        RefusedCall{"", "Dictionary.RegisterContainerDef",
                    "pDictionary->RegisterContainerDef(pContainerDef)"},
        RefusedCall{"", "CDCIDescriptor1.SetContainerFormat",
                    "pFileDescriptor->SetContainerFormat(pContainerDef)"},
        RefusedCall{"", "CDCIDescriptor1.SetFrameLayout",
                    "pDigitalImageDescriptor->SetFrameLayout(aafInfo.frameLayout)"},
        RefusedCall{"", "CDCIDescriptor1.SetStoredView",
                    "pDigitalImageDescriptor->SetStoredView(aafInfo.storedHeight, "
                    "aafInfo.storedWidth)"},
        RefusedCall{"", "CDCIDescriptor1.SetSampledView",
                    "pDigitalImageDescriptor->SetSampledView(aafInfo.storedHeight, "
                    "aafInfo.sampledWidth, 0, 0)"},
        RefusedCall{"", "CDCIDescriptor1.SetDisplayView",
                    "pDigitalImageDescriptor->SetDisplayView(aafInfo.displayHeight, "
                    "aafInfo.displayWidth, 0, aafInfo.displayYOffset)"},
        RefusedCall{"", "CDCIDescriptor1.SetImageAspectRatio",
                    "pDigitalImageDescriptor->SetImageAspectRatio( aspectRatio )"},
        RefusedCall{"", "CDCIDescriptor1.SetSampleRate",
                    "pFileDescriptor->SetSampleRate(editRate)"},
        RefusedCall{"", "CDCIDescriptor1.SetLength", "pFileDescriptor->SetLength(movieLength)"},
        RefusedCall{"", "CDCIDescriptor1.SetPropertyValue",
                    "PutBoxesToAAF(pDictionary, pDigitalImageDescriptor, geometryDetails)"},
        RefusedCall{"", "MultipleDescriptor1.GetSampleRate",
                    "FixMultiDescSampleRate(pMultiDescriptor, editRate)"},
        RefusedCall{"", "MultipleDescriptor1.AppendFileDescriptor",
                    "pMultiDescriptor->AppendFileDescriptor( pFileDescriptor )"}));

}  // namespace
}  // namespace NMA::Impl
