// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/xml/NMAXmlNode.h"

#include <algorithm>
#include <memory>

#include "source/parameters/xml/NMAXmlElement.h"
#include "source/parameters/xml/NMAXmlLeaves.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

// An empty node of the same class, to be filled by CopyTo.
std::unique_ptr<NMAXmlNode> MakeAlike(const NMAXmlNode& node) {
    if (dynamic_cast<const NMAXmlElement*>(&node)) {
        return std::make_unique<NMAXmlElement>();
    }
    if (dynamic_cast<const NMAXmlAttribute*>(&node)) {
        return std::make_unique<NMAXmlAttribute>();
    }
    if (dynamic_cast<const NMAXmlText*>(&node)) {
        return std::make_unique<NMAXmlText>();
    }
    if (dynamic_cast<const NMAXmlCDATA*>(&node)) {
        return std::make_unique<NMAXmlCDATA>();
    }
    ThrowIfFailed(NCF_E_UNEXPECTED);
    return nullptr;
}

}  // namespace

NMAXmlNode::~NMAXmlNode() {
    deleteChildren();
}

void NMAXmlNode::setState(State state) {
    if ((state == kDeleted) != (state_ == kDeleted)) {
        CountQuietChange();
    }
    state_ = state;
}

void NMAXmlNode::deleteChildren() {
    for (NMAXmlNode* child : children_) {
        delete child;
    }
    children_.clear();
    standing_ = 0;
    hostIndexed_ = 0;
}

void NMAXmlNode::eraseChildAt(std::size_t index) {
    children_.erase(children_.begin() + static_cast<std::ptrdiff_t>(index));
    standing_ = std::min(standing_, index);
    hostIndexed_ = 0;
}

NMAXmlNode* NMAXmlNode::Wrap(IXmlNode* hostNode) {
    if (!hostNode) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    switch (hostNode->GetType()) {
        case kXmlElement:
            return new NMAXmlElement(hostNode);
        case kXmlAttribute:
            return new NMAXmlAttribute(hostNode);
        case kXmlText:
            return new NMAXmlText(hostNode);
        case kXmlCDATA:
            return new NMAXmlCDATA(hostNode);
        default:
            return nullptr;
    }
}

IXmlNode* NMAXmlNode::RequireHostNode() const {
    if (hostNode_.isNull()) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    return hostNode_.inArg();
}

void NMAXmlNode::appendWrapped(IXmlNode* hostChild) {
    std::unique_ptr<NMAXmlNode> child(Wrap(hostChild));
    if (child) {
        child->parent_ = this;
        children_.push_back(child.get());
        child.release();
    }
}

void NMAXmlNode::LoadChildren() {
    if (state_ != kUnread) {
        return;
    }
    IXmlNode* const host = RequireHostNode();
    deleteChildren();
    if (host->HasAttributes()) {
        NCFSmartPtr<IXmlAttributeList> attributes;
        ThrowIfFailed(host->GetAttributes(attributes.outArg()));
        const ncfUInt32 count = attributes->GetCount();
        for (ncfUInt32 i = 0; i < count; ++i) {
            NCFSmartPtr<IXmlNode> attribute;
            ThrowIfFailed(attributes->GetItem(i, attribute.outArg()));
            appendWrapped(attribute.inArg());
        }
    }
    const ncfUInt32 count = host->GetChildCount();
    for (ncfUInt32 i = 0; i < count; ++i) {
        NCFSmartPtr<IXmlNode> child;
        ThrowIfFailed(host->GetChild(i, child.outArg()));
        appendWrapped(child.inArg());
    }
    setState(kInStep);
}

void NMAXmlNode::SetChanged() {
    setState(kChanged);
}

void NMAXmlNode::CopyTo(NMAXmlNode& target) {
    target.Reset();
    target.hostNode_ = hostNode_;
    target.parent_ = parent_;
    target.origin_ = origin_;
    target.setState(static_cast<State>(state_));
    for (NMAXmlNode* child : children_) {
        std::unique_ptr<NMAXmlNode> copy = MakeAlike(*child);
        child->CopyTo(*copy);
        copy->parent_ = &target;
        target.children_.push_back(copy.get());
        copy.release();
    }
}

void NMAXmlNode::Reset() {
    hostNode_ = nullptr;
    setState(kUnread);
    if (parent_) {
        CountQuietChange();  // what it is filled from next has another name
    }
    deleteChildren();
}

void NMAXmlNode::MarkDeleted() {
    setState(kDeleted);
}

// Only children that are new to the list are asked who they are, unless any node
// has changed quietly: building a long list costs one look at each.
std::size_t NMAXmlNode::findHostChild(IXmlNode* hostNode) {
    if (children_.empty()) {
        return 0;
    }
    const ncfUInt64 changes = QuietChanges();
    if (hostIndexed_ == 0 || changes != hostIndexedAtChange_) {
        hostIndex_.clear();
        hostIndexed_ = 0;
        hostIndexedAtChange_ = changes;
    }
    NCFSmartPtr<INCFUnknown> identity;
    for (; hostIndexed_ < children_.size(); ++hostIndexed_) {
        if (IXmlNode* const host = children_[hostIndexed_]->HostNode()) {
            identity = nullptr;
            ThrowIfFailed(ncfQuery(host, identity));
            hostIndex_.emplace(identity.inArg(), hostIndexed_);
        }
    }
    identity = nullptr;
    ThrowIfFailed(ncfQuery(hostNode, identity));
    const auto found = hostIndex_.find(identity.inArg());
    return found == hostIndex_.end() ? children_.size() : found->second;
}

void NMAXmlNode::AddChild(NMAXmlNode* node) {
    if (!node) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    LoadChildren();
    if (node->HostNode() && findHostChild(node->HostNode()) < children_.size()) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    node->parent_ = this;
    children_.push_back(node);
    try {
        SetChanged();
    } catch (...) {
        // The node is still the caller's to delete.
        eraseChildAt(children_.size() - 1);
        node->parent_ = nullptr;
        throw;
    }
}

NMAXmlNode* NMAXmlNode::GetOrAddChildForHostNode(IXmlNode* hostNode) {
    if (!hostNode) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    LoadChildren();
    const std::size_t found = findHostChild(hostNode);
    if (found < children_.size()) {
        return children_[found];
    }
    std::unique_ptr<NMAXmlNode> child(Wrap(hostNode));
    if (!child) {
        return nullptr;
    }
    AddChild(child.get());
    return child.release();
}

void NMAXmlNode::RemoveChild(NMAXmlNode* node) {
    if (!node) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    LoadChildren();
    const auto found = std::find(children_.begin(), children_.end(), node);
    if (found != children_.end()) {
        eraseChildAt(static_cast<std::size_t>(found - children_.begin()));
        SetChanged();
    }
}

void NMAXmlNode::RemoveChildForHostNode(IXmlNode* hostNode) {
    if (!hostNode) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    LoadChildren();
    const std::size_t found = findHostChild(hostNode);
    if (found == children_.size()) {
        ThrowIfFailed(NMA_E_NODATA);
    }
    const std::unique_ptr<NMAXmlNode> child(children_[found]);
    RemoveChild(child.get());
}

void NMAXmlNode::Refresh() {
    if (state_ == kInStep) {
        return;
    }
    RequireHostNode();
    setState(kUnread);
    LoadChildren();
}

void NMAXmlNode::DiscardNewChildren() {
    LoadChildren();
    for (std::size_t i = 0; i < children_.size();) {
        if (children_[i]->origin_ == kOriginMemory) {
            delete children_[i];
            eraseChildAt(i);
        } else {
            children_[i]->DiscardNewChildren();
            ++i;
        }
    }
    setState(kInStep);
}

void NMAXmlNode::DropChildAt(std::size_t index) {
    NMAXmlNode* const child = children_[index];
    if (child->origin_ == kOriginMemory) {
        eraseChildAt(index);
        delete child;
    } else {
        child->MarkDeleted();
    }
}

void NMAXmlNode::GetNodeName(NMAString& out) {
    NCFSmartPtr<INCFString> name;
    ThrowIfFailed(RequireHostNode()->GetName(name.outArg()));
    out = NMAString(name.inArg(), kNCFUTF16);
}

void NMAXmlNode::GetNodeValue(NMAString& out) {
    NCFSmartPtr<INCFString> value;
    ThrowIfFailed(RequireHostNode()->GetValue(value.outArg()));
    out = NMAString(value.inArg(), kNCFUTF16);
}

}  // namespace NMA::XMLUtils
