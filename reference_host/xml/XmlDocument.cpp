// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlDocument.h"

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/Encodings.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/xml/InputFile.h"
#include "reference_host/xml/XmlLimits.h"
#include "reference_host/xml/XmlTree.h"

namespace host {

NCFRESULT XmlDocument::Load(INCFString* path) {
    tree_.reset();
    return Guarded([&]() -> NCFRESULT {
        std::filesystem::path file;
        NCFRESULT result = PathFrom(path, file);
        if (result < 0) {
            return result;
        }
        std::string bytes;
        std::string problem;
        result = ReadInputFile(
            file,
            [&](const char* piece, std::size_t size, bool) {
                bytes.append(piece, size);
                return NCF_OK;
            },
            problem);
        if (result < 0) {
            return result;
        }
        tree_ = XmlTree::Load(bytes, nullptr, result);
        return result;
    });
}

NCFRESULT XmlDocument::LoadFromText(INCFString* text) {
    tree_.reset();
    return Guarded([&]() -> NCFRESULT {
        if (text == nullptr) {
            return NCF_E_POINTER;
        }
        std::string bytes;
        if (!text::ToUtf8(text::Read(text), bytes)) {
            return NCF_E_FAIL;
        }
        if (bytes.size() > XmlLimits::kLargestDocument) {
            return NCF_E_NOTSUPPORTED;
        }
        NCFRESULT result = NCF_OK;
        tree_ = XmlTree::Load(bytes, "UTF-8", result);
        return result;
    });
}

NCFRESULT XmlDocument::GetRootNode(INCFUnknown** out) {
    if (out == nullptr) {
        return NCF_E_POINTER;
    }
    *out = nullptr;
    if (tree_ == nullptr) {
        return NMA_E_NOTINITIALIZED;
    }
    return Guarded([&] {
        *out = tree_->ObjectFor(tree_->root()).Detach();
        return NCF_OK;
    });
}

}  // namespace host
