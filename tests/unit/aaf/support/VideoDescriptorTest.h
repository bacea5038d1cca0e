// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/aaf/VideoDescriptor.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {

// A clip with one picture that is to be described, in a file of the fake
// library. The retriever has its data files.
class VideoDescriptorTest : public AAFTest {
protected:
    VideoDescriptorTest() {
        StartRetriever();
        clip->setTiming();
    }
    NCFRESULT Add() {
        return AddVideoDescriptor(Media(), Console(), mob, header, Dictionary(), multi);
    }
    // Calls of a method on any object.
    bool Called(const std::string& method) const { return aaf.journal().contains("." + method); }

    IAAFSmartPointer<IAAFMob> mob = Make<IAAFMob>("MasterMob");
    IAAFSmartPointer<IAAFHeader> header = Make<IAAFHeader>("Header");
    IAAFSmartPointer<IAAFMultipleDescriptor> multi =
        Make<IAAFMultipleDescriptor>("MultipleDescriptor");
};

}  // namespace NMA::Impl
