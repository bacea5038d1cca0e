// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/ClipRecords.h"

struct INCFConsole;

namespace NMA::Impl {

// Sets transfer characteristic and primaries from the codes of the movie's
// colour atom. A code without a label is told to the console and leaves the
// property absent. The library's answers do not matter here: a label is a
// courtesy.
void SetCodedColorLabels(const ColorDetails& colorDetails,
                         IAAFSmartPointer<IAAFDigitalImageDescriptor2> pDigitalImageDescriptor2,
                         NCFSmartPtr<INCFConsole> pConsole);

// Sets the transfer characteristic that the movie itself names; the primaries
// stay absent.
void SetVendorColorLabel(const ColorDetails& colorDetails,
                         IAAFSmartPointer<IAAFDigitalImageDescriptor2> pDigitalImageDescriptor2,
                         NCFSmartPtr<INCFConsole> pConsole);

}  // namespace NMA::Impl
