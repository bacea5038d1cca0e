// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlTreeObjects.h"

#include <optional>

#include "reference_host/framework/Component.h"
#include "reference_host/framework/Guard.h"
#include "reference_host/framework/String.h"

namespace host {

namespace {

// Remembers the last place in a list of siblings, which has no index, so that reading
// one after another costs one step each.
template <class Item>
class Siblings {
public:
    explicit Siblings(Item first) : first_(first), current_(first) {}

    ncfUInt32 Count() {
        if (!count_) {
            ncfUInt32 count = 0;
            for (Item item = first_; item; item = Next(item)) {
                ++count;
            }
            count_ = count;
        }
        return *count_;
    }

    Item At(ncfUInt32 index) {
        if (index < place_ || !current_) {
            current_ = first_;
            place_ = 0;
        }
        for (; place_ < index && current_; ++place_) {
            current_ = Next(current_);
        }
        return current_;
    }

private:
    static pugi::xml_node Next(pugi::xml_node node) { return node.next_sibling(); }
    static pugi::xml_attribute Next(pugi::xml_attribute attribute) {
        return attribute.next_attribute();
    }

    Item first_;
    Item current_;
    ncfUInt32 place_ = 0;
    std::optional<ncfUInt32> count_;
};

// Counts references to an object of a tree: the last one is released under the
// tree's lock, so nobody can find an object that is about to end.
template <class... Interfaces>
class TreeObject : public Component<Interfaces...> {
public:
    TreeObject(std::shared_ptr<XmlTree> tree, const void* key)
        : tree_(std::move(tree)), key_(key) {}

    ncfUInt32 Release() override {
        const std::shared_ptr<XmlTree> tree = tree_;  // outlives this object
        const ncfUInt32 left = tree->GiveBack(key_, [this] { return this->DropReference(); });
        if (left == 0) {
            delete this;
        }
        return left;
    }

protected:
    std::shared_ptr<XmlTree> tree_;

private:
    const void* key_;
};

// The object of one of several siblings, into an interface output.
template <class Item>
NCFRESULT GiveObject(XmlTree& tree, Siblings<Item>& items, ncfUInt32 index, IXmlNode** out) {
    return Guarded([&] {
        Need(out);
        *out = nullptr;
        const Item item = items.At(index);
        Need(item, NCF_E_INVALIDARG);
        *out = tree.ObjectFor(item).Detach();
        return NCF_OK;
    });
}

// The attributes of an element, in the order of the text.
class AttributeList final : public Component<IXmlAttributeList> {
public:
    AttributeList(std::shared_ptr<XmlTree> tree, pugi::xml_node element)
        : tree_(std::move(tree)), attributes_(element.first_attribute()) {}

    ncfUInt32 GetCount() override { return attributes_.Count(); }

    NCFRESULT GetItem(ncfUInt32 index, IXmlNode** out) override {
        return GiveObject(*tree_, attributes_, index, out);
    }

private:
    std::shared_ptr<XmlTree> tree_;
    Siblings<pugi::xml_attribute> attributes_;
};

// What elements, texts and the rest have in common.
template <class... Further>
class NodeObject : public TreeObject<IXmlNode, Further...> {
public:
    NodeObject(std::shared_ptr<XmlTree> tree, pugi::xml_node node)
        : TreeObject<IXmlNode, Further...>(std::move(tree), node.internal_object()),
          node_(node),
          children_(node.first_child()) {}

    ncfBool HasAttributes() override { return node_.first_attribute() ? 1 : 0; }

    ncfUInt32 GetType() override {
        switch (node_.type()) {
            case pugi::node_element:
                return kXmlElement;
            case pugi::node_pcdata:
                return kXmlText;
            case pugi::node_cdata:
                return kXmlCDATA;
            default:
                return kXmlOther;
        }
    }

    NCFRESULT GetName(INCFString** name) override {
        switch (node_.type()) {
            case pugi::node_pcdata:
                return GiveString("#text", name);
            case pugi::node_cdata:
                return GiveString("#cdata-section", name);
            case pugi::node_comment:
                return GiveString("#comment", name);
            default:
                return GiveString(node_.name(), name);
        }
    }

    NCFRESULT GetValue(INCFString** value) override { return GiveString(node_.value(), value); }

    ncfUInt32 GetChildCount() override { return children_.Count(); }

    NCFRESULT GetChild(ncfUInt32 index, IXmlNode** out) override {
        return GiveObject(*this->tree_, children_, index, out);
    }

    // Only elements have a list, which may be empty.
    NCFRESULT GetAttributes(IXmlAttributeList** out) override {
        return Guarded([&] {
            Need(out);
            *out = nullptr;
            Need(node_.type() == pugi::node_element, NMA_E_NODATA);
            *out = MakeRef<AttributeList>(this->tree_, node_).Detach();
            return NCF_OK;
        });
    }

protected:
    pugi::xml_node node_;

private:
    Siblings<pugi::xml_node> children_;
};

class PlainObject final : public NodeObject<> {
public:
    using NodeObject<>::NodeObject;
};

class ElementObject final : public NodeObject<IXmlElement> {
public:
    using NodeObject<IXmlElement>::NodeObject;

    NCFRESULT GetTagName(INCFString** name) override { return GiveString(node_.name(), name); }
};

class AttributeObject final : public TreeObject<IXmlNode, IXmlAttribute> {
public:
    AttributeObject(std::shared_ptr<XmlTree> tree, pugi::xml_attribute attribute)
        : TreeObject(std::move(tree), attribute.internal_object()), attribute_(attribute) {}

    ncfBool HasAttributes() override { return 0; }
    ncfUInt32 GetType() override { return kXmlAttribute; }
    // These two serve both interfaces.
    NCFRESULT GetName(INCFString** name) override { return GiveString(attribute_.name(), name); }
    NCFRESULT GetValue(INCFString** value) override {
        return GiveString(attribute_.value(), value);
    }
    ncfUInt32 GetChildCount() override { return 0; }
    NCFRESULT GetChild(ncfUInt32, IXmlNode** out) override { return None(out, NCF_E_INVALIDARG); }
    NCFRESULT GetAttributes(IXmlAttributeList** out) override { return None(out, NMA_E_NODATA); }

private:
    template <class Interface>
    static NCFRESULT None(Interface** out, NCFRESULT result) {
        if (out == nullptr) {
            return NCF_E_POINTER;
        }
        *out = nullptr;
        return result;
    }

    pugi::xml_attribute attribute_;
};

}  // namespace

// Called under the tree's lock, so no reference may be given back here.

Ref<IXmlNode> MakeNodeObject(std::shared_ptr<XmlTree> tree, pugi::xml_node node) {
    if (node.type() == pugi::node_element) {
        return Ref<IXmlNode>::Adopt(new ElementObject(std::move(tree), node));
    }
    return Ref<IXmlNode>::Adopt(new PlainObject(std::move(tree), node));
}

Ref<IXmlNode> MakeAttributeObject(std::shared_ptr<XmlTree> tree, pugi::xml_attribute attribute) {
    return Ref<IXmlNode>::Adopt(new AttributeObject(std::move(tree), attribute));
}

}  // namespace host
