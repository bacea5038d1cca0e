// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Clips on several threads at once, in a real host: to be run under a thread
// sanitizer.

#include <gtest/gtest.h>

#include <thread>

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/framework/Host.h"
#include "reference_host/util/Ref.h"
#include "reference_host/xml/RegisterXmlComponents.h"
#include "source/descriptor_data/GenericDocHandler.h"
#include "source/descriptor_data/IGenericDocHandler.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/PluginFolder.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/unit/descriptor_data/FakePicture.h"

namespace {

constexpr ncfUInt32 kXdvc = 0x78647663;
constexpr ncfUInt32 kDvc = 0x64766320;

// Describes clips of one code; gives the number of wrong answers.
int DescribeMany(INCFComponentFactory* factory, ncfUInt32 code, ncfUInt32 width, ncfUInt32 height,
                 bool isMPEG) {
    int wrong = 0;
    for (int i = 0; i < 20; ++i) {
        wrong += QuickTimeToAAFInfoRetriever::Init(nullptr, factory, "FourCharMapper.xml",
                                                   "AAFInfo.xml") != NCF_OK;
        FakePicture clip;
        clip.code = code;
        clip.width = width;
        clip.height = height;
        clip.layout = 1;
        AAFInfo info;
        ncfUInt32 id = 0;
        QuickTimeToAAFInfoRetriever* const retriever = QuickTimeToAAFInfoRetriever::GetInstance();
        wrong += retriever->GetInfoFromImageDescription(&clip, &info, &id) != NCF_OK;
        wrong += retriever->IsMPEGDescriptor() != isMPEG;
        wrong += info.displayHeight != height / 2;
    }
    return wrong;
}

TEST(RetrieverThreads, EachClipGetsItsOwnAnswerAndFlag) {
    host::Host host;
    host::RegisterXmlComponents(host);
    host.RegisterComponent(kCLSID_GenericDocHandler,
                           CreateInstanceOf<NMA::Impl::GenericDocHandler>);
    ASSERT_GE(NMAInitialize(&host.factory()), 0);
    INCFString* const folder = MakeHostString(SHIPPED_DATA_FOLDER "/");
    SetPluginFolder(folder);
    folder->Release();

    int wrong[4] = {};
    std::thread threads[4];
    for (int i = 0; i < 4; ++i) {
        threads[i] = std::thread([&host, &place = wrong[i], isMPEG = i % 2 == 0] {
            place = isMPEG ? DescribeMany(&host.factory(), kXdvc, 1920, 1080, true)
                           : DescribeMany(&host.factory(), kDvc, 720, 480, false);
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    for (const int count : wrong) {
        EXPECT_EQ(count, 0);
    }
    ShutDownInfoRetriever();
    SetPluginFolder(nullptr);
    NMATerminate();
}

}  // namespace
