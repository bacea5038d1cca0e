// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Check.h"

#include <algorithm>
#include <string_view>

namespace validate {

const std::vector<Check>& AllChecks() {
    static const std::vector<Check> all = [] {
        std::vector<Check> checks;
        for (const auto group :
             {FileChecks, OrderChecks, RegistrationChecks, RefusalChecks, FactoryChecks,
              ObjectChecks, UnloadingChecks, VolumeChecks, ContainerChecks, DescriptionChecks,
              MappingChecks, BadFileChecks, EnduranceChecks}) {
            const std::vector<Check> more = group();
            checks.insert(checks.end(), more.begin(), more.end());
        }
        return checks;
    }();
    return all;
}

const Check* FindCheck(const char* id) {
    const auto& all = AllChecks();
    const auto found = std::find_if(all.begin(), all.end(), [&](const Check& check) {
        return std::string_view(check.id) == id;
    });
    return found == all.end() ? nullptr : &*found;
}

}  // namespace validate
