// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Universal labels of the data file as identifiers of an AAF file.

#include <cstdio>
#include <cstring>

#include "source/descriptor_data/AAFInfoDataContainerReader2.h"
#include "source/plugin/ResultChecks.h"

namespace {

constexpr int kLabelText = 36;  // as printed, with hyphens
constexpr int kLabelBytes = 16;

// The sixteen bytes as printed. Hyphens may stand anywhere; what is missing is
// zero.
void ReadLabel(const char* text, unsigned char (&label)[kLabelBytes]) {
    char pair[3] = {};
    int digits = 0;
    int written = 0;
    for (int i = 0; i < kLabelText && text[i] && text[i] != '\n' && written < kLabelBytes; ++i) {
        if (text[i] == '-') {
            continue;
        }
        pair[digits++] = text[i];
        if (digits == 2) {
            unsigned value = label[written];
            if (std::sscanf(pair, "%02x", &value) == 1) {
                label[written] = static_cast<unsigned char>(value);
            }
            ++written;
            digits = 0;
        }
    }
}

// Bytes joined as signed numbers: one of 0x80 or above sets every bit above
// it. Descriptors have always been made so, and readers compare them.
ncfUInt32 JoinSigned(const unsigned char* bytes, int count) {
    ncfUInt32 joined = 0;
    for (int i = 0; i < count; ++i) {
        const auto extended = static_cast<ncfUInt32>(static_cast<ncfSInt8>(bytes[i]));
        joined |= extended << (8 * (count - 1 - i));
    }
    return joined;
}

}  // namespace

// The halves change places: the second half of the label makes the three
// numbers, the first half the eight bytes.
NCFRESULT GetUIDImpl(const XMLDataPropertyValue* pMediaDescriptorNode, const char* name,
                     aafUID_t* outUID) {
    NCF_FUNCTION("GetUIDImpl");
    CHK_INARG(pMediaDescriptorNode);
    CHK_INARG(outUID);
    XMLDataPropertyValue* node = nullptr;
    if (pMediaDescriptorNode->FindPropertyInChildren(name, &node) != NCF_OK) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    unsigned char label[kLabelBytes] = {};
    ReadLabel(node->ValueText(), label);
    std::memcpy(outUID->Data4, label, sizeof outUID->Data4);
    outUID->Data1 = JoinSigned(label + 8, 4);
    outUID->Data2 = static_cast<ncfUInt16>(JoinSigned(label + 12, 2));
    outUID->Data3 = static_cast<ncfUInt16>(JoinSigned(label + 14, 2));
    return NCF_OK;
}
