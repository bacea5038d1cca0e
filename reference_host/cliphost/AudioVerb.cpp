// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/SoundReader.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using host::DisplayPath;

struct AudioOptions {
    std::filesystem::path movie;
    std::optional<ncfUInt32> track;
    std::uint64_t start = 0;
    std::optional<std::uint64_t> count;
    unsigned rate = 0;  // 0: the movie's own
    std::filesystem::path output;
};

constexpr std::uint64_t kBlock = 65536;  // samples of each channel read at a time

std::uint64_t WantedCount(const AudioOptions& options, const SoundReader& sound) {
    if (sound.Count() == 0) {
        throw Failure(kExitFile, options.movie, "its sound has no samples");
    }
    if (options.start >= sound.Count()) {
        throw Failure(kExitCaller, options.movie,
                      fmt::format("there is no sample {} of sound", options.start),
                      NumberedFromZero(sound.Count(), "sample"));
    }
    const std::uint64_t left = sound.Count() - options.start;
    if (options.count && *options.count > left) {
        Notice("cliphost: {}: the sound ends {} after sample {}; it is written up to its end\n",
               DisplayPath(options.movie), Counted(left, "sample"), options.start);
    }
    return std::min(options.count.value_or(left), left);
}

// Writes a file of sound, which begins with the first sample that could be read.
// Samples that can't be read become silence, which is held back until a readable
// sample follows: without one, no silence is written.
class SoundCopy {
public:
    SoundCopy(SoundReader& sound, const MissingSound& missing,
              const std::vector<unsigned char>& header, OutputFile& output)
        : sound_(sound), missing_(missing), header_(header), output_(output) {}

    // Returns the number of samples that are silence, which may be all.
    std::uint64_t Run(std::uint64_t start, std::uint64_t count);

private:
    void Write(const SoundReader::Block& block);

    SoundReader& sound_;
    const MissingSound& missing_;
    const std::vector<unsigned char>& header_;
    OutputFile& output_;
    bool isBegun_ = false;
    std::uint64_t heldBytes_ = 0;
};

std::uint64_t SoundCopy::Run(std::uint64_t start, std::uint64_t count) {
    std::uint64_t silent = 0;
    Progress progress("sound", static_cast<std::size_t>((count + kBlock - 1) / kBlock));
    for (std::uint64_t done = 0; done < count; done += kBlock) {
        progress.Step(fmt::format("{} of {} samples", done, count));
        const std::uint64_t now = std::min(kBlock, count - done);
        const SoundReader::Block block = sound_.Read(start + done, now);
        // The module tells of a block of which nothing could be read, and of no part.
        silent += block.isSilence ? now : missing_.CountIn(start + done, start + done + now);
        Write(block);
    }
    return silent;
}

void SoundCopy::Write(const SoundReader::Block& block) {
    if (!isBegun_ && block.isSilence) {
        heldBytes_ += block.size;
        return;
    }
    if (!isBegun_) {
        isBegun_ = true;
        output_.Write(header_.data(), header_.size());
        const std::vector<unsigned char> silence(65536);
        for (std::uint64_t left = heldBytes_; left > 0;) {
            const std::uint64_t now = std::min<std::uint64_t>(left, silence.size());
            output_.Write(silence.data(), static_cast<std::size_t>(now));
            left -= now;
        }
    }
    output_.Write(block.bytes, block.size);
}

int WriteSound(Essence& essence, const AudioOptions& options) {
    const ClipTrack& track = essence.Track(options.track, TrackKind::Sound);
    SoundReader sound(essence, track);
    const std::uint64_t count = WantedCount(options, sound);
    WavForm form = sound.form();
    if (form.rate == 0) {
        const SoundAlone alone = essence.SoundOf(track);
        if (alone.problem) {
            throw Failure(kExitFile, alone.problem);
        }
        if (options.rate == 0) {
            throw Failure(kExitFile, options.movie,
                          "its sample rate is not known, because the movie can't be described",
                          alone.rate == 0 ? "give it with --rate"
                                          : fmt::format("give --rate {}", alone.rate));
        }
        form.rate = options.rate;
    }
    const std::vector<unsigned char> header = WavHeader(form, count);
    if (header.empty()) {
        throw Failure(kExitFile, options.movie,
                      fmt::format("a WAV file can't hold sound of {} at {} Hz",
                                  Counted(form.channels, "channel"), form.rate));
    }
    RefuseOutputOntoMovie(options.output, options.movie);
    const MissingSound missing = essence.MissingPart(track, form.rate);
    std::uint64_t silent = 0;
    try {
        OutputFile output(options.output);
        silent = SoundCopy(sound, missing, header, output).Run(options.start, count);
        if (silent == count) {
            essence.FailSamples(
                track,
                fmt::format("track {}: none of its samples from {} to {} could be read",
                            track.number, options.start, options.start + count - 1),
                NCF_OK, options.start + count - 1);
        }
        if (WavNeedsPadding(form, count)) {
            output.Write("", 1);
        }
        output.Finish();
    } catch (const ReaderGone&) {
        return kExitFine;
    }
    if (!host::system::IsStandardOutput(options.output)) {
        fmt::print("{}: {}, {}, 24 bits at {} Hz\n", DisplayPath(options.output),
                   Counted(count, "sample"), Counted(form.channels, "channel"), form.rate);
    }
    if (silent > 0) {
        Notice("cliphost: {}: {}{} of {} could not be read and are silent\n",
               DisplayPath(options.movie), missing.Reason().empty() ? "" : missing.Reason() + "; ",
               silent, Counted(count, "sample"));
    }
    return silent == 0 ? kExitFine : kExitFile;
}

}  // namespace

void AddAudio(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("audio", "Write the sound of a track as a WAV file of 24 bits");
    verb->footer(
        "Examples:\n"
        "  cliphost audio clip.mov -o sound.wav\n"
        "  cliphost audio clip.mov --track 3 -o commentary.wav\n"
        "  cliphost audio clip.mov --start 48000 --count 96000 -o piece.wav\n"
        "  cliphost audio clip.mov -o - | flac -o sound.flac -\n\n"
        "A file of more than 4 GiB is written as RF64, which WAV programs read.");
    auto options = std::make_shared<AudioOptions>();
    AddPath(*verb, "movie", options->movie, "The movie")->required();
    verb->add_option("--track", options->track,
                     "Number of the track; without it, the first sound track")
        ->check(SmallWholeNumber());
    verb->add_option("--start", options->start, "The first sample, from 0")
        ->check(WholeNumber())
        ->capture_default_str();
    verb->add_option("--count", options->count, "How many samples; without it, all")
        ->check(WholeNumber(1));
    verb->add_option("--rate", options->rate,
                     "Samples a second, for a movie that can't be described")
        ->check(SmallWholeNumber(1));
    AddPath(*verb, "-o,--output", options->output, "The WAV file, or - for standard output")
        ->required();
    verb->callback([&session, &status, options] {
        Session running(session);
        Essence essence = OpenEssence(running, options->movie);
        status = WriteSound(essence, *options);
    });
}

}  // namespace cliphost
