// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any bytes as a document for events. The first byte says how large the pieces
// are in which the rest comes.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "fuzz/support/RunLimits.h"
#include "reference_host/xml/EventReader.h"

namespace {

class CountingEvents final : public host::XmlEvents {
public:
    NCFRESULT OnElement(const char*, const char** attributes) override {
        for (; *attributes != nullptr; attributes += 2) {
            size_ += std::string(attributes[0]).size() + std::string(attributes[1]).size();
        }
        return NCF_OK;
    }
    NCFRESULT OnText(std::string_view text) override {
        if (text.empty()) {
            std::abort();  // a run holds something
        }
        size_ += text.size();
        return NCF_OK;
    }

private:
    std::size_t size_ = 0;
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    if (size == 0) {
        return 0;
    }
    const std::size_t piece = std::size_t{data[0]} + 1;
    const auto* text = reinterpret_cast<const char*>(data + 1);
    std::size_t left = size - 1;
    CountingEvents events;
    host::EventReader reader(events, nullptr);
    NCFRESULT result = NCF_OK;
    while (left > piece && result >= 0) {
        result = reader.Feed(text, piece, false);
        text += piece;
        left -= piece;
    }
    if (result >= 0) {
        result = reader.Feed(text, left, true);
    }
    if ((result < 0) == reader.problem().empty()) {
        std::abort();  // a failure has words, and only a failure
    }
    return 0;
}
