// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>

// Documents of values for a clip, as others write them.
namespace parameter_documents {

inline constexpr char kMapping[] = "0E74B673-0CA8-403B-A142-986D79508637";
inline constexpr char kSet[] = "11111111-2222-3333-4444-555555555555";
inline constexpr char kOtherSet[] = "22222222-2222-3333-4444-555555555555";

inline std::string SetXml(const char* id, const char* attributes, std::uint32_t levels,
                          const char* name = "Mine") {
    return std::string("<parameterSet id='") + id + "' " + attributes + "><name>" + name +
           "</name><parameter id='322655D5-0A56-46CA-9260-D006F719B8A4'><valueUInt32>" +
           std::to_string(levels) + "</valueUInt32></parameter></parameterSet>";
}
inline std::string DocumentXml(const std::string& content, const char* component = kMapping) {
    return std::string("<ncfComponents><component id='") + component + "'><track number='0'>" +
           content + "</track></component></ncfComponents>";
}
inline std::string InUse(const char* set) {
    return std::string("<activeSet>") + set + "</activeSet>";
}

}  // namespace parameter_documents
