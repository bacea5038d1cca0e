// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/EditedSound.h"

#include <algorithm>

namespace host {
namespace {

// Frames beyond this are in damaged edit lists alone.
constexpr double kFarthest = 281474976710656.0;

ncfUInt64 Frames(double units, double rate) {
    const double frames = units * rate + 0.5;
    return frames > 0.0 ? static_cast<ncfUInt64>(std::min(frames, kFarthest)) : 0;
}

}  // namespace

bool EditedSound::MustDivide(const Source& source) {
    const auto pieces = std::count_if(source.edits.begin(), source.edits.end(),
                                      [](const auto& edit) { return edit.mediaTime >= 0; });
    const bool beginsWithin = std::any_of(source.edits.begin(), source.edits.end(),
                                          [](const auto& edit) { return edit.mediaTime > 0; });
    const AVRational frame{1, static_cast<int>(source.form.sampleRate)};
    return source.timeScale > 0 &&
           (pieces > 1 || (beginsWithin && av_cmp_q(source.mediaUnit, frame) != 0));
}

std::unique_ptr<EditedSound> EditedSound::Open(const std::filesystem::path& path,
                                               const Source& source, bool hasWholeIndex) {
    const bool isCut = hasWholeIndex && MustDivide(source);
    auto decoder = SoundDecoder::Open(path, source.stream, source.form, hasWholeIndex,
                                      isCut ? InputView::WholeMedia : InputView::AsPresented);
    if (!decoder) {
        return nullptr;
    }
    std::unique_ptr<EditedSound> sound(new EditedSound(std::move(decoder)));
    if (isCut) {
        sound->Divide(source);
    }
    return sound;
}

void EditedSound::Divide(const Source& source) {
    const double rate = decoder_->SampleRate();
    double units = 0.0;
    ncfUInt64 start = 0;
    for (const MovieAtoms::Edit& edit : source.edits) {
        units += static_cast<double>(edit.duration);
        const ncfUInt64 end = Frames(units, rate / source.timeScale);
        const auto media = static_cast<ncfSInt64>(
            Frames(static_cast<double>(edit.mediaTime), rate * decoder_->SecondsOfTimeUnit()));
        pieces_.push_back({start, end, edit.mediaTime < 0 ? -1 : media});
        start = end;
    }
}

ncfUInt64 EditedSound::Read(ncfUInt64 place, ncfUInt64 count, std::vector<ncfSInt32>& words) {
    if (pieces_.empty()) {
        return decoder_->Read(place, count, words);
    }
    const auto wide = static_cast<std::size_t>(Channels());
    words.assign(static_cast<std::size_t>(count) * wide, 0);
    ncfUInt64 reached = 0;
    auto piece = std::upper_bound(
        pieces_.begin(), pieces_.end(), place,
        [](ncfUInt64 wanted, const Piece& candidate) { return wanted < candidate.end; });
    for (; piece != pieces_.end() && piece->start < place + count; ++piece) {
        const ncfUInt64 from = std::max(place, piece->start);
        const ncfUInt64 to = std::min(place + count, piece->end);
        if (from >= to) {
            continue;
        }
        ncfUInt64 got = to - from;
        if (piece->media >= 0) {
            const ncfUInt64 media = static_cast<ncfUInt64>(piece->media) + (from - piece->start);
            got = decoder_->Read(media, to - from, words_);
            std::copy(words_.begin(), words_.end(),
                      words.begin() + static_cast<std::ptrdiff_t>((from - place) * wide));
        }
        reached = got > 0 ? from - place + got : reached;
    }
    return reached;
}

}  // namespace host
