// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <mutex>
#include <string>

#include "host_interfaces/framework/Console.h"
#include "reference_host/framework/Component.h"

namespace host {

// The user's console. Lines go to standard error up to a level, or all of them
// to a sink that the program puts in its place.
class Console final : public Component<INCFConsole> {
public:
    using Sink = std::function<void(ncfUInt32 level, const std::string& text)>;

    NCFRESULT Write(ncfUInt32 level, const char* format, ...) override;

    // Receives every text as it was written, one at a time; empty brings
    // standard error back. A sink must not write to the console.
    void SetSink(Sink sink);
    // The highest level that reaches standard error; starts at 1.
    void SetLevel(ncfUInt32 level);

private:
    void Deliver(ncfUInt32 level, const std::string& text);

    std::mutex mutex_;
    Sink sink_;
    ncfUInt32 level_ = 1;
};

}  // namespace host
