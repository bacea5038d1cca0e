// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/xml/NMAXmlDoc.h"

#include <memory>

#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {

NMAXmlDoc::~NMAXmlDoc() {
    delete root_;
}

template <class LoadInto>
void NMAXmlDoc::load(LoadInto loadInto) {
    if (factory_.isNull()) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    ThrowIfFailed(ncfCreate(factory_.inArg(), kCLSID_XmlDocument, kIID_XmlDocument, reader_));
    ThrowIfFailed(loadInto(*reader_.inArg()));
    NCFSmartPtr<INCFUnknown> rootUnknown;
    ThrowIfFailed(reader_->GetRootNode(rootUnknown.outArg()));
    NCFSmartPtr<IXmlNode> rootNode;
    ThrowIfFailed(ncfQuery(rootUnknown.inArg(), kIID_XmlNode, rootNode));
    std::unique_ptr<NMAXmlNode> wrapped(NMAXmlNode::Wrap(rootNode.inArg()));
    auto* const element = dynamic_cast<NMAXmlElement*>(wrapped.get());
    if (!element) {
        ThrowIfFailed(NCF_E_FAIL);
    }
    delete root_;
    root_ = element;
    wrapped.release();
}

void NMAXmlDoc::LoadFromFile(const NMAString& path) {
    load([&](IXmlDocument& reader) { return reader.Load(path.InArg()); });
}

void NMAXmlDoc::LoadFromString(const NMAString& text) {
    load([&](IXmlDocument& reader) { return reader.LoadFromText(text.InArg()); });
}

NCFRESULT NMAXmlDoc::CreateRoot(const NMAString& name) {
    if (name.IsEmpty()) {
        return NCF_E_INVALIDARG;
    }
    if (factory_.isNull()) {
        return NMA_E_NOTINITIALIZED;
    }
    if (root_) {
        return NMA_E_ROOTEXISTS;
    }
    auto root = std::make_unique<NMAXmlElement>();
    root->SetTagName(name);
    root_ = root.release();
    return NCF_OK;
}

void NMAXmlDoc::openWriter(INCFString* path) {
    if (factory_.isNull() || !root_) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    ThrowIfFailed(ncfCreate(factory_.inArg(), kCLSID_XmlWriter, kIID_XmlWriter, writer_));
    ThrowIfFailed(writer_->Open(path));
    ThrowIfFailed(root_->WriteTo(writer_.inArg()));
}

void NMAXmlDoc::SaveToFile(const NMAString& path) {
    openWriter(path.InArg());
    ThrowIfFailed(writer_->Close());
}

void NMAXmlDoc::SaveToString(NMAString& out) {
    openWriter(nullptr);
    NCFSmartPtr<INCFString> text;
    ThrowIfFailed(writer_->GetText(text.outArg()));
    out = NMAString(text.inArg(), kNCFUTF16);
}

}  // namespace NMA::XMLUtils
