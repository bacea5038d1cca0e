// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace host::parameter_names {

// Words of the documents. Attributes and texts that are shared stand once.
inline constexpr char kRoot[] = "ncfComponents";
inline constexpr char kComponent[] = "component";
inline constexpr char kTrack[] = "track";
inline constexpr char kNumber[] = "number";
inline constexpr char kId[] = "id";
inline constexpr char kVersion[] = "version";
inline constexpr char kName[] = "name";
inline constexpr char kShortName[] = "shortName";
inline constexpr char kDescription[] = "description";

inline constexpr char kInfos[] = "parameterInfos";
inline constexpr char kGroup[] = "parameterGroup";
inline constexpr char kDisplayState[] = "displayState";
inline constexpr char kParameter[] = "parameter";
inline constexpr char kValueInfo[] = "valueInfo";
inline constexpr char kDiscreteInfo[] = "valueInfoDiscrete";
inline constexpr char kDefault[] = "default";
inline constexpr char kDiscrete[] = "discrete";
inline constexpr char kValue[] = "value";

inline constexpr char kRuleSet[] = "displayRuleSet";
inline constexpr char kRule[] = "displayRule";
inline constexpr char kCondition[] = "ifCondition";
inline constexpr char kConditionValue[] = "ifValue";
inline constexpr char kOperation[] = "operation";
inline constexpr char kEnable[] = "enable";
inline constexpr char kDisable[] = "disable";
inline constexpr char kShow[] = "show";
inline constexpr char kHide[] = "hide";

inline constexpr char kActiveSet[] = "activeSet";
inline constexpr char kSet[] = "parameterSet";
inline constexpr char kReadOnly[] = "readOnly";
inline constexpr char kSilent[] = "silent";
inline constexpr char kTrue[] = "true";
inline constexpr char kFalse[] = "false";
inline constexpr char kValueUInt32[] = "valueUInt32";
inline constexpr char kValueDiscrete[] = "valueDiscrete";

// The default of a list of choices that has none: no list holds it.
inline constexpr unsigned kNoDefault = 0xFFFFFFFFu;

}  // namespace host::parameter_names
