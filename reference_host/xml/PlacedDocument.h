// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "reference_host/xml/EventReader.h"

namespace host {

struct PlacedAttribute {
    std::string name;
    std::string value;
    XmlPlace place;
};

// An element with all that it holds and where it stands.
struct PlacedElement {
    std::string name;
    XmlPlace place;
    std::vector<PlacedAttribute> attributes;
    std::vector<PlacedElement> elements;
    std::string text;  // the first run of text in it, white space included
};

// Why a document could not be read.
struct DocumentProblem {
    std::string text;       // empty: it could
    bool isOfFile = false;  // the file can't be read at all; else the document is wrong
    XmlPlace place;         // of what is wrong in the document
};

// Reads a whole document of no more than so many bytes; the element is its outermost one.
PlacedElement ReadPlacedDocument(const std::filesystem::path& file, std::size_t mostBytes,
                                 DocumentProblem& problem);

}  // namespace host
