// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstring>
#include <deque>
#include <map>
#include <memory>
#include <ostream>
#include <vector>

#include "source/descriptor_data/XMLDataContainer.h"
#include "source/descriptor_data/XMLDataPropertyValue.h"

// Keeps every repeated record of a data file as an entry, found by the text of
// its key element.
//
// The caller declares a tree of element names first. The parser never says
// that an element ends, so the declared tree alone tells where an element
// belongs: from the element met last the search goes to the element itself,
// its children, its parent, the parent's children, and so on outward.
//
//   CreateDescriptionNode, AddChild ...   declare the tree
//   SetContainerDescription               name its root
//   Element, Attribute, Text, End         one parse fills it
//   GetEntries                            then it is only read
//
// The container owns all nodes, declared and parsed. It lives as a member of
// its reader.
class GenericXMLDataContainer : public XMLDataContainer {
public:
    GenericXMLDataContainer();
    ~GenericXMLDataContainer() override;
    GenericXMLDataContainer(const GenericXMLDataContainer&) = delete;
    GenericXMLDataContainer& operator=(const GenericXMLDataContainer&) = delete;

    // Makes a node of the declared tree; the container owns it.
    NCFRESULT CreateDescriptionNode(const char* name, ncfUInt32 kind, XMLDataPropertyValue** node);
    NCFRESULT SetContainerDescription(XMLDataPropertyValue* parent);

    // What the parse calls. A document that breaks the declared tree throws.
    void Start() override;
    void End() override;
    void Element(const NMAString& tag) override;
    void Text(const NMAString& text) override;
    void Attribute(const NMAString& name, const NMAString& value) override;

    // Appends the root of every entry with this key, in file order.
    void GetEntries(const char* key, std::vector<XMLDataPropertyValue*>* entries) const;
    // Writes all entries for a person to read.
    void Dump(std::ostream& stream) const;

    // All entries in the order of their keys, as Dump shows them.
    struct KeyLess {
        using is_transparent = void;  // a search needs no key, only its text

        template <class Left, class Right>
        bool operator()(Left left, Right right) const {
            return std::strcmp(TextOf(left), TextOf(right)) < 0;
        }
        static const char* TextOf(const char* text) { return text; }
        static const char* TextOf(const XMLDataPropertyValue* key) { return key->ValueText(); }
    };
    using Entries = std::multimap<XMLDataPropertyValue*, XMLDataPropertyValue*, KeyLess>;
    const Entries& AllEntries() const { return entries_; }

private:
    bool FindValueParent(XMLDataPropertyValue** valueParent) const;
    XMLDataPropertyValue* MakeValueNode(const XMLDataPropertyDescription* description);
    void AddValueElement(const XMLDataPropertyDescription* description,
                         XMLDataPropertyValue* valueParent);
    void AddKeyElement(const XMLDataPropertyDescription* description,
                       XMLDataPropertyValue* valueParent);
    void AddEntryElement(const XMLDataPropertyDescription* description);
    void AddEntry();

    XMLDataPropertyValue* containerDescription_ = nullptr;  // root of the declared tree
    XMLDataPropertyValue* openEntry_ = nullptr;             // root of the entry being read
    XMLDataPropertyValue* currentKey_ = nullptr;            // key node met last
    XMLDataPropertyValue* currentValue_ = nullptr;          // value node met last
    XMLDataPropertyValue* currentDescription_ = nullptr;    // declared node met last
    bool expectText_ = false;                               // the next text is a value
    bool entryOpen_ = false;
    Entries entries_;
    std::deque<XMLDataPropertyValue> valueNodes_;  // of the parse; they stay where they are
    std::vector<std::unique_ptr<XMLDataPropertyValue>> descriptionNodes_;
    std::vector<std::unique_ptr<XMLDataPropertyDescription>> descriptions_;
};
