// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "fuzz/parameter_model/ViewWalk.h"

#include <memory>

namespace fuzz {
namespace {

using namespace NMA::XMLUtils;

constexpr ncfUInt32 kEnough = 6;

// Failures of the document are expected; anything else ends the run.
template <class Call>
void Try(Call call) {
    try {
        (void)call();
    } catch (NCFRESULT) {
    }
}

template <class List, class Item, class Parent, class Visit>
void ForSome(ncfUInt32 count, NCFRESULT (List::*at)(ncfUInt32, Item&) const, const Parent& parent,
             Visit visit) {
    for (ncfUInt32 i = 0; i < count && i < kEnough; ++i) {
        Item item;
        (parent.*at)(i, item);  // must be there: it was counted
        visit(item);
    }
}

template <class View>
void VisitNames(View& view) {
    NMAString text;
    GUID id{};
    Try([&] { return view.GetID(id); });
    Try([&] { return view.GetShortName(text); });
    Try([&] { return view.GetDescription(text); });
    Try([&] { return view.SetShortName(text); });
}

void VisitValueInfo(NMAParamValueInfo& info) {
    ncfSInt32 s32[3];
    ncfUInt32 u32[3];
    ncfSInt64 s64[3];
    ncfUInt64 u64[3];
    double real[3];
    NMAParamRational ratio[3];
    bool flag = false;
    NMAString text;
    Try([&] { return info.GetSInt32Info(s32[0], s32[1], s32[2]); });
    Try([&] { return info.GetUInt32Info(u32[0], u32[1], u32[2]); });
    Try([&] { return info.GetSInt64Info(s64[0], s64[1], s64[2]); });
    Try([&] { return info.GetUInt64Info(u64[0], u64[1], u64[2]); });
    Try([&] { return info.GetDoubleInfo(real[0], real[1], real[2]); });
    Try([&] { return info.GetRationalInfo(ratio[0], ratio[1], ratio[2]); });
    Try([&] { return info.GetBooleanInfo(flag, text, text); });
    Try([&] {
        ncfUInt32* values = nullptr;
        ncfUInt32 count = 0;
        info.GetDiscreteInfo(&values, &count, u32);
        const std::unique_ptr<ncfUInt32[]> owned(values);
        return info.SetDiscreteInfo(values, count < kEnough ? count : kEnough, u32[0]);
    });
    const ncfUInt32 kind = info.GetKind();
    info.SetKind((kind + 1) % NMA::kParamKindCount);
    Try([&] { return info.SetSInt32Info(1, 2, 3); });
}

void VisitDescription(NMAParamInfoParam& param) {
    VisitNames(param);
    Try([&] {
        NMAParamValueInfo info;
        param.GetValueInfo(info);
        VisitValueInfo(info);
        return NCF_OK;
    });
}

void VisitGroup(NMAParamInfoGroup& group) {
    VisitNames(group);
    ForSome(group.GetParameterCount(), &NMAParamInfoGroup::GetParameterAt, group, VisitDescription);
    ForSome(group.GetGroupCount(), &NMAParamInfoGroup::GetGroupAt, group, VisitGroup);
}

void VisitInfos(NMAParamInfos& infos) {
    NMAString text[3];
    for (ncfUInt32 i = 0; i < kEnough; ++i) {
        Try([&] { return infos.GetExternalAt(i, text[0], text[1], text[2]); });
    }
    Try([&] { return infos.RemoveExternal(text[0]); });
    Try([&] { return infos.AddExternal(text[0], text[1], text[2]); });
    ForSome(infos.GetParameterCount(), &NMAParamInfos::GetParameterAt, infos, VisitDescription);
    ForSome(infos.GetGroupCount(), &NMAParamInfos::GetGroupAt, infos, VisitGroup);
}

void VisitParameter(NMAParameter& parameter) {
    ncfSInt32 s32 = 0;
    ncfUInt32 u32 = 0;
    ncfSInt64 s64 = 0;
    ncfUInt64 u64 = 0;
    double real = 0;
    NMAParamRational ratio;
    bool flag = false;
    NMAString text;
    Try([&] { return parameter.IsSilent() ? 1 : 0; });
    Try([&] { return parameter.GetSInt32(s32), parameter.SetSInt32(s32); });
    Try([&] { return parameter.GetUInt32(u32), parameter.SetUInt32(u32); });
    Try([&] { return parameter.GetSInt64(s64), parameter.SetSInt64(s64); });
    Try([&] { return parameter.GetUInt64(u64), parameter.SetUInt64(u64); });
    Try([&] { return parameter.GetDouble(real), parameter.SetDouble(real); });
    Try([&] { return parameter.GetRational(ratio), parameter.SetRational(ratio); });
    Try([&] { return parameter.GetBoolean(flag), parameter.SetBoolean(flag); });
    Try([&] { return parameter.GetString(text), parameter.SetString(text); });
}

void VisitSet(NMAParamSet& set) {
    NMAString text;
    GUID id{};
    Try([&] { return set.GetName(text); });
    Try([&] { return set.IsReadOnly() ? 1 : 0; });
    ForSome(set.GetParameterCount(), &NMAParamSet::GetParameterAt, set, VisitParameter);
    Try([&] {
        NMAParameter first;
        set.GetParameterAt(0, first);
        first.GetID(id);
        return set.RemoveParameter(id);
    });
}

void VisitTrack(NMAParamTrack& track) {
    ncfUInt32 number = 0;
    GUID id{};
    NMAParamSet added;
    Try([&] { return track.GetNumber(number); });
    Try([&] { return track.GetActiveSet(id); });
    Try([&] { return track.SetActiveSet(id); });
    Try([&] {
        NMAParamInfos infos;
        track.GetParameterInfos(infos);
        VisitInfos(infos);
        return NCF_OK;
    });
    ForSome(track.GetParameterSetCount(), &NMAParamTrack::GetParameterSetAt, track, VisitSet);
    Try([&] { return track.AddParameterSet(id, added); });
}

void VisitComponent(NMAParamComponent& component) {
    NMAString text;
    NMAParamTrack added;
    GUID id{};
    Try([&] { return component.GetID(id); });
    Try([&] { return component.GetVersion(text), component.SetVersion(text); });
    ForSome(component.GetTrackCount(), &NMAParamComponent::GetTrackAt, component, VisitTrack);
    Try([&] { return component.AddTrack(0, added); });
    Try([&] { return component.RemoveTrack(1); });
}

}  // namespace

void WalkSuite(NMAParameterSuite& suite) {
    ForSome(suite.GetComponentCount(), &NMAParameterSuite::GetComponentAt, suite, VisitComponent);
    NMAString text;
    Try([&] { return suite.SaveToString(text), 0; });
}

}  // namespace fuzz
