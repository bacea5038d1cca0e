// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/FrameRange.h"
#include "reference_host/cliphost/FrameReader.h"
#include "reference_host/cliphost/TurnOption.h"

namespace cliphost {

// Which frames of a movie are read, and how.
struct FrameForm {
    std::optional<ncfUInt32> track;
    std::string format;
    bool withAlpha = false;
    TurnOption turn;
    ParameterOptions parameters;

    void AddTo(CLI::App& verb);
    SessionOptions Of(const SessionOptions& session) const;
};

// The frames that a command line asks for.
struct WantedFrames {
    FrameRange range;
    bool isOne = false;  // it names a frame, not a range
    // There are as many as the track's length says: none is read to count them.
    bool areBelieved = false;
};

// What is known of them once the movie is open.
struct FramePlan {
    std::uint64_t count = 0;
    std::uint64_t frameBytes = 0;     // as they are delivered
    std::string rawWords;             // as RawWords
    std::vector<std::uint64_t> cuts;  // where further pieces of the range begin, counted in frames
    // Nothing tells which frames stand alone: what a piece needs may lie in any before it.
    bool leanOnEachOther = false;
};

// How many frames a piece of a range has, and how many at most where no frame to end before is
// found sooner.
struct PieceLength {
    std::uint64_t usual = 1;
    std::uint64_t most = 1;
};
PieceLength PieceLengthFor(std::uint64_t count, std::uint64_t frameBytes, unsigned jobs);
// How many pieces of so many frames may be begun or wait on a disk behind one that takes long.
std::size_t MostPiecesWaiting(std::uint64_t frames, std::uint64_t frameBytes, unsigned jobs);

// A movie whose frames are read one after the other; those of its alpha track, too, where they
// are wanted. Throws a Failure.
class FrameSource {
public:
    FrameSource(Session& session, const std::filesystem::path& movie, const FrameForm& form);

    // Throws a Failure when there is none of the frames. The plan is for one process.
    FramePlan Plan(const WantedFrames& wanted);
    // Adds where pieces begin that keep `jobs` processes at work: each is long enough to be worth
    // a request, short enough to lie ready on a disk, and begins with a frame that stands alone
    // where one is near.
    void Cut(FramePlan& plan, const FrameRange& range, unsigned jobs);
    // Tells why a frame can't be read.
    bool Read(std::uint64_t frame);

    // Of the frame read last.
    const FrameReader& reader() const { return *reader_; }
    const FrameReader* alpha() const { return alpha_.get(); }

private:
    std::uint64_t CountTo(const WantedFrames& wanted);
    bool StandsAlone(std::uint64_t frame);
    bool TellsWhatStandsAlone();

    Essence essence_;
    const ClipTrack track_;
    std::unique_ptr<FrameReader> reader_;
    std::unique_ptr<FrameReader> alpha_;
};

}  // namespace cliphost
