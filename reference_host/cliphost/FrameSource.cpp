// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FrameSource.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameSink.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/quicktime/CodedAlone.h"

namespace cliphost {
namespace {

constexpr std::uint64_t kPiecesForEach = 4;  // so that all processes end at about the same time
constexpr std::uint64_t kLeastFrames = 12;
constexpr std::uint64_t kMebibytes = std::uint64_t{1} << 20;
constexpr std::uint64_t kLeastBytes = 2 * kMebibytes;
constexpr std::uint64_t kMostBytes = 256 * kMebibytes;
// Of a piece that finds no frame to end before.
constexpr std::uint64_t kMostBytesUncut = 1024 * kMebibytes;

// Of pieces that wait; no process is kept waiting for that.
constexpr std::uint64_t kMostWaitingForEach = 4;
constexpr std::uint64_t kMostBytesWaiting = 2048 * kMebibytes;
// So many pieces at most, whatever a header claims, and so many frames are looked at for each end.
constexpr std::uint64_t kMostCuts = 4096;
constexpr std::uint64_t kMostLookedAt = 4096;

constexpr ncfUInt64 kStandsAlone = 1024;
// In a movie that has other samples, one is among so many.
constexpr std::uint64_t kSamplesThatTell = 65536;

}  // namespace

void FrameForm::AddTo(CLI::App& verb) {
    verb.add_option("--track", track, "Number of the track; without it, the first picture track")
        ->check(SmallWholeNumber());
    verb.add_option("--format", format,
                    "A name or number that `cliphost formats` lists, or 'deepest'; without it, the "
                    "first that a picture can be made of");
    verb.add_flag("--with-alpha", withAlpha, "Write the clip's alpha into the PNG pictures");
    turn.AddTo(verb);
    parameters.AddTo(verb);
}

SessionOptions FrameForm::Of(const SessionOptions& session) const {
    SessionOptions own = session;
    if (withAlpha) {
        own.host.ignoreAlpha = false;
    }
    return own;
}

FrameSource::FrameSource(Session& session, const std::filesystem::path& movie,
                         const FrameForm& form)
    : essence_(OpenEssence(session, movie, form.parameters)),
      track_(essence_.Track(form.track, TrackKind::Picture)),
      reader_(std::make_unique<FrameReader>(essence_, track_, form.format)) {
    if (form.withAlpha) {
        const ClipTrack& track = essence_.Track(std::nullopt, TrackKind::Alpha);
        alpha_ = std::make_unique<FrameReader>(essence_, track, "deepest");
    }
}

FramePlan FrameSource::Plan(const WantedFrames& wanted) {
    const std::uint64_t count = wanted.range.CountIn(CountTo(wanted));
    if (!wanted.isOne) {
        reader_->StartAnew();
    }
    return {count, reader_->frameBytes(), RawWords(*reader_, track_), {}, false};
}

std::uint64_t FrameSource::CountTo(const WantedFrames& wanted) {
    const FrameRange& range = wanted.range;
    // One frame need not be counted: it is there or it is not.
    const bool isThere = wanted.isOne && range.first < reader_->MostFrames() &&
                         reader_->Read(range.first) != NMA_E_NODATA;
    const std::uint64_t count = isThere              ? range.first + 1
                                : wanted.areBelieved ? reader_->MostFrames()
                                                     : reader_->Count();
    if (count == 0) {
        throw Failure(kExitFile, essence_.WhyUnread(track_, range.first, NMA_E_NODATA));
    }
    if (range.CountIn(count) == 0) {
        throw Failure(kExitCaller, essence_.movie(),
                      fmt::format("track {}: there is no frame {}", track_.number, range.first),
                      NumberedFromZero(count, "frame"));
    }
    return count;
}

PieceLength PieceLengthFor(std::uint64_t count, std::uint64_t frameBytes, unsigned jobs) {
    const std::uint64_t bytes = std::max<std::uint64_t>(frameBytes, 1);
    const std::uint64_t least = std::max(kLeastFrames, kLeastBytes / bytes);
    const std::uint64_t even = count / (jobs * kPiecesForEach) + 1;
    PieceLength length;
    length.usual =
        std::max(count / kMostCuts + 1, std::min(std::max(even, least), kMostBytes / bytes));
    // The frames before such a piece are decoded for it, back to one that stands alone.
    length.most = std::max(length.usual, std::min({count / jobs + 1, kMostBytesUncut / bytes,
                                                   length.usual + kMostLookedAt}));
    return length;
}

std::size_t MostPiecesWaiting(std::uint64_t frames, std::uint64_t frameBytes, unsigned jobs) {
    const std::uint64_t bytes = std::max<std::uint64_t>(frameBytes, 1);
    const std::uint64_t room = kMostBytesWaiting / bytes / std::max<std::uint64_t>(frames, 1);
    const std::uint64_t least = jobs;
    return static_cast<std::size_t>(std::clamp(room, least, kMostWaitingForEach * least));
}

void FrameSource::Cut(FramePlan& plan, const FrameRange& range, unsigned jobs) {
    const std::uint64_t count = plan.count;
    const PieceLength length = PieceLengthFor(count, reader_->frameBytes(), jobs);
    for (std::uint64_t begin = 0; count - begin > length.usual + length.usual / 2;) {
        const std::uint64_t last = std::min(begin + length.most, count);
        std::uint64_t cut = begin + length.usual;
        while (cut < last && !StandsAlone(range.first + cut * range.step)) {
            ++cut;
        }
        if (cut == count) {
            break;
        }
        plan.cuts.push_back(cut);
        begin = cut;
    }
    plan.leanOnEachOther = !plan.cuts.empty() && !TellsWhatStandsAlone();
}

// By the order of decoding, which differs little from that of the frames.
bool FrameSource::StandsAlone(std::uint64_t frame) {
    ncfUInt64 properties = kStandsAlone;
    ncfUInt32 dependencies = 0;
    essence_.map().GetSampleProperties(track_.number, frame, &properties, &dependencies);
    return properties == kStandsAlone;
}

// Movies that don't list their sync samples claim that all are. Whose codec has other pictures,
// too, may be wrong.
bool FrameSource::TellsWhatStandsAlone() {
    ncfUInt64 samples = 0;
    essence_.map().GetNumberOfSamples(track_.number, &samples);
    samples = std::min<ncfUInt64>(samples, kSamplesThatTell);
    for (ncfUInt64 i = 0; i < samples; ++i) {
        if (!StandsAlone(i)) {
            return true;
        }
    }
    return host::AreCodedAlone(essence_.movie());
}

bool FrameSource::Read(std::uint64_t frame) {
    NCFRESULT result = reader_->Read(frame);
    if (result == NCF_OK && alpha_) {
        result = alpha_->Read(frame);
    }
    if (result != NCF_OK) {
        essence_.session().TakeNotices();
        Problem problem = essence_.WhyUnread(track_, frame, result);
        problem.reason = fmt::format("frame {} is left out: {}", frame, problem.reason);
        TellProblem(problem, essence_.session().verbosity());
    }
    return result == NCF_OK;
}

}  // namespace cliphost
