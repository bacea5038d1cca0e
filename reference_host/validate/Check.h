// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

namespace validate {

class Trial;

// Something that a host relies on in every module of the framework. To add one is a row in the
// table of its group.
struct Check {
    const char* id;             // in kebab case
    const char* text;           // what the host relies on, in one sentence or two
    const char* cause;          // what is most likely wrong in a module that fails
    void (*run)(Trial& trial);  // returns when the module keeps it, else ends by the trial
    bool takesSeed = false;     // what it does depends on the seed
};

// All of them, group by group.
const std::vector<Check>& AllChecks();
// Null for an id that none has.
const Check* FindCheck(const char* id);

// The groups, each in a file of its own.
std::vector<Check> FileChecks();
std::vector<Check> OrderChecks();
std::vector<Check> RegistrationChecks();
std::vector<Check> RefusalChecks();
std::vector<Check> FactoryChecks();
std::vector<Check> ObjectChecks();
std::vector<Check> UnloadingChecks();
std::vector<Check> VolumeChecks();
std::vector<Check> ContainerChecks();
std::vector<Check> DescriptionChecks();
std::vector<Check> BadFileChecks();
std::vector<Check> MappingChecks();
std::vector<Check> EnduranceChecks();

}  // namespace validate
