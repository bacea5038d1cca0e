// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "reference_host/data_check/Findings.h"
#include "reference_host/xml/PlacedDocument.h"

namespace data_check {

// A value of an entry, which is written as an attribute or as a child element.
struct Item {
    std::string value;
    host::XmlPlace place;
    const host::PlacedElement* element = nullptr;  // none: it is an attribute
};

// Which numbers a value may be.
struct NumberRule {
    const char* name;
    bool (*accepts)(std::uint32_t);
    const char* accepted;  // in words
    bool isMandatory;
};

// Reads items of one document and tells what is wrong with them.
class EntryReader {
public:
    EntryReader(DataFile file, Findings& findings) : file_(file), findings_(findings) {}

    void Tell(host::XmlPlace place, std::string what, std::string hint) const {
        findings_.Tell(file_, place, std::move(what), std::move(hint));
    }
    // The only item of a name. Without one, with several, or with one that can't be a value, that
    // is told, and nothing given.
    std::optional<Item> One(const host::PlacedElement& parent, const char* name,
                            const std::string& hint) const;
    // The number of an item; nothing where it lacks, which is told where it must not, or is wrong.
    std::optional<std::uint32_t> Number(const host::PlacedElement& parent,
                                        const NumberRule& rule) const;
    // The same of an item that is there.
    std::optional<std::uint32_t> NumberOf(const Item& item, const NumberRule& rule) const;
    // The only child of a name. The same.
    const host::PlacedElement* OneChild(const host::PlacedElement& parent, const char* name,
                                        const std::string& hint) const;
    // Tells attributes and children that are none of these. To be called before the others: that
    // one of these lacks which was mistyped so, they do not tell.
    void CheckNames(const host::PlacedElement& parent, const std::vector<const char*>& known);

private:
    // Whether nothing keeps an item from being a value; what does is told.
    bool IsSound(const Item& item, const char* name) const;
    std::optional<std::uint32_t> CheckedNumber(const Item& item, const NumberRule& rule) const;

    void TellLack(const host::PlacedElement& parent, const char* name,
                  const std::string& hint) const;

    DataFile file_;
    Findings& findings_;
    // Names that were mistyped, and in what.
    std::set<std::pair<const host::PlacedElement*, std::string>> meant_ = {};
};

// A value for a text about it, in which it is cut where it is long.
std::string Shown(const std::string& text);
std::vector<Item> ItemsOf(const host::PlacedElement& parent, std::string_view name);
// A whole number as the module compares it: no sign, no zeros before it.
std::optional<std::uint32_t> NumberIn(const std::string& text);
// Whether the module can find a record by this id: it writes ids as signed numbers.
bool IsId(std::uint32_t number);
// The entries of a name in a document, which may be one itself; like the module, in other elements
// too. What else stands beside them is told.
std::vector<const host::PlacedElement*> EntriesOf(const host::PlacedElement& root, const char* name,
                                                  const EntryReader& reader);

}  // namespace data_check
