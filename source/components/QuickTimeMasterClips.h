// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <vector>

#include "host_interfaces/framework/Console.h"
#include "host_interfaces/media/AAFClips.h"
#include "host_interfaces/util/NMAString.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/NCFSmartPtr.h"

namespace NMA::Impl {

// The movies of a folder. The list is cheap: each description is built afresh
// and goes to the caller, and no clip is kept.
class QuickTimeMasterClips final : public CNCFComponent<IAAFClips> {
public:
    explicit QuickTimeMasterClips(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InitializeInstance(INCFUnknown* host) override;
    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    ncfSInt32 GetCount() override;
    NCFRESULT GetMetadata(ncfSInt32 index, IAAFFile** ppData) override;
    NCFRESULT GetClipPath(ncfSInt32 index, INCFString* path) override;

    void SetFolder(const NMAString& folder) { folder_ = folder; }
    // Lists the folder's movies in the order of the file system; hidden ones
    // are skipped.
    void Scan();

private:
    // The full path of a movie that the list has.
    NMAString PathOf(ncfSInt32 index) const;

    NMAString folder_;
    // The names of the movies in UTF-8, one after the other, each with its zero: a folder may hold
    // 100,000. Those that have no form in UTF-8 are kept apart and are empty here.
    std::string names_;
    std::vector<std::size_t> starts_;
    std::map<ncfSInt32, NMAString> otherNames_;
    NCFSmartPtr<INCFComponentFactory> _pComponentFactory;
    NCFSmartPtr<INCFConsole> _pConsole;
};

}  // namespace NMA::Impl
