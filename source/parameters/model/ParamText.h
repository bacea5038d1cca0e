// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <type_traits>

#include "host_interfaces/framework/Guid.h"
#include "host_interfaces/util/NMAString.h"

namespace NMA::XMLUtils {

// A ratio of two 64-bit numbers, as a parameter holds it: neither reduced nor
// tested for a denominator of zero.
struct NMAParamRational {
    ncfSInt64 numerator = 0;
    ncfSInt64 denominator = 0;
};

// How values stand in a parameter document.
namespace ParamText {

// Read a value from the start of a text; what stands behind it is passed over.
// NCF_E_UNEXPECTED is thrown when there is none, the output is then untouched.
// A number that is too large for its type loses its high bits.
void Read(const NMAString& text, ncfSInt32& out);
void Read(const NMAString& text, ncfUInt32& out);
void Read(const NMAString& text, ncfSInt64& out);
void Read(const NMAString& text, ncfUInt64& out);
// Does not give back what Write wrote: see the definition.
void Read(const NMAString& text, double& out);
void Read(const NMAString& text, NMAParamRational& out);
void Read(const NMAString& text, GUID& out);
// The whole text must be "true"; anything else is false, never a failure.
bool IsTrue(const NMAString& text);

template <class Whole, class = std::enable_if_t<std::is_integral_v<Whole>>>
NMAString Write(Whole value) {
    return NMAString(std::to_string(value).c_str());
}
NMAString Write(double value);
NMAString Write(const NMAParamRational& value);
NMAString Write(const GUID& value);
NMAString WriteFlag(bool value);

}  // namespace ParamText
}  // namespace NMA::XMLUtils
