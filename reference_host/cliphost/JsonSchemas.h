// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace cliphost::schema {

// What each verb's JSON says of itself: the name of its file in docs/json_schema/ and the version,
// which goes up with every change of the form. The README there says how.
inline constexpr char kScan[] = "scan/1.0";
inline constexpr char kDescribe[] = "describe/1.2";
inline constexpr char kSamples[] = "samples/1.0";
inline constexpr char kFormats[] = "formats/1.0";
inline constexpr char kDump[] = "dump/1.0";
inline constexpr char kCompare[] = "compare/1.1";
inline constexpr char kVerify[] = "verify/1.0";
inline constexpr char kRelink[] = "relink/1.0";
inline constexpr char kContactLine[] = "contact_line/1.0";
inline constexpr char kCatalogLine[] = "catalog_line/1.0";
inline constexpr char kFind[] = "find/1.0";
inline constexpr char kReport[] = "report/1.0";
inline constexpr char kTypes[] = "types/1.0";
inline constexpr char kParams[] = "params/1.0";
inline constexpr char kPlugin[] = "plugin/1.0";
inline constexpr char kCheckData[] = "check-data/1.0";
inline constexpr char kValidate[] = "validate/1.0";

inline constexpr char kMember[] = "schema";  // the first one of an answer

}  // namespace cliphost::schema
