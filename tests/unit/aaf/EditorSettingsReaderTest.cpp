// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/EditorSettingsReader.h"

#include "tests/unit/aaf/support/DescriptionHost.h"

namespace NMA::Impl {
namespace {

class EditorSettingsReaderTest : public DescriptionHost {
protected:
    EditorSettings Read() {
        journal.clear();
        return ReadEditorSettings(host.factory());
    }
};

TEST_F(EditorSettingsReaderTest, TakesEveryAnswerOfTheHost) {
    editor.rate = 29.97;
    editor.reservedA = 7;
    editor.reservedB = 8;
    editor.forced = 1;
    editor.forcedRate = 24.0;
    editor.single = 90;
    const EditorSettings settings = Read();
    EXPECT_EQ(settings._areSettingsValid, 1u);
    EXPECT_EQ(settings._editorFrameRate, 29.97);
    EXPECT_EQ(settings._reservedSettingA, 7u);
    EXPECT_EQ(settings._reservedSettingB, 8u);
    EXPECT_EQ(settings._forcedFrameRateEnabled, 1u);
    EXPECT_EQ(settings._forcedFrameRate, 24.0);
    EXPECT_EQ(settings._singleFrameDuration, 90u);
    EXPECT_EQ(settings._movieDurationCalculationToUse, 0u);
}

TEST_F(EditorSettingsReaderTest, AsksInItsOrderAndZeroesWhatTheHostFills) {
    Read();
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{
                                   "create editor settings", "editor GetEditorFrameRate",
                                   "editor GetForcedFrameRate", "editor GetSingleFrameDuration",
                                   "editor GetNamedSetting MovieDurationCalc zeroed"}));
}

TEST_F(EditorSettingsReaderTest, KeepsTheDefaultsWithoutTheComponentAndGoesOn) {
    host.refuseCreation(COMPID_INCFNMAEditorSettings, IID_INCFNMAEditorSettings, NCF_E_FAIL);
    const EditorSettings settings = Read();
    EXPECT_EQ(settings._areSettingsValid, 0u);
    EXPECT_EQ(settings._editorFrameRate, 0.0);
    EXPECT_EQ(settings._singleFrameDuration, 60u);
    EXPECT_TRUE(
        log.once("NCF_SKIP(0x80000008): "
                 "pComponentFactory->CreateComponent(COMPID_INCFNMAEditorSettings,NULL, "
                 "IID_INCFNMAEditorSettings, (void**)&pEditorSettings) : "
                 "NMA::Impl::NewAAFFromMovie"));
}

TEST_F(EditorSettingsReaderTest, StopsAtTheFirstRefusalButStillAsksTheNamedSetting) {
    editor.rateResult = NCF_E_FAIL;
    editor.named = 1;
    const EditorSettings settings = Read();
    EXPECT_EQ(settings._areSettingsValid, 0u);
    EXPECT_EQ(settings._editorFrameRate, 0.0);
    EXPECT_EQ(settings._movieDurationCalculationToUse, EditorSettings::kUseMovieHeader);
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"create editor settings", "editor GetEditorFrameRate",
                                        "editor GetNamedSetting MovieDurationCalc zeroed"}));
}

TEST_F(EditorSettingsReaderTest, KeepsTheRateWhenTheForcedRateFails) {
    editor.forcedResult = NCF_E_FAIL;
    const EditorSettings settings = Read();
    EXPECT_EQ(settings._areSettingsValid, 0u);
    EXPECT_EQ(settings._editorFrameRate, 25.0);
    EXPECT_EQ(journal.count("editor GetSingleFrameDuration"), 0);
}

TEST_F(EditorSettingsReaderTest, LeavesSixtyWhenTheSingleFrameDurationFails) {
    editor.singleResult = NCF_E_FAIL;
    editor.single = 5;
    const EditorSettings settings = Read();
    EXPECT_EQ(settings._areSettingsValid, 0u);
    EXPECT_EQ(settings._singleFrameDuration, 60u);
}

TEST_F(EditorSettingsReaderTest, APositiveAnswerIsNoFullSuccess) {
    for (NCFRESULT EditorAnswers::*answer :
         {&EditorAnswers::rateResult, &EditorAnswers::forcedResult, &EditorAnswers::singleResult}) {
        editor = EditorAnswers();
        editor.*answer = 1;
        EXPECT_EQ(Read()._areSettingsValid, 0u);
    }
    editor = EditorAnswers();
    editor.named = 1;
    editor.namedResult = 1;
    EXPECT_EQ(Read()._movieDurationCalculationToUse, 0u);
}

TEST_F(EditorSettingsReaderTest, OnlyTheValueOneChoosesTheMovieHeader) {
    for (const ncfUInt32 value : {0u, 2u, 0xFFFFFFFFu}) {
        editor.named = value;
        EXPECT_EQ(Read()._movieDurationCalculationToUse, 0u) << value;
    }
    editor.named = 1;
    EXPECT_EQ(Read()._movieDurationCalculationToUse, 1u);
    editor.namedResult = NCF_E_PARAMETERNOTAVAILABLE;
    EXPECT_EQ(Read()._movieDurationCalculationToUse, 0u);
}

}  // namespace
}  // namespace NMA::Impl
