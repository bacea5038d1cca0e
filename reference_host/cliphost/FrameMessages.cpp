// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FrameMessages.h"

#include <algorithm>
#include <limits>

#include "reference_host/cliphost/Fields.h"

namespace cliphost {
namespace {

constexpr std::uint64_t kNoEnd = std::numeric_limits<std::uint64_t>::max();

std::uint64_t Size(int value) {
    return static_cast<std::uint64_t>(value);
}

bool IsPlanFor(const WantedFrames& wanted, const FramePlan& plan) {
    std::uint64_t last = 0;
    for (const std::uint64_t cut : plan.cuts) {
        if (cut <= last) {
            return false;
        }
        last = cut;
    }
    return plan.count > last && plan.count <= wanted.range.CountIn(kNoEnd);
}

bool IsOfPiece(const WantedFrames& wanted, const std::string& written, bool isWhole) {
    const std::uint64_t count = wanted.range.CountIn(kNoEnd);
    return (isWhole ? written.size() == count : written.size() < count) &&
           std::all_of(written.begin(), written.end(),
                       [](char c) { return c == kWritten || c == kLeftOut; });
}

}  // namespace

std::string FrameRequest::ToBytes() const {
    const FrameRange& range = wanted.range;
    return FieldWriter()
        .Add(static_cast<std::uint64_t>(kind))
        .Add(range.first)
        .Add(range.end.value_or(kNoEnd))
        .Add(range.step)
        .Add(std::uint64_t{wanted.isOne})
        .Add(std::uint64_t{wanted.areBelieved})
        .Add(std::uint64_t{jobs})
        .bytes();
}

FrameRequest FrameRequest::From(std::string_view bytes) {
    FieldReader fields(bytes);
    FrameRequest request;
    FrameRange& range = request.wanted.range;
    request.kind = static_cast<Kind>(fields.Number());
    range.first = fields.Number();
    range.end = fields.Number();
    range.step = fields.Number();
    request.wanted.isOne = fields.Number() != 0;
    request.wanted.areBelieved = fields.Number() != 0;
    request.jobs = static_cast<unsigned>(fields.Number());
    return request;
}

std::string FrameAnswer::ToBytes() const {
    FieldWriter fields;
    fields.Add(cliphost::ToBytes(outcome))
        .Add(plan.count)
        .Add(plan.frameBytes)
        .Add(plan.rawWords)
        .Add(written);
    fields.Add(Size(width)).Add(Size(height)).Add(std::uint64_t{plan.leanOnEachOther});
    fields.Add(std::uint64_t{plan.cuts.size()});
    for (const std::uint64_t cut : plan.cuts) {
        fields.Add(cut);
    }
    return fields.bytes();
}

bool FrameAnswer::Read(std::string_view bytes, const FrameRequest& request) {
    *this = {};
    FieldReader fields(bytes);
    const bool isOutcome = FromBytes(fields.Text(), {}, outcome);
    plan.count = fields.Number();
    plan.frameBytes = fields.Number();
    plan.rawWords = fields.Text();
    written = fields.Text();
    width = static_cast<int>(fields.Number());
    height = static_cast<int>(fields.Number());
    plan.leanOnEachOther = fields.Number() != 0;
    const std::uint64_t cuts = fields.Number();
    if (cuts > bytes.size() / kLengthSize) {
        return false;
    }
    for (std::uint64_t i = 0; i < cuts; ++i) {
        plan.cuts.push_back(fields.Number());
    }
    if (!isOutcome || !fields.IsWhole()) {
        return false;
    }
    const bool isDone = outcome.status == kExitFine;
    return request.kind == FrameRequest::Kind::Plan ? !isDone || IsPlanFor(request.wanted, plan)
                                                    : IsOfPiece(request.wanted, written, isDone);
}

}  // namespace cliphost
