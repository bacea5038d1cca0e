// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <map>
#include <string>

#include "host_interfaces/framework/ResultCodes.h"
#include "tests/support/fakes/Journal.h"

// What the fakes of the header parser have in common: each operation writes
// "<who>.<operation>" into the journal and gives the result that the test set
// for it, or NCF_OK. A failing operation leaves its outputs alone.
//
//     parser->results["GetTimeScale"] = NCF_E_FAIL;
//
// `passes` lets so many calls of an operation by before its result is given;
// `whenAsked`, when set, is called first and may throw.
struct FakeCalls {
    std::string who;
    Journal* journal = nullptr;
    std::map<std::string, NCFRESULT> results;
    std::map<std::string, int> passes;
    std::function<void()> whenAsked;

protected:
    FakeCalls(std::string name, Journal* lines) : who(std::move(name)), journal(lines) {}

    NCFRESULT enter(const char* operation) {
        if (whenAsked) {
            whenAsked();
        }
        if (journal) {
            journal->add(who + "." + operation);
        }
        const auto pass = passes.find(operation);
        if (pass != passes.end() && pass->second > 0) {
            --pass->second;
            return NCF_OK;
        }
        const auto found = results.find(operation);
        return found == results.end() ? NCF_OK : found->second;
    }
    // The operation and one answer of it.
    template <class Out, class Value>
    NCFRESULT give(const char* operation, Out* out, const Value& value) {
        const NCFRESULT result = enter(operation);
        if (result >= 0 && out) {
            *out = static_cast<Out>(value);
        }
        return result;
    }
    // The same for an object, which gets a reference; null on failure.
    template <class Interface, class Object>
    NCFRESULT giveObject(const char* operation, Interface** out, Object* object) {
        *out = nullptr;
        const NCFRESULT result = enter(operation);
        if (result >= 0 && object) {
            object->AddRef();
            *out = object;
        }
        return result;
    }
};
