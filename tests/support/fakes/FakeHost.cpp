// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/support/fakes/FakeHost.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>

namespace {

std::string Hex(const GUID& id) {
    char text[40];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X", static_cast<unsigned>(id.Data1), id.Data2,
                  id.Data3);
    return text;
}

std::string Formatted(const char* format, va_list arguments) {
    va_list copy;
    va_copy(copy, arguments);
    const int length = std::vsnprintf(nullptr, 0, format, copy);
    va_end(copy);
    std::string text(static_cast<std::size_t>(std::max(length, 0)) + 1, '\0');
    std::vsnprintf(text.data(), text.size(), format, arguments);
    text.pop_back();
    return text;
}

}  // namespace

NCFRESULT FakeConsole::Write(ncfUInt32 level, const char* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    lines_.push_back({level, Formatted(format, arguments)});
    va_end(arguments);
    if (journal_) {
        journal_->add("console " + std::to_string(level) + ": " + lines_.back().text);
    }
    return NCF_OK;
}

int FakeConsole::count(ncfUInt32 level, const std::string& text) const {
    return static_cast<int>(std::count_if(lines_.begin(), lines_.end(), [&](const Line& line) {
        return line.level == level && line.text == text;
    }));
}

class FakeHost::Unknown : public FakeObject<INCFComponentFactory> {
public:
    explicit Unknown(FakeHost* host) : host_(host) {}
    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        *out = nullptr;
        return host_->query(iid, out);
    }
    NCFRESULT CreateComponent(const GUID& component, INCFUnknown*, const GUID& iid,
                              void** out) override {
        *out = nullptr;
        return host_->create(component, iid, out);
    }

private:
    FakeHost* host_;
};

FakeHost::FakeHost(Journal* journal)
    : journal_(journal), console_(new FakeConsole(journal)), unknown_(new Unknown(this)) {
    maker(NCFCompID_NCFString, [](const GUID& iid, void** out) {
        INCFString* const string = MakeHostString("");
        const NCFRESULT result = string->QueryInterface(iid, out);
        string->Release();
        return result;
    });
}

FakeHost::~FakeHost() {
    EXPECT_EQ(unknown_->references(), 1u) << "references to the host are left";
    EXPECT_EQ(console_->references(), 1u) << "references to the console are left";
    unknown_->Release();
    console_->Release();
}

INCFUnknown* FakeHost::unknown() {
    return unknown_;
}
INCFComponentFactory* FakeHost::factory() {
    return unknown_;
}
ncfUInt32 FakeHost::references() const {
    return unknown_->references();
}

void FakeHost::maker(const GUID& component, Maker maker) {
    for (auto& entry : makers_) {
        if (entry.first == component) {
            entry.second = std::move(maker);
            return;
        }
    }
    makers_.emplace_back(component, std::move(maker));
}

void FakeHost::name(const GUID& id, const std::string& name) {
    names_.emplace_back(id, name);
}

std::string FakeHost::nameOf(const GUID& id) const {
    for (const auto& entry : names_) {
        if (entry.first == id) {
            return entry.second;
        }
    }
    return Hex(id);
}

void FakeHost::refuseCreation(const GUID& component, NCFRESULT result, int nth) {
    refusals_.push_back({component, {}, true, result, nth, 0});
}
void FakeHost::refuseCreation(const GUID& component, const GUID& iid, NCFRESULT result, int nth) {
    refusals_.push_back({component, iid, false, result, nth, 0});
}
void FakeHost::refuseQuery(const GUID& iid, NCFRESULT result) {
    refusedQueries_.emplace_back(iid, result);
}
void FakeHost::clearRefusals() {
    refusals_.clear();
    refusedQueries_.clear();
}

int FakeHost::creations(const GUID& component) const {
    for (const auto& entry : created_) {
        if (entry.first == component) {
            return entry.second;
        }
    }
    return 0;
}

NCFRESULT FakeHost::query(const GUID& iid, void** out) {
    for (const auto& refused : refusedQueries_) {
        if (refused.first == iid) {
            return refused.second;
        }
    }
    if (iid == IID_INCFConsole) {
        console_->AddRef();
        *out = static_cast<INCFConsole*>(console_);
        return NCF_OK;
    }
    if (iid == IID_INCFUnknown || iid == IID_INCFHostUnknown || iid == IID_INCFComponentFactory) {
        unknown_->AddRef();
        *out = static_cast<INCFComponentFactory*>(unknown_);
        return NCF_OK;
    }
    return NCF_E_NOINTERFACE;
}

NCFRESULT FakeHost::create(const GUID& component, const GUID& iid, void** out) {
    if (journal_) {
        journal_->add("create " + nameOf(component));
    }
    const auto counted = std::find_if(created_.begin(), created_.end(),
                                      [&](const auto& entry) { return entry.first == component; });
    if (counted == created_.end()) {
        created_.emplace_back(component, 1);
    } else {
        ++counted->second;
    }
    for (Refusal& refusal : refusals_) {
        if (refusal.component == component && (refusal.anyInterface || refusal.iid == iid)) {
            ++refusal.seen;
            if (refusal.nth == 0 || refusal.nth == refusal.seen) {
                return refusal.result;
            }
        }
    }
    for (const auto& entry : makers_) {
        if (entry.first == component) {
            return entry.second(iid, out);
        }
    }
    return NCF_CLASS_E_CLASSNOTAVAILABLE;
}
