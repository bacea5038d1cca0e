// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Selecting an element's element children by name, attributes and texts.

#include <cwctype>
#include <string>

#include "host_interfaces/util/NMAStringUtils.h"
#include "source/parameters/xml/NMAXmlElement.h"
#include "source/parameters/xml/NMAXmlLeaves.h"

namespace NMA::XMLUtils {
namespace {

std::wstring Folded(const wchar_t* text, ncfBool caseSensitive) {
    std::wstring folded = text ? text : L"";
    if (!caseSensitive) {
        for (wchar_t& c : folded) {
            c = static_cast<wchar_t>(std::towlower(static_cast<std::wint_t>(c)));
        }
    }
    return folded;
}

bool AreEqual(const NMAString& text, const wchar_t* value, ncfBool caseSensitive) {
    return Folded(text.GetWCHARString(), caseSensitive) == Folded(value, caseSensitive);
}

NMAString NameOf(const NMAXmlPair& pair) {
    return NMAStringUtils::CreateWCharNMAString(pair.name ? pair.name : L"", -1);
}

bool AnyElement(NMAXmlElement&) {
    return true;
}

// Selects by attributes, and by the texts of children: case never counts.
auto ByAttributes(const NMAXmlPair* pairs, ncfSInt32 count) {
    return [=](NMAXmlElement& element) { return element.MatchesAttributes(pairs, count, 0); };
}
auto ByChildren(const NMAXmlPair* pairs, ncfSInt32 count) {
    return [=](NMAXmlElement& element) { return element.MatchesChildren(pairs, count, 0); };
}

NMAXmlElement* At(const std::vector<NMAXmlElement*>& found, ncfUInt32 index) {
    return index < found.size() ? found[index] : nullptr;
}

void Append(const std::vector<NMAXmlElement*>& found, std::vector<NMAXmlElement*>& out) {
    out.insert(out.end(), found.begin(), found.end());
}

ncfUInt32 SizeOf(const std::vector<NMAXmlElement*>& found) {
    return static_cast<ncfUInt32>(found.size());
}

}  // namespace

bool NMAXmlElement::isNamed(NMAXmlElement& element, const NMAString& name) {
    NMAString tag;
    element.GetTagName(tag);
    return name.IsEmpty() || tag == name;
}

template <class Wanted>
std::vector<NMAXmlElement*> NMAXmlElement::select(const NMAString& name, Wanted wanted) {
    std::vector<NMAXmlElement*> selected;
    LoadChildren();
    for (NMAXmlNode* child : children_) {
        auto* const element = dynamic_cast<NMAXmlElement*>(child);
        if (element && isNamed(*element, name) && wanted(*element)) {
            selected.push_back(element);
        }
    }
    return selected;
}

template <class Wanted>
void NMAXmlElement::remove(const NMAString& name, Wanted wanted) {
    std::vector<NMAXmlElement*> unwanted = select(name, wanted);
    if (unwanted.empty()) {
        return;
    }
    // They stand in the list's order, so the last of them is met first.
    for (std::size_t i = children_.size(); i-- > 0 && !unwanted.empty();) {
        if (children_[i] == unwanted.back()) {
            DropChildAt(i);
            unwanted.pop_back();
        }
    }
    SetChanged();
}

ncfUInt32 NMAXmlElement::CountChildren(const NMAString& name) {
    return SizeOf(select(name, AnyElement));
}

NMAXmlElement* NMAXmlElement::FindChild(const NMAString& name, ncfUInt32 index) {
    LoadChildren();
    const bool goesOn = found_ && found_->atChange == QuietChanges() && found_->index <= index &&
                        found_->name == name;
    ncfUInt32 matches = goesOn ? found_->index : 0;
    for (std::size_t place = goesOn ? found_->place : 0; place < children_.size(); ++place) {
        auto* const element = dynamic_cast<NMAXmlElement*>(children_[place]);
        if (!element || !isNamed(*element, name)) {
            continue;
        }
        if (matches == index) {
            found_ = Found{name, index, place, QuietChanges()};
            return element;
        }
        ++matches;
    }
    return nullptr;
}

void NMAXmlElement::CollectChildren(const NMAString& name, std::vector<NMAXmlElement*>& out) {
    Append(select(name, AnyElement), out);
}

void NMAXmlElement::RemoveChildren(const NMAString& name) {
    remove(name, AnyElement);
}

ncfUInt32 NMAXmlElement::CountChildrenWithAttributes(const NMAString& name, const NMAXmlPair* pairs,
                                                     ncfSInt32 count) {
    return SizeOf(select(name, ByAttributes(pairs, count)));
}

NMAXmlElement* NMAXmlElement::FindChildWithAttributes(const NMAString& name,
                                                      const NMAXmlPair* pairs, ncfSInt32 count,
                                                      ncfUInt32 index) {
    return At(select(name, ByAttributes(pairs, count)), index);
}

void NMAXmlElement::CollectChildrenWithAttributes(const NMAString& name, const NMAXmlPair* pairs,
                                                  ncfSInt32 count,
                                                  std::vector<NMAXmlElement*>& out) {
    Append(select(name, ByAttributes(pairs, count)), out);
}

void NMAXmlElement::RemoveChildrenWithAttributes(const NMAString& name, const NMAXmlPair* pairs,
                                                 ncfSInt32 count) {
    remove(name, ByAttributes(pairs, count));
}

ncfUInt32 NMAXmlElement::CountChildrenWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                                   ncfSInt32 count) {
    return SizeOf(select(name, ByChildren(pairs, count)));
}

NMAXmlElement* NMAXmlElement::FindChildWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                                    ncfSInt32 count, ncfUInt32 index) {
    return At(select(name, ByChildren(pairs, count)), index);
}

void NMAXmlElement::CollectChildrenWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                                ncfSInt32 count, std::vector<NMAXmlElement*>& out) {
    Append(select(name, ByChildren(pairs, count)), out);
}

void NMAXmlElement::RemoveChildrenWithChildren(const NMAString& name, const NMAXmlPair* pairs,
                                               ncfSInt32 count) {
    remove(name, ByChildren(pairs, count));
}

bool NMAXmlElement::MatchesAttributes(const NMAXmlPair* pairs, ncfSInt32 count,
                                      ncfBool caseSensitive) {
    if (!pairs || count < 1) {
        return true;
    }
    for (ncfSInt32 i = 0; i < count; ++i) {
        NMAXmlAttribute* const attribute = FindAttribute(NameOf(pairs[i]));
        if (!attribute) {
            return false;
        }
        NMAString value;
        attribute->GetNodeValue(value);
        if (!AreEqual(value, pairs[i].value, caseSensitive)) {
            return false;
        }
    }
    return true;
}

bool NMAXmlElement::MatchesChildren(const NMAXmlPair* pairs, ncfSInt32 count,
                                    ncfBool caseSensitive) {
    if (!pairs || count < 1) {
        return true;
    }
    for (ncfSInt32 i = 0; i < count; ++i) {
        for (NMAXmlElement* child : select(NameOf(pairs[i]), AnyElement)) {
            NMAString text;
            child->GetText(text);
            if (AreEqual(text, pairs[i].value, caseSensitive)) {
                return true;
            }
        }
    }
    return false;
}

}  // namespace NMA::XMLUtils
