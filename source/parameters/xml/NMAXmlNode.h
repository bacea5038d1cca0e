// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>
#include <unordered_map>
#include <vector>

#include "host_interfaces/util/NMAString.h"
#include "host_interfaces/xml/XmlDocument.h"
#include "host_interfaces/xml/XmlWriter.h"
#include "source/plugin/NCFSmartPtr.h"

namespace NMA::XMLUtils {

// A node of a lazy, editable mirror of an XML document. Reading belongs to a
// host component, which yields host nodes; a mirror node reads its children
// from its host node when they are first asked for. Changes stay in the mirror,
// which is written out as a whole.
//
// Failures are thrown as results; operations that return a result say so.
// A document belongs to one thread at a time: reading changes the tree too.
class NMAXmlNode {
public:
    enum State : ncfUInt32 {
        kUnread = 0,   // wraps a host node; children not read yet
        kInStep = 1,   // children read and as the host has them
        kChanged = 2,  // changed in memory
        kNew = 3,      // made in memory
        kDeleted = 4,  // stays in the list, skipped when written
    };
    static constexpr ncfUInt32 kOriginHost = 0;
    static constexpr ncfUInt32 kOriginMemory = 3;

    virtual ~NMAXmlNode();  // deletes the children
    NMAXmlNode(const NMAXmlNode&) = delete;
    NMAXmlNode& operator=(const NMAXmlNode&) = delete;

    // Reads the children from the host node, once. Attributes come first.
    virtual void LoadChildren();
    virtual void SetChanged();
    // Fills `target`, which is of the same class, from this node.
    virtual void CopyTo(NMAXmlNode& target);
    // Drops the host node and the children.
    virtual void Reset();
    virtual void MarkDeleted();
    // Appends a child and takes it over; a failure leaves it with the caller.
    virtual void AddChild(NMAXmlNode* node);
    // The child that wraps a host node, made on demand.
    virtual NMAXmlNode* GetOrAddChildForHostNode(IXmlNode* hostNode);
    // Takes a child out of the list and gives it to the caller. A node that is
    // no child is passed over.
    virtual void RemoveChild(NMAXmlNode* node);
    // The same by host node, and deletes the child.
    virtual void RemoveChildForHostNode(IXmlNode* hostNode);
    // Reads the children again, unless they are in step.
    virtual void Refresh();
    // Drops what was made in memory, here and below.
    virtual void DiscardNewChildren();
    // Sends the node to the host's writer.
    virtual NCFRESULT WriteTo(IXmlWriter* writer) = 0;
    virtual void GetNodeName(NMAString& out);
    virtual void GetNodeValue(NMAString& out);

    // Wraps a host node in the class of its kind; null for a kind that has
    // none, such as a comment. The caller owns the node.
    static NMAXmlNode* Wrap(IXmlNode* hostNode);

    IXmlNode* HostNode() const { return hostNode_.inArg(); }
    ncfUInt32 Origin() const { return origin_; }
    ncfUInt32 GetState() const { return state_; }
    NMAXmlNode* Parent() const { return parent_; }
    void SetParent(NMAXmlNode* parent) { parent_ = parent; }
    const std::vector<NMAXmlNode*>& Children() const { return children_; }

protected:
    NMAXmlNode() : origin_(kOriginMemory), state_(kNew) {}
    explicit NMAXmlNode(IXmlNode* hostNode)
        : hostNode_(hostNode), origin_(kOriginHost), state_(kUnread) {}

    // Whether a stored text stands, rather than the host's.
    bool HoldsOwnText() const { return origin_ == kOriginMemory || state_ == kChanged; }
    // The host node. Throws NMA_E_NOTINITIALIZED without one.
    IXmlNode* RequireHostNode() const;
    // Deletes a child made in memory; marks one of the host as deleted.
    void DropChildAt(std::size_t index);

    // How often, in all documents, a child got another name or came to be deleted
    // or was brought back. Its parent isn't told, and may be gone: what a parent
    // remembers about its children holds while this stays.
    static ncfUInt64 QuietChanges() { return quietChanges_.load(std::memory_order_relaxed); }
    static void CountQuietChange() { quietChanges_.fetch_add(1, std::memory_order_relaxed); }

    NCFSmartPtr<IXmlNode> hostNode_;
    std::vector<NMAXmlNode*> children_;  // owned
    // How many of the first children stand where a derived class last saw them.
    std::size_t standing_ = 0;
    ncfUInt32 origin_;
    ncfUInt32 state_;
    NMAXmlNode* parent_ = nullptr;

private:
    void setState(State state);
    void deleteChildren();
    void appendWrapped(IXmlNode* hostChild);
    void eraseChildAt(std::size_t index);
    std::size_t findHostChild(IXmlNode* hostNode);

    // First places of the first children by the identity of their host nodes.
    std::unordered_map<INCFUnknown*, std::size_t> hostIndex_;
    std::size_t hostIndexed_ = 0;
    ncfUInt64 hostIndexedAtChange_ = 0;  // QuietChanges() when it was made

    inline static std::atomic<ncfUInt64> quietChanges_{0};
};

}  // namespace NMA::XMLUtils
