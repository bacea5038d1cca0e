// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/ComponentFactory.h"

#include <cstring>

#include "reference_host/framework/Guard.h"

namespace host {

namespace {

std::array<unsigned char, sizeof(GUID)> KeyOf(const GUID& id) {
    std::array<unsigned char, sizeof(GUID)> key{};
    std::memcpy(key.data(), &id, sizeof(GUID));
    return key;
}

}  // namespace

NCFRESULT ComponentFactory::CreateComponent(const GUID& component, INCFUnknown* outer,
                                            const GUID& iid, void** out) {
    if (out == nullptr) {
        return NCF_E_POINTER;
    }
    *out = nullptr;
    const NCFRESULT result = Guarded([&]() -> NCFRESULT {
        const NCFRESULT allowed = AskRule(component, iid);
        if (allowed < 0) {
            return allowed;
        }
        Maker maker;
        INCFUnknown* host = nullptr;
        {
            const std::lock_guard<std::mutex> guard(mutex_);
            const auto found = makers_.find(KeyOf(component));
            if (host_ == nullptr || found == makers_.end()) {
                return NCF_CLASS_E_CLASSNOTAVAILABLE;
            }
            maker = found->second;
            host = host_;
        }
        return maker(host, outer, iid, out);
    });
    if (result < 0) {
        ReleaseOutput(*out);
    }
    return result;
}

void ComponentFactory::Register(const GUID& component, Maker maker) {
    const std::lock_guard<std::mutex> guard(mutex_);
    makers_[KeyOf(component)] = std::move(maker);
}

void ComponentFactory::Unregister(const GUID& component) {
    const std::lock_guard<std::mutex> guard(mutex_);
    makers_.erase(KeyOf(component));
}

bool ComponentFactory::Knows(const GUID& component) {
    const std::lock_guard<std::mutex> guard(mutex_);
    return makers_.count(KeyOf(component)) != 0;
}

void ComponentFactory::SetRule(Rule rule) {
    const std::lock_guard<std::mutex> guard(ruleMutex_);
    rule_ = std::move(rule);
    calls_ = 0;
    callsOfPair_.clear();
}

void ComponentFactory::SetHost(INCFUnknown* host) {
    const std::lock_guard<std::mutex> guard(mutex_);
    host_ = host;
}

NCFRESULT ComponentFactory::AskRule(const GUID& component, const GUID& iid) {
    const std::lock_guard<std::mutex> guard(ruleMutex_);
    if (!rule_) {
        return NCF_OK;
    }
    const ncfUInt32 ofPair = ++callsOfPair_[{KeyOf(component), KeyOf(iid)}];
    return rule_({component, iid, ++calls_, ofPair});
}

}  // namespace host
