// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>

#include "host_interfaces/xml/XmlWriter.h"
#include "reference_host/framework/Component.h"

namespace host {

// The XML writer component. Texts come out escaped, without added white space,
// as UTF-8 with a declaration. Names that XML doesn't know and characters that
// it has no place for are refused with NCF_E_INVALIDARG, and so is a parent
// that is not open; the document stays as it was then.
class XmlWriter final : public Component<IXmlWriter> {
public:
    XmlWriter();
    ~XmlWriter() override;

    // Starts afresh, whatever was written before.
    NCFRESULT Open(INCFString* path) override;
    // NMA_E_NODATA without a root, and no file is made; NCF_E_HANDLE when the
    // file can't be written.
    NCFRESULT Close() override;
    NCFRESULT GetText(INCFString** text) override;
    // NCF_E_FAIL once the element has content, NMA_E_ALREADYSET for a second
    // attribute of one name.
    NCFRESULT Attribute(INCFString* element, INCFString* name, INCFString* value) override;
    // NMA_E_ROOTEXISTS for a second root.
    NCFRESULT Element(INCFString* name, INCFString* parent) override;
    NCFRESULT Text(INCFString* text, INCFString* parent) override;

private:
    struct Tree;

    std::unique_ptr<Tree> tree_;  // null before Open
    std::filesystem::path file_;  // empty: in memory
    bool isClosed_ = false;
};

}  // namespace host
