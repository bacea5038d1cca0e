// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/ColorLabels.h"

#include "host_interfaces/framework/Console.h"

namespace NMA::Impl {
namespace {

struct CodedLabel {
    ncfUInt32 code;
    aafUID_t label;
};

constexpr CodedLabel kTransferLabels[] = {
    {1, ncfGuid("04010101-0102-0000-060E-2B3404010101")},
    {7, ncfGuid("04010101-0103-0000-060E-2B3404010101")},
};

constexpr CodedLabel kPrimariesLabels[] = {
    {1, ncfGuid("04010101-0303-0000-060E-2B3404010106")},
    {6, ncfGuid("04010101-0301-0000-060E-2B3404010106")},
};

template <std::size_t Count>
const aafUID_t* FindLabel(const CodedLabel (&labels)[Count], ncfUInt32 code) {
    for (const CodedLabel& entry : labels) {
        if (entry.code == code) {
            return &entry.label;
        }
    }
    return nullptr;
}

}  // namespace

void SetCodedColorLabels(const ColorDetails& colorDetails,
                         IAAFSmartPointer<IAAFDigitalImageDescriptor2> pDigitalImageDescriptor2,
                         NCFSmartPtr<INCFConsole> pConsole) {
    if (const aafUID_t* label = FindLabel(kTransferLabels, colorDetails.transferFunction)) {
        pDigitalImageDescriptor2->SetTransferCharacteristic(*label);
    } else {
        pConsole->Write(2, "Color transfer characteristics information unavailable\n");
    }
    if (const aafUID_t* label = FindLabel(kPrimariesLabels, colorDetails.colorPrimaries)) {
        pDigitalImageDescriptor2->SetColorPrimaries(*label);
    } else {
        pConsole->Write(2, "Color primaries information unavailable\n");
    }
}

void SetVendorColorLabel(const ColorDetails& colorDetails,
                         IAAFSmartPointer<IAAFDigitalImageDescriptor2> pDigitalImageDescriptor2,
                         NCFSmartPtr<INCFConsole> /*pConsole*/) {
    pDigitalImageDescriptor2->SetTransferCharacteristic(colorDetails.transferCharacteristicUID);
}

}  // namespace NMA::Impl
