// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "host_interfaces/framework/EditorSettings.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/Tr1Memory.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/RecordingLogger.h"
#include "tests/unit/aaf/support/FakeClip.h"
#include "tests/unit/aaf/support/FakeServices.h"
#include "tests/unit/descriptor_data/DataHost.h"

// A host in which clips can be described: editor settings, a movie wrapper and
// two data files with one record of each kind, reached by the codes 'cdci',
// 'mpeg' and 'rgba' at 1920 x 1080. The clip's own file does not exist.
class DescriptionHost : public DataHost {
protected:
    DescriptionHost();
    ~DescriptionHost() override;

    // Loads the data files, as the first description with video does.
    void StartRetriever();
    // A clip that the data files say everything about.
    void MakeNative(const char* fourCharacters);

    NCFSmartPtr<INCFConsole> Console() { return NCFSmartPtr<INCFConsole>(&host.console()); }
    std::tr1::shared_ptr<BaseClip> Media() { return clip; }

    EditorAnswers editor;
    WrapperAnswers wrapper;
    std::tr1::shared_ptr<FakeClip> clip;
    RecordingNMALog lines{1};
};
