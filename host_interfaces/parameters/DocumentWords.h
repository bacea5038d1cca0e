// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

// Words of the document in which parameters travel between host and module:
//
//     ncfComponents
//       component @id              version, shortName
//         track @number            activeSet
//           parameterInfos         version, external*
//             parameter @id        shortName, description, valueInfo, displayRuleSet
//             parameterGroup @id   ..., parameter*, parameterGroup*
//           parameterSet @id       version, name
//             parameter @id        one value element
//
// Users keep such documents, so no word ever changes.
namespace NMA {

inline constexpr char kParamRoot[] = "ncfComponents";
inline constexpr char kParamComponent[] = "component";
inline constexpr char kParamTrack[] = "track";
inline constexpr char kParamInfos[] = "parameterInfos";
inline constexpr char kParamExternal[] = "external";
inline constexpr char kParamFileNameExtension[] = "fileNameExtension";
inline constexpr char kParamGroupItem[] = "parameterGroup";
inline constexpr char kParamItem[] = "parameter";
inline constexpr char kParamSetItem[] = "parameterSet";
inline constexpr char kParamActiveSet[] = "activeSet";
inline constexpr char kParamVersion[] = "version";
inline constexpr char kParamShortName[] = "shortName";
inline constexpr char kParamName[] = "name";
inline constexpr char kParamDescription[] = "description";
inline constexpr char kParamValueInfo[] = "valueInfo";
inline constexpr char kParamDiscrete[] = "discrete";

inline constexpr char kParamId[] = "id";
inline constexpr char kParamNumber[] = "number";
inline constexpr char kParamDisplayState[] = "displayState";
inline constexpr char kParamReadOnly[] = "readOnly";
inline constexpr char kParamSilent[] = "silent";
inline constexpr char kParamMax[] = "max";
inline constexpr char kParamMin[] = "min";
inline constexpr char kParamDefault[] = "default";
inline constexpr char kParamTrueString[] = "trueString";
inline constexpr char kParamFalseString[] = "falseString";
inline constexpr char kParamValue[] = "value";

// Rules by which the value of one parameter enables another.
inline constexpr char kParamRuleSet[] = "displayRuleSet";
inline constexpr char kParamRule[] = "displayRule";
inline constexpr char kParamCondition[] = "ifCondition";
inline constexpr char kParamConditionValue[] = "ifValue";
inline constexpr char kParamOperation[] = "operation";
inline constexpr char kParamEnable[] = "enable";
inline constexpr char kParamDisable[] = "disable";

// Values of attributes.
inline constexpr char kParamShow[] = "show";
inline constexpr char kParamHide[] = "hide";
inline constexpr char kParamTrue[] = "true";
inline constexpr char kParamFalse[] = "false";

// Kinds of values.
enum NMAParamKind : ncfUInt32 {
    kParamKindSInt32 = 0,
    kParamKindUInt32 = 1,
    kParamKindSInt64 = 2,
    kParamKindUInt64 = 3,
    kParamKindDouble = 4,
    kParamKindDiscrete = 5,
    kParamKindRational = 6,
    kParamKindBoolean = 7,
    kParamKindOpaque = 8,
    kParamKindString = 9,
    kParamKindLabel = 10,
};
inline constexpr ncfUInt32 kParamKindCount = 11;

// The element that describes a kind and the one that holds a value of it, by
// the kind's number.
struct NMAParamKindNames {
    const char* info;
    const char* value;
};
inline constexpr NMAParamKindNames kParamKindNames[kParamKindCount] = {
    {"valueInfoSInt32", "valueSInt32"},     {"valueInfoUInt32", "valueUInt32"},
    {"valueInfoSInt64", "valueSInt64"},     {"valueInfoUInt64", "valueUInt64"},
    {"valueInfoDouble", "valueDouble"},     {"valueInfoDiscrete", "valueDiscrete"},
    {"valueInfoRational", "valueRational"}, {"valueInfoBoolean", "valueBoolean"},
    {"valueInfoOpaque", "valueOpaque"},     {"valueInfoString", "valueString"},
    {"valueInfoLabel", "valueLabel"},
};

}  // namespace NMA
