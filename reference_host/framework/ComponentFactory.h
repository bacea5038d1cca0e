// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <functional>
#include <map>
#include <mutex>
#include <tuple>

#include "host_interfaces/framework/ComponentFactory.h"
#include "reference_host/framework/Component.h"
#include "reference_host/util/Ref.h"

namespace host {

// Makes one kind of component. `host` is the host unknown; `*out` is null when
// it is called.
using Maker =
    std::function<NCFRESULT(INCFUnknown* host, INCFUnknown* outer, const GUID& iid, void** out)>;

// A maker of the host's own components, which can't be aggregated. `make` takes
// the host unknown and returns a Ref to a new object, or to a shared one.
template <class Make>
Maker MakerOf(Make make) {
    return [make](INCFUnknown* host, INCFUnknown* outer, const GUID& iid, void** out) -> NCFRESULT {
        if (outer != nullptr) {
            return NCF_CLASS_E_NOAGGREGATION;
        }
        const auto object = make(host);
        return object ? object->QueryInterface(iid, out) : NCF_E_OUTOFMEMORY;
    };
}

// One creation, as a rule sees it. Calls are counted from 1 since the rule was
// set: all of them, and those with this component and interface.
struct CreationCall {
    GUID component;
    GUID iid;
    ncfUInt32 number;
    ncfUInt32 numberOfPair;
};

// The table of makers by component id. Look-ups may come from any thread; a
// maker runs outside the lock, since components create others.
class ComponentFactory final : public Component<INCFComponentFactory> {
public:
    // Sees every creation before it is done; a negative answer is its result.
    using Rule = std::function<NCFRESULT(const CreationCall&)>;

    NCFRESULT CreateComponent(const GUID& component, INCFUnknown* outer, const GUID& iid,
                              void** out) override;

    // The maker of a component id, in place of any before.
    void Register(const GUID& component, Maker maker);
    void Unregister(const GUID& component);
    bool Knows(const GUID& component);

    void SetRule(Rule rule);  // empty: everything is made
    // The host unknown that makers are given, not counted; null at the host's
    // end, from when nothing is made any more.
    void SetHost(INCFUnknown* host);

private:
    using Key = std::array<unsigned char, sizeof(GUID)>;

    NCFRESULT AskRule(const GUID& component, const GUID& iid);

    std::mutex mutex_;
    std::map<Key, Maker> makers_;
    INCFUnknown* host_ = nullptr;

    std::mutex ruleMutex_;
    Rule rule_;
    ncfUInt32 calls_ = 0;
    std::map<std::pair<Key, Key>, ncfUInt32> callsOfPair_;
};

}  // namespace host
