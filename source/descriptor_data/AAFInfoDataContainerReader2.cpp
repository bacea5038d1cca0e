// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Finding an entry, and the forms in which its values are read.

#include "source/descriptor_data/AAFInfoDataContainerReader2.h"

#include <string>

#include "source/descriptor_data/DataRecord.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/TextToNumber.h"

namespace {

// Gives the number of a child and whether it is there; else `value` stays.
bool ReadNumber(const XMLDataPropertyValue* parent, const char* name, ncfUInt32* value) {
    XMLDataPropertyValue* node = nullptr;
    if (parent->FindPropertyInChildren(name, &node) != NCF_OK) {
        return false;
    }
    *value = TextToNumber(node->ValueText());
    return true;
}

// An entry may describe fields where the movie has frames or the reverse, and
// pictures whose few topmost lines are cut.
bool HeightFits(ncfUInt32 height, ncfUInt32 entryHeight) {
    return height == entryHeight || height * 2 == entryHeight || height / 2 == entryHeight ||
           height - 3 == entryHeight || height - 6 == entryHeight;
}

}  // namespace

AAFInfoDataContainerReader2::AAFInfoDataContainerReader2(const GenericXMLDataContainer* container,
                                                         ncfUInt32 vcid, const Rational& editRate,
                                                         ncfUInt32 width, ncfUInt32 height)
    : container_(container),
      m_curVCID(vcid),
      editRate_(editRate),
      m_curWidth(width),
      m_curHeight(height) {}

NCFRESULT AAFInfoDataContainerReader2::GetMediaDescriptorSignature(ncfUInt32 vcid, ncfUInt32 width,
                                                                   ncfUInt32 height) {
    const std::array<ncfUInt32, 3> wanted = {vcid, width, height};
    if (found_ == wanted) {
        return NCF_OK;
    }
    found_.reset();
    std::vector<XMLDataPropertyValue*> entries;
    container_->GetEntries(std::to_string(static_cast<ncfSInt32>(vcid)).c_str(), &entries);
    for (XMLDataPropertyValue* entry : entries) {
        if (!FindDescriptor(entry)) {
            DataRecord(kDataNotice, "AAFInfoDataContainerReader2::GetMediaDescriptorSignature")
                << "unknown video description!";
            return NCF_E_NOTSUPPORTED;
        }
        if (DescriptorFits(width, height, entries.size() == 1)) {
            signature_ = entry;
            found_ = wanted;
            return NCF_OK;
        }
    }
    return NCF_E_NOTSUPPORTED;
}

bool AAFInfoDataContainerReader2::FindDescriptor(const XMLDataPropertyValue* entry) {
    isMPEG2_ = false;
    isRGBA_ = false;
    if (entry->FindPropertyInChildren("groups:CDCIDescriptor", &descriptor_) == NCF_OK) {
        return true;
    }
    if (entry->FindPropertyInChildren("groups:MPEG2VideoDescriptor", &descriptor_) == NCF_OK) {
        isMPEG2_ = true;
        return true;
    }
    if (entry->FindPropertyInChildren("groups:RGBADescriptor", &descriptor_) == NCF_OK) {
        isRGBA_ = true;
        return true;
    }
    return false;
}

// What a viewer sees counts before what is stored.
bool AAFInfoDataContainerReader2::DescriptorFits(ncfUInt32 width, ncfUInt32 height,
                                                 bool isOnlyEntry) const {
    ncfUInt32 entryHeight = 0;
    if (!ReadNumber(descriptor_, "rp210:DisplayHeight", &entryHeight) &&
        !ReadNumber(descriptor_, "rp210:StoredHeight", &entryHeight)) {
        return false;
    }
    ncfUInt32 storedWidth = 0;
    ncfUInt32 sampledWidth = 0;
    const bool hasStored = ReadNumber(descriptor_, "rp210:StoredWidth", &storedWidth);
    const bool hasSampled = ReadNumber(descriptor_, "rp210:SampledWidth", &sampledWidth);
    if (!hasStored && !hasSampled) {
        return false;
    }
    return (isOnlyEntry || HeightFits(height, entryHeight)) &&
           (width == storedWidth || width == sampledWidth);
}

NCFRESULT AAFInfoDataContainerReader2::GetUID(const char* name, aafUID_t* outUID) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetUID");
    NCF_RETURN(GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight));
    return GetUIDImpl(descriptor_, name, outUID);
}

NCFRESULT AAFInfoDataContainerReader2::GetOneProperty(const char* name, NMAString* outString) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetOneProperty");
    NCF_RETURN(GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight));
    return GetOnePropertyImpl(descriptor_, name, outString);
}

NCFRESULT AAFInfoDataContainerReader2::GetOneProperty(const char* name, ncfUInt32* elementValue) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetOneProperty");
    CHK_PTR(elementValue);
    NMAString text;
    const NCFRESULT result = GetOneProperty(name, &text);
    if (result >= 0) {
        *elementValue = TextToNumber(text.GetUTF8String());
    }
    return result;
}

NCFRESULT AAFInfoDataContainerReader2::GetTwoProperties(const char* name, const char* subName1,
                                                        const char* subName2,
                                                        ncfUInt32* elementValue1,
                                                        ncfUInt32* elementValue2) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetTwoProperties");
    NCF_RETURN(GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight));
    return GetTwoPropertiesImpl(descriptor_, name, subName1, subName2, elementValue1,
                                elementValue2);
}

NCFRESULT AAFInfoDataContainerReader2::IsDescriptorMPEG2(bool* isMPEG2) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::IsDescriptorMPEG2");
    CHK_INARG(isMPEG2);
    NCF_RETURN(GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight));
    *isMPEG2 = isMPEG2_;
    return NCF_OK;
}

NCFRESULT AAFInfoDataContainerReader2::IsDescriptorRGBA(bool* isRGBA) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::IsDescriptorRGBA");
    CHK_INARG(isRGBA);
    NCF_RETURN(GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight));
    *isRGBA = isRGBA_;
    return NCF_OK;
}

NCFRESULT GetOnePropertyImpl(const XMLDataPropertyValue* pMediaDescriptorNode, const char* name,
                             NMAString* elementValue) {
    NCF_FUNCTION("GetOnePropertyImpl");
    CHK_INARG(pMediaDescriptorNode);
    XMLDataPropertyValue* valueNode = nullptr;
    if (pMediaDescriptorNode->FindPropertyInChildren(name, &valueNode) != NCF_OK) {
        DataRecord(kDataNotice, ncfFunction) << "NCF_E_PARAMETERNOTAVAILABLE: " << name;
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    NCF_RETURN(valueNode->GetValue(elementValue));
    return NCF_OK;
}

NCFRESULT GetTwoPropertiesImpl(const XMLDataPropertyValue* pMediaDescriptorNode, const char* name,
                               const char* subName1, const char* subName2, ncfUInt32* elementValue1,
                               ncfUInt32* elementValue2) {
    NCF_FUNCTION("GetTwoPropertiesImpl");
    CHK_INARG(elementValue1);
    CHK_INARG(elementValue2);
    CHK_INARG(pMediaDescriptorNode);
    XMLDataPropertyValue* propertyNode = nullptr;
    if (pMediaDescriptorNode->FindPropertyInChildren(name, &propertyNode) != NCF_OK) {
        return NCF_E_NOTSUPPORTED;
    }
    XMLDataPropertyValue* subProperty1Node = nullptr;
    if (propertyNode->FindPropertyInChildren(subName1, &subProperty1Node) != NCF_OK) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    NMAString subProperty1ValueString;
    NCF_RETURN(subProperty1Node->GetValue(&subProperty1ValueString));
    *elementValue1 = TextToNumber(subProperty1ValueString.GetUTF8String());
    XMLDataPropertyValue* property2Node = nullptr;
    if (propertyNode->FindPropertyInChildren(subName2, &property2Node) != NCF_OK) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    NMAString property2ValueString;
    NCF_RETURN(property2Node->GetValue(&property2ValueString));
    *elementValue2 = TextToNumber(property2ValueString.GetUTF8String());
    return NCF_OK;
}
