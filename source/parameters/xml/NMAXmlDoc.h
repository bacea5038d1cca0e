// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "source/parameters/xml/NMAXmlElement.h"

namespace NMA::XMLUtils {

// A document: loaded or created once, then read, changed and saved. Parsing and
// printing, with escaping, layout and encoding, belong to host components.
// Failures are thrown but where an operation returns a result.
class NMAXmlDoc {
public:
    explicit NMAXmlDoc(INCFComponentFactory* factory) : factory_(factory) {}
    virtual ~NMAXmlDoc();
    NMAXmlDoc(const NMAXmlDoc&) = delete;
    NMAXmlDoc& operator=(const NMAXmlDoc&) = delete;

    void LoadFromFile(const NMAString& path);
    void LoadFromString(const NMAString& text);
    // NCF_E_INVALIDARG for an empty name, NMA_E_NOTINITIALIZED without factory,
    // NMA_E_ROOTEXISTS when there is a root.
    NCFRESULT CreateRoot(const NMAString& name);
    NMAXmlElement* GetRoot() const { return root_; }  // null before loading

    void SaveToFile(const NMAString& path);
    void SaveToString(NMAString& out);

private:
    template <class LoadInto>
    void load(LoadInto loadInto);
    void openWriter(INCFString* path);

    NMAXmlElement* root_ = nullptr;  // owned
    NCFSmartPtr<INCFComponentFactory> factory_;
    NCFSmartPtr<IXmlDocument> reader_;
    NCFSmartPtr<IXmlWriter> writer_;
};

}  // namespace NMA::XMLUtils
