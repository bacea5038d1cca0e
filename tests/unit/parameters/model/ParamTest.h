// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <ostream>
#include <string>

#include "source/parameters/model/NMAParameterSuite.h"
#include "tests/unit/parameters/xml/XmlTest.h"

namespace NMA::XMLUtils {
inline bool operator==(const NMAParamRational& left, const NMAParamRational& right) {
    return left.numerator == right.numerator && left.denominator == right.denominator;
}
inline std::ostream& operator<<(std::ostream& out, const NMAParamRational& value) {
    return out << value.numerator << "/" << value.denominator;
}
}  // namespace NMA::XMLUtils

// Identifiers with letters in them, and as they stand in a document.
inline constexpr GUID kIdA = ncfGuid("0E74B673-0CA8-403B-A142-986D79508637");
inline constexpr GUID kIdB = ncfGuid("9F9FC555-4014-11C5-8FDE-5ED45EED7C03");
inline constexpr GUID kIdC = ncfGuid("6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A");
inline constexpr GUID kIdD = ncfGuid("ABCDEF01-2345-6789-ABCD-EF0123456789");
#define ID_A "0E74B673-0CA8-403B-A142-986D79508637"
#define ID_B "9F9FC555-4014-11C5-8FDE-5ED45EED7C03"
#define ID_C "6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A"
#define ID_D "ABCDEF01-2345-6789-ABCD-EF0123456789"
#define ID_A_LOWER "0e74b673-0ca8-403b-a142-986d79508637"

// A parameter document over the reference host's XML components.
class ParamTest : public XmlTest {
protected:
    using Suite = NMA::XMLUtils::NMAParameterSuite;

    // Loads a text and gives a view on its root, whatever view is wanted:
    // views look at one element and don't ask for its name.
    template <class View>
    View rootOf(const std::string& text) {
        suite.LoadFromString(S(text.c_str()));
        View view;
        view.SetElement(suite.GetRoot());
        return view;
    }
    // The document without its declaration.
    std::string saved() {
        const std::string text = Saved(suite);
        return text.substr(text.find('\n') + 1);
    }
    // What a reader of texts gives or throws.
    template <class Read>
    static std::string textOf(Read read) {
        NMAString text;
        EXPECT_EQ(read(text), NCF_OK);
        return text.GetUTF8String();
    }

    Suite suite{host.factory()};
};
