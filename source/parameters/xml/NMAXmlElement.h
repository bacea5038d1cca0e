// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "source/parameters/xml/NMAXmlNode.h"

namespace NMA::XMLUtils {

class NMAXmlAttribute;

// A name and a value to select elements by; both zero-terminated.
struct NMAXmlPair {
    const wchar_t* name;
    const wchar_t* value;
};

// An element. Its attributes stand in one list with its other children.
class NMAXmlElement final : public NMAXmlNode {
public:
    NMAXmlElement() = default;
    explicit NMAXmlElement(IXmlNode* hostNode) : NMAXmlNode(hostNode) {}

    void LoadChildren() override;
    void SetChanged() override;
    void CopyTo(NMAXmlNode& target) override;
    void DiscardNewChildren() override;
    NCFRESULT WriteTo(IXmlWriter* writer) override;

    void GetTagName(NMAString& out);
    // For elements made in memory; others throw NCF_E_UNEXPECTED.
    void SetTagName(const NMAString& name);

    // The texts of the children, joined; CDATA sections do not count.
    void GetText(NMAString& out);
    // Replaces all texts by one.
    void SetText(const NMAString& text);
    void AddText(const NMAString& text);

    bool HasAttribute(const NMAString& name);
    NMAXmlAttribute* FindAttribute(const NMAString& name);  // null when absent
    // Throws NMA_E_NODATA when absent.
    void GetAttribute(const NMAString& name, NMAString& out);
    void SetAttribute(const NMAString& name, const NMAString& value);
    void RemoveAttribute(const NMAString& name);
    void GetAttributes(std::vector<NMAXmlNode*>& out);
    void GetNonAttributes(std::vector<NMAXmlNode*>& out);

    // Element children by name, in order; an empty name is any. Deleted ones
    // count. `index` counts the matches from 0; null when there are fewer.
    ncfUInt32 CountChildren(const NMAString& name);
    NMAXmlElement* FindChild(const NMAString& name, ncfUInt32 index);
    void CollectChildren(const NMAString& name, std::vector<NMAXmlElement*>& out);
    void RemoveChildren(const NMAString& name);

    // The same among those whose attributes equal all pairs, case folded.
    ncfUInt32 CountChildrenWithAttributes(const NMAString& name, const NMAXmlPair* pairs,
                                          ncfSInt32 count);
    NMAXmlElement* FindChildWithAttributes(const NMAString& name, const NMAXmlPair* pairs,
                                           ncfSInt32 count, ncfUInt32 index);
    void CollectChildrenWithAttributes(const NMAString& name, const NMAXmlPair* pairs,
                                       ncfSInt32 count, std::vector<NMAXmlElement*>& out);
    void RemoveChildrenWithAttributes(const NMAString& name, const NMAXmlPair* pairs,
                                      ncfSInt32 count);

    // The same among those of which a child has the text of any pair.
    ncfUInt32 CountChildrenWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                        ncfSInt32 count);
    NMAXmlElement* FindChildWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                         ncfSInt32 count, ncfUInt32 index);
    void CollectChildrenWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                     ncfSInt32 count, std::vector<NMAXmlElement*>& out);
    void RemoveChildrenWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                    ncfSInt32 count);

    void AddChildElement(const NMAString& name, NMAXmlElement** out);
    void AddChildElementWithText(const NMAString& name, const NMAString& text);

    // All pairs equal; true for no pairs.
    bool MatchesAttributes(const NMAXmlPair* pairs, ncfSInt32 count, ncfBool caseSensitive);
    // Any pair equal; true for no pairs.
    bool MatchesChildren(const NMAXmlPair* pairs, ncfSInt32 count, ncfBool caseSensitive);

private:
    template <class Wanted>
    std::vector<NMAXmlElement*> select(const NMAString& name, Wanted wanted);
    template <class Wanted>
    void remove(const NMAString& name, Wanted wanted);
    static bool isNamed(NMAXmlElement& element, const NMAString& name);
    void rebuildAttributeIndex();

    std::map<std::string, std::size_t> attributeIndex_;  // name to place in the list
    std::size_t indexed_ = 0;                            // how many of the first children it covers
    ncfUInt64 indexedAtChange_ = 0;                      // QuietChanges() when it was made
    // The child that FindChild gave last: going through all by their indexes
    // steps from one to the next. Forgotten with every change.
    struct Found {
        NMAString name;
        ncfUInt32 index;
        std::size_t place;
        ncfUInt64 atChange;  // QuietChanges() at that time
    };
    std::optional<Found> found_;
    NMAString tagName_;
};

}  // namespace NMA::XMLUtils
