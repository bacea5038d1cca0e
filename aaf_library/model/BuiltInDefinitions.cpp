// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/BuiltIn.h"

// The definitions that a new dictionary holds.
namespace aaf {

namespace {

// clang-format off
constexpr BuiltInDefinition kDataDefinitions[] = {
    {ncfGuid("01030202-0100-0000-060E-2B3404010101"), "DataDef_Picture", "Picture data"},
    {ncfGuid("6F3C8CE1-6CEF-11D2-807D-006008143E6F"), "DataDef_LegacyPicture", "Picture data (legacy)"},
    {ncfGuid("05CBA731-1DAA-11D3-80AD-006008143E6F"), "DataDef_Matte", "Matte data"},
    {ncfGuid("05CBA732-1DAA-11D3-80AD-006008143E6F"), "DataDef_PictureWithMatte", "Picture and Matte data"},
    {ncfGuid("01030202-0200-0000-060E-2B3404010101"), "DataDef_Sound", "Sound data"},
    {ncfGuid("78E1EBE1-6CEF-11D2-807D-006008143E6F"), "DataDef_LegacySound", "Sound data (legacy)"},
    {ncfGuid("01030201-0100-0000-060E-2B3404010101"), "DataDef_Timecode", "Timecode data"},
    {ncfGuid("7F275E81-77E5-11D2-807F-006008143E6F"), "DataDef_LegacyTimecode", "Timecode data (legacy)"},
    {ncfGuid("D2BB2AF0-D234-11D2-89EE-006097116212"), "DataDef_Edgecode", "Edgecode data"},
    {ncfGuid("01030201-1000-0000-060E-2B3404010101"), "DataDef_DescriptiveMetadata", "Descriptive metadata"},
    {ncfGuid("01030203-0100-0000-060E-2B3404010105"), "DataDef_Auxiliary", "Auxiliary data"},
};

constexpr BuiltInDefinition kContainerDefinitions[] = {
    {ncfGuid("0D010301-0201-0101-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_50Mbps_DefinedTemplate", ""},
    {ncfGuid("0D010301-0201-0201-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_50Mbps_DefinedTemplate", ""},
    {ncfGuid("0D010301-0201-0301-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_40Mbps_DefinedTemplate", ""},
    {ncfGuid("0D010301-0201-0401-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_40Mbps_DefinedTemplate", ""},
    {ncfGuid("0D010301-0201-0501-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_30Mbps_DefinedTemplate", ""},
    {ncfGuid("0D010301-0201-0601-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_30Mbps_DefinedTemplate", ""},
    {ncfGuid("0D010301-0201-0102-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_50Mbps_ExtendedTemplate", ""},
    {ncfGuid("0D010301-0201-0202-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_50Mbps_ExtendedTemplate", ""},
    {ncfGuid("0D010301-0201-0302-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_40Mbps_ExtendedTemplate", ""},
    {ncfGuid("0D010301-0201-0402-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_40Mbps_ExtendedTemplate", ""},
    {ncfGuid("0D010301-0201-0502-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_30Mbps_ExtendedTemplate", ""},
    {ncfGuid("0D010301-0201-0602-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_30Mbps_ExtendedTemplate", ""},
    {ncfGuid("0D010301-0201-017F-060E-2B3404010102"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_50Mbps_PictureOnly", ""},
    {ncfGuid("0D010301-0201-027F-060E-2B3404010102"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_50Mbps_PictureOnly", ""},
    {ncfGuid("0D010301-0201-037F-060E-2B3404010102"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_40Mbps_PictureOnly", ""},
    {ncfGuid("0D010301-0201-047F-060E-2B3404010102"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_40Mbps_PictureOnly", ""},
    {ncfGuid("0D010301-0201-057F-060E-2B3404010102"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_625x50I_30Mbps_PictureOnly", ""},
    {ncfGuid("0D010301-0201-067F-060E-2B3404010102"), "ContainerDef_MXFGC_Framewrapped_SMPTE_D10_525x5994I_30Mbps_PictureOnly", ""},
    {ncfGuid("0D010301-0202-0101-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_IECDV_525x5994I_25Mbps", ""},
    {ncfGuid("0D010301-0202-0201-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_IECDV_625x50I_25Mbps", ""},
    {ncfGuid("0D010301-0202-0301-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_IECDV_525x5994I_25Mbps_SMPTE322M", ""},
    {ncfGuid("0D010301-0202-0401-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_IECDV_625x50I_25Mbps_SMPTE322M", ""},
    {ncfGuid("0D010301-0202-3F01-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_IECDV_UndefinedSource_25Mbps", ""},
    {ncfGuid("0D010301-0202-4001-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_525x5994I_25Mbps", ""},
    {ncfGuid("0D010301-0202-4101-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_625x50I_25Mbps", ""},
    {ncfGuid("0D010301-0202-5001-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_525x5994I_50Mbps", ""},
    {ncfGuid("0D010301-0202-5101-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_625x50I_50Mbps", ""},
    {ncfGuid("0D010301-0202-6001-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_1080x5994I_100Mbps", ""},
    {ncfGuid("0D010301-0202-6101-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_1080x50I_100Mbps", ""},
    {ncfGuid("0D010301-0202-6201-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_720x5994P_100Mbps", ""},
    {ncfGuid("0D010301-0202-6301-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_720x50P_100Mbps", ""},
    {ncfGuid("0D010301-0202-7F01-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_DVbased_UndefinedSource", ""},
    {ncfGuid("0D010301-0202-0102-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_IECDV_525x5994I_25Mbps", ""},
    {ncfGuid("0D010301-0202-0202-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_IECDV_625x50I_25Mbps", ""},
    {ncfGuid("0D010301-0202-0302-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_IECDV_525x5994I_25Mbps_SMPTE322M", ""},
    {ncfGuid("0D010301-0202-0402-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_IECDV_625x50I_25Mbps_SMPTE322M", ""},
    {ncfGuid("0D010301-0202-3F02-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_IECDV_UndefinedSource_25Mbps", ""},
    {ncfGuid("0D010301-0202-4002-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_525x5994I_25Mbps", ""},
    {ncfGuid("0D010301-0202-4102-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_625x50I_25Mbps", ""},
    {ncfGuid("0D010301-0202-5002-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_525x5994I_50Mbps", ""},
    {ncfGuid("0D010301-0202-5102-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_625x50I_50Mbps", ""},
    {ncfGuid("0D010301-0202-6002-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_1080x5994I_100Mbps", ""},
    {ncfGuid("0D010301-0202-6102-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_1080x50I_100Mbps", ""},
    {ncfGuid("0D010301-0202-6202-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_720x5994P_100Mbps", ""},
    {ncfGuid("0D010301-0202-6302-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_720x50P_100Mbps", ""},
    {ncfGuid("0D010301-0202-7F02-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_DVbased_UndefinedSource", ""},
    {ncfGuid("0D010301-0204-6001-060E-2B3404010102"), "ContainerDef_MXFGC_Framewrapped_MPEGES_VideoStream0_SID", ""},
    {ncfGuid("0D010301-0204-6107-060E-2B3404010102"), "ContainerDef_MXFGC_CustomClosedGOPwrapped_MPEGES_VideoStream1_SID", ""},
    {ncfGuid("0D010301-0205-0101-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_Uncompressed_525x5994I_720_422", ""},
    {ncfGuid("0D010301-0205-0102-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_Uncompressed_525x5994I_720_422", ""},
    {ncfGuid("0D010301-0205-0103-060E-2B3404010101"), "ContainerDef_MXFGC_Linewrapped_Uncompressed_525x5994I_720_422", ""},
    {ncfGuid("0D010301-0205-0105-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_Uncompressed_625x50I_720_422", ""},
    {ncfGuid("0D010301-0205-0106-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_Uncompressed_625x50I_720_422", ""},
    {ncfGuid("0D010301-0205-0107-060E-2B3404010101"), "ContainerDef_MXFGC_Linewrapped_Uncompressed_625x50I_720_422", ""},
    {ncfGuid("0D010301-0205-0119-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_Uncompressed_525x5994P_960_422", ""},
    {ncfGuid("0D010301-0205-011A-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_Uncompressed_525x5994P_960_422", ""},
    {ncfGuid("0D010301-0205-011B-060E-2B3404010101"), "ContainerDef_MXFGC_Linewrapped_Uncompressed_525x5994P_960_422", ""},
    {ncfGuid("0D010301-0205-011D-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_Uncompressed_625x50P_960_422", ""},
    {ncfGuid("0D010301-0205-011E-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_Uncompressed_625x50P_960_422", ""},
    {ncfGuid("0D010301-0205-011F-060E-2B3404010101"), "ContainerDef_MXFGC_Linewrapped_Uncompressed_625x50P_960_422", ""},
    {ncfGuid("0D010301-0206-0100-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_Broadcast_Wave_audio_data", ""},
    {ncfGuid("0D010301-0206-0200-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_Broadcast_Wave_audio_data", ""},
    {ncfGuid("0D010301-0206-0300-060E-2B3404010101"), "ContainerDef_MXFGC_Framewrapped_AES3_audio_data", ""},
    {ncfGuid("0D010301-0206-0400-060E-2B3404010101"), "ContainerDef_MXFGC_Clipwrapped_AES3_audio_data", ""},
    {ncfGuid("0D010301-020A-0100-060E-2B3404010103"), "ContainerDef_MXFGC_Framewrapped_Alaw_Audio", ""},
    {ncfGuid("0D010301-020A-0200-060E-2B3404010103"), "ContainerDef_MXFGC_Clipwrapped_Alaw_Audio", ""},
    {ncfGuid("0D010301-020A-0300-060E-2B3404010103"), "ContainerDef_MXFGC_Customwrapped_Alaw_Audio", ""},
    {ncfGuid("0D010301-0210-6002-060E-2B340401010A"), "ContainerDef_MXFGC_Clipwrapped_AVCbytestream_VideoStream0_SID", ""},
    {ncfGuid("0D010301-0211-0100-060E-2B340401010A"), "ContainerDef_MXFGC_Framewrapped_VC3", ""},
    {ncfGuid("0D010301-0211-0200-060E-2B340401010A"), "ContainerDef_MXFGC_Clipwrapped_VC3", ""},
    {ncfGuid("0D010301-0212-0100-060E-2B340401010A"), "ContainerDef_MXFGC_Framewrapped_VC1", ""},
    {ncfGuid("0D010301-0212-0200-060E-2B340401010A"), "ContainerDef_MXFGC_Clipwrapped_VC1", ""},
    {ncfGuid("0D010301-027F-0100-060E-2B3404010103"), "ContainerDef_MXFGC_Generic_Essence_Multiple_Mappings", ""},
    {ncfGuid("0E040301-0206-0101-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0101", ""},
    {ncfGuid("0E040301-0206-0201-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0201", ""},
    {ncfGuid("0E040301-0206-0301-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0301", ""},
    {ncfGuid("0E040301-0206-0102-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0102", ""},
    {ncfGuid("0E040301-0206-0202-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0202", ""},
    {ncfGuid("0E040301-0206-0302-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0302", ""},
    {ncfGuid("0E040301-0206-0103-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0103", ""},
    {ncfGuid("0E040301-0206-0203-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0203", ""},
    {ncfGuid("0E040301-0206-0303-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0303", ""},
    {ncfGuid("0E040301-0206-0104-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0104", ""},
    {ncfGuid("0E040301-0206-0204-060E-2B3404010101"), "ContainerDef_MXFGC_0E040301_0206_0204", ""},
    {ncfGuid("0D011301-0101-0100-060E-2B3404010106"), "ContainerDef_RIFFWAVE", ""},
    {ncfGuid("0D011301-0102-0200-060E-2B3404010107"), "ContainerDef_JFIF", ""},
    {ncfGuid("0D011301-0104-0100-060E-2B3404010106"), "ContainerDef_AIFFAIFC", ""},
    {ncfGuid("42464141-000D-4D4F-060E-2B34010101FF"), "ContainerDef_AAFMSS", ""},
    {ncfGuid("4B464141-000D-4D4F-060E-2B34010101FF"), "ContainerDef_AAFKLV", ""},
    {ncfGuid("58464141-000D-4D4F-060E-2B34010101FF"), "ContainerDef_AAFXML", ""},
    {ncfGuid("4B1C1A46-03F2-11D4-80FB-006008143E6F"), "ContainerDef_OMF", ""},
    {ncfGuid("4313B571-D8BA-11D2-809B-006008143E6F"), "ContainerDef_AAF", ""},
    {ncfGuid("4313B572-D8BA-11D2-809B-006008143E6F"), "ContainerDef_External", ""},
};
// clang-format on

}  // namespace

Span<BuiltInDefinition> BuiltInDataDefinitions() {
    return kDataDefinitions;
}

Span<BuiltInDefinition> BuiltInContainerDefinitions() {
    return kContainerDefinitions;
}

}  // namespace aaf
