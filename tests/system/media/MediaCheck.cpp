// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/media/MediaCheck.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <cstdio>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "tests/system/Facts.h"
#include "tests/system/media/Defects.h"
#include "tests/system/media/Probe.h"

using cliphost::TreeNode;

namespace {

constexpr double kEditorRate = 25;

struct Fraction {
    long long numerator = 0;
    long long denominator = 1;
    double Value() const {
        return denominator == 0 ? 0
                                : static_cast<double>(numerator) / static_cast<double>(denominator);
    }
};

Fraction FractionOf(const std::string& text) {
    Fraction fraction;
    std::sscanf(text.c_str(), "%lld/%lld", &fraction.numerator, &fraction.denominator);
    return fraction;
}

// Compares a description with a probed file and gathers what differs.
class Comparison {
public:
    Comparison(const TreeNode& tree, const ProbedFile& probed) : tree_(tree), probed_(probed) {}

    std::vector<std::string> Run() {
        const auto& slots = Parts(Mob(tree_, kFileMob), "Slots");
        if (slots.empty()) {
            return {"no essence slots"};
        }
        rate_ = FractionOf(Fact(slots[0], "EditRate"));
        length_ = std::atoll(Fact(Parts(slots[0], "Segment").at(0), "Length").c_str());
        CompareTracks();
        CompareRateAndLength();
        ComparePicture();
        CompareSounds();
        CompareTimecode();
        return differences_;
    }

private:
    void Differs(const std::string& what, const std::string& ours, const std::string& theirs) {
        differences_.push_back(fmt::format("{}: described {}, probed {}", what, ours, theirs));
    }

    // One picture at most, a sound descriptor for each sound track, a slot for
    // each of its channels.
    void CompareTracks() {
        const auto videos = probed_.Of("video");
        const auto audios = probed_.Of("audio");
        const std::size_t pictures = videos.empty() ? 0 : 1;
        if (Pictures(tree_).size() != pictures) {
            Differs("pictures", fmt::format("{}", Pictures(tree_).size()),
                    fmt::format("{} video streams", videos.size()));
        }
        if (Sounds(tree_).size() != audios.size()) {
            Differs("sounds", fmt::format("{}", Sounds(tree_).size()),
                    fmt::format("{} audio streams", audios.size()));
        }
        std::size_t slots = pictures;
        for (const ProbedStream& audio : audios) {
            slots += static_cast<std::size_t>(audio.channels);
        }
        if (Parts(Mob(tree_, kMasterMob), "Slots").size() != slots) {
            Differs("slots", fmt::format("{}", Parts(Mob(tree_, kMasterMob), "Slots").size()),
                    fmt::format("{}", slots));
        }
    }

    void CompareRateAndLength() {
        const auto videos = probed_.Of("video");
        const double wanted = videos.empty() ? kEditorRate : videos[0].averageRate;
        CompareRate(wanted);
        // Of the track as played; a silence in front may be counted or not.
        const double seconds = videos.empty() ? probed_.duration : videos[0].duration;
        const double start = videos.empty() ? 0 : std::max(videos[0].start, 0.0);
        const double low = std::floor(seconds * rate_.Value()) - 1;
        const double high = std::ceil((start + seconds) * rate_.Value()) + 1;
        const auto length = static_cast<double>(length_);
        if (length < low || length > high) {
            Differs("length in frames", fmt::format("{}", length_),
                    fmt::format("{} to {} ({} s from {} s)", low, high, seconds, start));
        }
    }

    // All rates are n or n x 1000/1001: exactly the probed one when it is such a
    // rate, else the one that the rule of rounding gives, less than one away.
    void CompareRate(double wanted) {
        const bool isWhole = rate_.denominator == 1;
        const double whole = isWhole ? rate_.Value() : rate_.Value() * 1001 / 1000;
        if (std::abs(whole - std::round(whole)) > 1e-6) {
            Differs("edit rate", fmt::format("{}/{}", rate_.numerator, rate_.denominator),
                    "n/1 or n x 1000/1001");
        }
        const double nearWhole = std::round(wanted);
        const double nearDrop = std::round(wanted * 1001 / 1000) * 1000 / 1001;
        const double nearest =
            std::abs(wanted - nearWhole) < std::abs(wanted - nearDrop) ? nearWhole : nearDrop;
        const bool isCommon = std::abs(wanted - nearest) < 0.0005 * wanted;
        const double allowed = isCommon ? 0.0006 * wanted : 1.0;
        if (std::abs(rate_.Value() - wanted) > allowed) {
            Differs("edit rate", fmt::format("{}", rate_.Value()), fmt::format("{}", wanted));
        }
    }

    void ComparePicture() {
        const auto videos = probed_.Of("video");
        const auto pictures = Pictures(tree_);
        if (videos.empty() || pictures.empty()) {
            return;
        }
        const TreeNode& picture = pictures[0];
        const int fields = Fact(picture, "FrameLayout") == "SeparateFields (1)" ? 2 : 1;
        const int width = std::atoi(Fact(picture, "DisplayWidth").c_str());
        const int height = std::atoi(Fact(picture, "DisplayHeight").c_str()) * fields;
        // Lines of ancillary data above the picture are stored, not shown.
        const int storedWidth = std::atoi(Fact(picture, "StoredWidth").c_str());
        const int storedHeight = std::atoi(Fact(picture, "StoredHeight").c_str()) * fields;
        const bool isShown = width == videos[0].width && height == videos[0].height;
        const bool isStored = storedWidth == videos[0].width && storedHeight == videos[0].height;
        if (!isShown && !isStored) {
            Differs("size", fmt::format("{}x{}", width, height),
                    fmt::format("{}x{}", videos[0].width, videos[0].height));
        }
        if (Fact(picture, "Length") != std::to_string(length_)) {
            Differs("length of the picture", Fact(picture, "Length"), std::to_string(length_));
        }
    }

    void CompareSounds() {
        const auto audios = probed_.Of("audio");
        const auto sounds = Sounds(tree_);
        for (std::size_t i = 0; i < std::min(audios.size(), sounds.size()); ++i) {
            const std::string what = fmt::format("sound {}", i + 1);
            if (Fact(sounds[i], "Channels") != std::to_string(audios[i].channels)) {
                Differs(what + " channels", Fact(sounds[i], "Channels"),
                        std::to_string(audios[i].channels));
            }
            const std::string rate = fmt::format("{}/1", audios[i].sampleRate);
            if (Fact(sounds[i], "AudioSamplingRate") != rate) {
                Differs(what + " rate", Fact(sounds[i], "AudioSamplingRate"), rate);
            }
            // In samples; edits and priming may take up to a packet or two.
            const double samples = std::atof(Fact(sounds[i], "Length").c_str());
            const double probed = audios[i].duration * audios[i].sampleRate;
            const double silence = std::max(audios[i].start, 0.0) * audios[i].sampleRate;
            const double slack = 4096 + 0.01 * probed;
            if (samples < probed - slack || samples > probed + silence + slack) {
                Differs(what + " samples", fmt::format("{}", samples), fmt::format("{}", probed));
            }
        }
    }

    // Where the clip enters the source mob, as a timecode of its own rate.
    void CompareTimecode() {
        const ProbedStream* clock = nullptr;
        for (const ProbedStream& stream : probed_.streams) {
            if (stream.kind == "data" && stream.tag == "tmcd") {
                clock = &stream;
                break;
            }
        }
        const std::string line = TimecodeLine(tree_);
        const std::string mark = "clip enters at ";
        const std::string entry = line.substr(line.find(mark) + mark.size());
        if (clock == nullptr) {
            if (entry != "0") {
                Differs("timecode start", entry, "no timecode track");
            }
            return;
        }
        int hours = 0, minutes = 0, seconds = 0, frames = 0;
        char separator = ':';
        if (std::sscanf(clock->timecode.c_str(), "%d:%d:%d%c%d", &hours, &minutes, &seconds,
                        &separator, &frames) != 5) {
            return;  // ffprobe can't tell the start either
        }
        const double fps = std::round(rate_.Value());
        const double elapsed = hours * 3600.0 + minutes * 60.0 + seconds;
        double start = elapsed * fps + frames;
        if (separator == ';') {
            const int total = hours * 60 + minutes;
            start -= fps / 15 * (total - total / 10);
        }
        // A track of another rate is scaled, so its frames may come out apart.
        if (std::abs(std::atof(entry.c_str()) - start) > 0.5 &&
            std::abs(std::atof(entry.c_str()) - start) > elapsed * fps * 0.04) {
            Differs("timecode start", entry, fmt::format("{} ({})", start, clock->timecode));
        }
    }

    const TreeNode& tree_;
    const ProbedFile& probed_;
    Fraction rate_;
    long long length_ = 0;
    std::vector<std::string> differences_;
};

std::string Joined(const std::vector<std::string>& texts) {
    return fmt::format("{}", fmt::join(texts, ", "));
}

}  // namespace

MediaVerdict CheckMedia(cliphost::Session& session, const std::filesystem::path& file,
                        const std::filesystem::path& saveAs) {
    ProbedFile probed = ProbeFile(file);
    const auto defects = DefectsOf(file, probed, kEditorRate);
    if (std::find(defects.begin(), defects.end(), "fragmented") != defects.end()) {
        MeasurePackets(file, probed);
    }
    const cliphost::Description description = cliphost::DescribeMovie(session, file);
    MediaVerdict verdict;
    if (!description.file) {
        verdict.isRight = !defects.empty();
        verdict.summary = verdict.isRight ? "refused: " + Joined(defects) : "refused";
        if (!verdict.isRight) {
            verdict.differences = {"nothing shows why: " + LineOf(description.problem)};
        }
        return verdict;
    }
    session.aaf().Save(description.file.get(), saveAs);
    const TreeNode tree = cliphost::ReadTree(session.aaf().Open(saveAs).get());
    verdict.differences = Comparison(tree, probed).Run();
    verdict.isRight = verdict.differences.empty();
    verdict.summary = fmt::format("{}, {}", RateAndLength(tree), PictureLine(tree));
    return verdict;
}
