// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlDocument.h"

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/xml/InputFile.h"
#include "reference_host/xml/XmlLimits.h"
#include "reference_host/xml/XmlTree.h"
#include "text/Encodings.h"

namespace host {

NCFRESULT XmlDocument::Load(INCFString* path) {
    tree_.reset();
    return Guarded([&]() -> NCFRESULT {
        std::filesystem::path file;
        Check(PathFrom(path, file));
        std::string bytes;
        std::string problem;
        Check(ReadInputFile(
            file,
            [&](const char* piece, std::size_t size, bool) {
                bytes.append(piece, size);
                return NCF_OK;
            },
            problem));
        NCFRESULT result = NCF_OK;
        tree_ = XmlTree::Load(bytes, nullptr, result);
        return result;
    });
}

NCFRESULT XmlDocument::LoadFromText(INCFString* text) {
    tree_.reset();
    return Guarded([&]() -> NCFRESULT {
        Need(text);
        std::string bytes;
        Need(encodings::ToUtf8(text::Read(text), bytes), NCF_E_FAIL);
        Need(bytes.size() <= XmlLimits::kLargestDocument, NCF_E_NOTSUPPORTED);
        NCFRESULT result = NCF_OK;
        tree_ = XmlTree::Load(bytes, "UTF-8", result);
        return result;
    });
}

NCFRESULT XmlDocument::GetRootNode(INCFUnknown** out) {
    return Guarded([&] {
        Need(out);
        *out = nullptr;
        Need(tree_, NMA_E_NOTINITIALIZED);
        *out = tree_->ObjectFor(tree_->root()).Detach();
        return NCF_OK;
    });
}

}  // namespace host
