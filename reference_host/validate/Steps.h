// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "reference_host/validate/Module.h"

namespace validate {

// What several checks do.

// Does `work` on so many threads at once, each with its number. What one of them throws, the
// caller gets when all have ended.
void OnThreads(unsigned count, const std::function<void(unsigned number)>& work);

// How many threads the process has, when it had so many before. One that has ended may be counted
// for a moment longer, so there is a second's patience with those beyond.
std::size_t ThreadsLeft(std::size_t before);

// What of the host's is refused.
enum class Refused { kCreations, kQueries };
const char* WordOf(Refused refused);

// Does `round` with the host's first call refused, then the second, until there are no more
// calls to refuse; the last round is one without a refusal. `prepare` is not refused anything.
void RefuseEach(host::Host& host, Refused refused, const std::function<void(int number)>& prepare,
                const std::function<void()>& round);

// The class factory of a component; empty where the module has none for it.
host::Ref<INCFClassFactory> FactoryOf(Module& module, const host::ComponentFacts& component);

// An object of a component that has a class factory.
struct Made {
    std::string name;
    host::ComponentFacts component;
    host::Ref<INCFClassFactory> factory;
    host::Ref<INCFUnknown> object;
};
// Makes one object of each such component of the started module, one after the other. The check
// is skipped where there is none, or where one can't be made: another check tells of that. What
// was made once, though, has to be made again.
void ForEachObject(Module& module, const std::function<void(Made& made)>& visit);

// Ends the check as failed where the module still counts an object.
void ExpectIdle(Module& module, const std::string& after);

// A pattern that an output has before a call, to tell whether the call has set it.
void* Garbage();

}  // namespace validate
