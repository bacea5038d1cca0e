// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamElement.h"

#include <functional>
#include <type_traits>

#include "source/parameters/model/NMAParametersVisitor.h"
#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

class ParamElement : public ParamTest {
protected:
    // Each call must find out by itself that its view was never filled.
    static void expectAllUninitialized(const std::vector<std::function<void()>>& calls) {
        for (std::size_t i = 0; i < calls.size(); ++i) {
            EXPECT_EQ(Thrown(calls[i]), NMA_E_NOTINITIALIZED) << "call " << i;
        }
    }

    NMAString text;
    GUID id{};
    bool flag = false;
    ncfUInt32 u32 = 0;
    ncfSInt32 s32 = 0;
    ncfUInt64 u64 = 0;
    ncfSInt64 s64 = 0;
    double real = 0;
    NMAParamRational ratio;
    ncfUInt32* list = nullptr;
    NMAParamComponent component;
    NMAParamTrack track;
    NMAParamInfos infos;
    NMAParamInfoGroup group;
    NMAParamInfoGroup otherGroup;
    NMAParamInfoParam param;
    NMAParamValueInfo info;
    NMAParamSet set;
    NMAParameter parameter;
};

template <class... Views>
void ExpectTableAndOnePointer() {
    const bool derived[] = {std::is_base_of_v<NMAParamElement, Views>...};
    const bool deletable[] = {std::has_virtual_destructor_v<Views>...};
    const std::size_t sizes[] = {sizeof(Views)...};
    for (std::size_t i = 0; i < sizeof...(Views); ++i) {
        EXPECT_TRUE(derived[i]) << i;
        EXPECT_TRUE(deletable[i]) << i;
        EXPECT_EQ(sizes[i], 2 * sizeof(void*)) << i;
    }
}

TEST_F(ParamElement, EveryViewIsATableAndOnePointer) {
    ExpectTableAndOnePointer<NMAParamElement, NMAParamComponent, NMAParamTrack, NMAParamInfos,
                             NMAParamInfoGroup, NMAParamInfoParam, NMAParamValueInfo, NMAParamSet,
                             NMAParameter>();
}

TEST_F(ParamElement, SuiteAndVisitorMayBeDeletedThroughTheirBases) {
    EXPECT_TRUE((std::is_base_of_v<NMAXmlDoc, NMAParameterSuite>));
    EXPECT_TRUE(std::has_virtual_destructor_v<NMAParameterSuite>);
    EXPECT_TRUE(std::has_virtual_destructor_v<NMAParametersVisitor>);
    EXPECT_EQ(sizeof(NMAParametersVisitor), 5 * sizeof(void*))
        << "a table, the factory, the object and two documents";
}

TEST_F(ParamElement, OperationsOfAnEmptyComponentThrow) {
    expectAllUninitialized({
        [&] { component.GetID(id); },
        [&] { component.GetVersion(text); },
        [&] { component.SetVersion(text); },
        [&] { component.GetShortName(text); },
        [&] { component.SetShortName(text); },
        [&] { component.GetTrackCount(); },
        [&] { component.GetTrackAt(0, track); },
        [&] { component.GetTrack(0, track); },
        [&] { component.AddTrack(0, track); },
        [&] { component.RemoveTrack(0); },
    });
}

TEST_F(ParamElement, OperationsOfAnEmptyTrackThrow) {
    expectAllUninitialized({
        [&] { track.GetNumber(u32); },
        [&] { track.GetParameterInfos(infos); },
        [&] { track.GetActiveSet(id); },
        [&] { track.SetActiveSet(id); },
        [&] { track.GetParameterSetCount(); },
        [&] { track.GetParameterSetAt(0, set); },
        [&] { track.GetParameterSet(id, set); },
        [&] { track.AddParameterSet(id, set); },
        [&] { track.RemoveParameterSet(id); },
    });
}

TEST_F(ParamElement, OperationsOfEmptyInfosThrow) {
    expectAllUninitialized({
        [&] { infos.GetVersion(text); },
        [&] { infos.SetVersion(text); },
        [&] { infos.GetExternalCount(); },
        [&] { infos.GetExternalAt(0, text, text, text); },
        [&] { infos.GetExternal(text, text, text); },
        [&] { infos.AddExternal(text, text, text); },
        [&] { infos.RemoveExternal(text); },
        [&] { infos.GetParameterCount(); },
        [&] { infos.GetParameterAt(0, param); },
        [&] { infos.GetParameter(id, param); },
        [&] { infos.AddParameter(id, param); },
        [&] { infos.RemoveParameter(id); },
        [&] { infos.GetGroupCount(); },
        [&] { infos.GetGroupAt(0, group); },
        [&] { infos.GetGroup(id, group); },
        [&] { infos.AddGroup(id, group); },
        [&] { infos.RemoveGroup(id); },
    });
}

TEST_F(ParamElement, OperationsOfAnEmptyGroupThrow) {
    expectAllUninitialized({
        [&] { group.GetID(id); },
        [&] { group.GetDisplayState(text); },
        [&] { group.SetDisplayState(text); },
        [&] { group.GetShortName(text); },
        [&] { group.SetShortName(text); },
        [&] { group.GetDescription(text); },
        [&] { group.SetDescription(text); },
        [&] { group.GetParameterCount(); },
        [&] { group.GetParameterAt(0, param); },
        [&] { group.GetParameter(id, param); },
        [&] { group.AddParameter(id, param); },
        [&] { group.RemoveParameter(id); },
        [&] { group.GetGroupCount(); },
        [&] { group.GetGroupAt(0, otherGroup); },
        [&] { group.GetGroup(id, otherGroup); },
        [&] { group.AddGroup(id, otherGroup); },
        [&] { group.RemoveGroup(id); },
    });
}

TEST_F(ParamElement, OperationsOfAnEmptyDescriptionThrow) {
    expectAllUninitialized({
        [&] { param.GetID(id); },
        [&] { param.GetShortName(text); },
        [&] { param.SetShortName(text); },
        [&] { param.GetDescription(text); },
        [&] { param.SetDescription(text); },
        [&] { param.GetValueInfo(info); },
        [&] { info.GetKind(); },
        [&] { info.SetKind(0); },
        [&] { info.GetSInt32Info(s32, s32, s32); },
        [&] { info.SetSInt32Info(0, 0, 0); },
        [&] { info.GetUInt32Info(u32, u32, u32); },
        [&] { info.SetUInt32Info(0, 0, 0); },
        [&] { info.GetSInt64Info(s64, s64, s64); },
        [&] { info.SetSInt64Info(0, 0, 0); },
        [&] { info.GetUInt64Info(u64, u64, u64); },
        [&] { info.SetUInt64Info(0, 0, 0); },
        [&] { info.GetDoubleInfo(real, real, real); },
        [&] { info.SetDoubleInfo(0, 0, 0); },
        [&] { info.GetRationalInfo(ratio, ratio, ratio); },
        [&] { info.SetRationalInfo(ratio, ratio, ratio); },
        [&] { info.GetBooleanInfo(flag, text, text); },
        [&] { info.SetBooleanInfo(flag, text, text); },
        [&] { info.GetDiscreteInfo(&list, &u32, &u32); },
        [&] { info.SetDiscreteInfo(&u32, 1, 0); },
    });
}

TEST_F(ParamElement, OperationsOfAnEmptySetThrow) {
    NMAParamInfoParam described =
        rootOf<NMAParamInfoParam>("<parameter id=\"" ID_A "\"><valueInfo/></parameter>");
    expectAllUninitialized({
        [&] { set.GetID(id); },
        [&] { set.IsReadOnly(); },
        [&] { set.SetReadOnly(true); },
        [&] { set.GetVersion(text); },
        [&] { set.SetVersion(text); },
        [&] { set.GetName(text); },
        [&] { set.SetName(text); },
        [&] { set.GetParameterCount(); },
        [&] { set.CountParameters(id); },
        [&] { set.GetParameterAt(0, parameter); },
        [&] { set.GetParameter(id, parameter); },
        [&] { set.AddParameter(described, parameter); },
        [&] { set.RemoveParameter(id); },
    });
}

TEST_F(ParamElement, OperationsOfAnEmptyParameterThrow) {
    expectAllUninitialized({
        [&] { parameter.GetID(id); },          [&] { parameter.IsSilent(); },
        [&] { parameter.SetSilent(true); },    [&] { parameter.GetSInt32(s32); },
        [&] { parameter.SetSInt32(0); },       [&] { parameter.GetUInt32(u32); },
        [&] { parameter.SetUInt32(0); },       [&] { parameter.GetSInt64(s64); },
        [&] { parameter.SetSInt64(0); },       [&] { parameter.GetUInt64(u64); },
        [&] { parameter.SetUInt64(0); },       [&] { parameter.GetDouble(real); },
        [&] { parameter.SetDouble(0); },       [&] { parameter.GetRational(ratio); },
        [&] { parameter.SetRational(ratio); }, [&] { parameter.GetBoolean(flag); },
        [&] { parameter.SetBoolean(flag); },   [&] { parameter.GetString(text); },
        [&] { parameter.SetString(text); },
    });
}

TEST_F(ParamElement, TheCodesAreTheOnesOnTheBorder) {
    EXPECT_EQ(static_cast<ncfUInt32>(NMA_E_NOTINITIALIZED), 0xA0000068u);
    EXPECT_EQ(static_cast<ncfUInt32>(NMA_E_NODATA), 0xA000006Fu);
    EXPECT_EQ(static_cast<ncfUInt32>(NCF_E_ABORT), 0x80000007u);
    EXPECT_EQ(static_cast<ncfUInt32>(NCF_E_UNEXPECTED), 0x8000FFFFu);
    EXPECT_EQ(static_cast<ncfUInt32>(NCF_E_INVALIDARG), 0x80000003u);
}

// A view holds no data: what one writes, another on the same element reads.
TEST_F(ParamElement, ViewsOnOneElementShareTheDocument) {
    NMAParameter one = rootOf<NMAParameter>("<p><valueSInt32>1</valueSInt32></p>");
    NMAParameter copy = one;
    one.SetSInt32(2);
    copy.GetSInt32(s32);
    EXPECT_EQ(s32, 2);
    copy.SetElement(nullptr);
    EXPECT_EQ(Thrown([&] { copy.GetSInt32(s32); }), NMA_E_NOTINITIALIZED);
}

}  // namespace
