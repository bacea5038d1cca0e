// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <cmath>
#include <numeric>

#include "reference_host/framework/Guard.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"

namespace host {
namespace {

constexpr double kLeastForcedRate = 0.01;
constexpr double kRateOfStills = 25.0;
constexpr double kHighestRate = 2147483.0;  // its thousandths fit 31 bits
// Where a file has no units of its own.
constexpr ncfUInt32 kOwnTimeScale = AV_TIME_BASE;

struct Rate {
    ncfSInt32 numerator = 0;
    ncfSInt32 denominator = 1;
    double Value() const { return static_cast<double>(numerator) / denominator; }
};

// A whole rate, or the same a thousandth slower, whichever is nearer.
Rate SnappedRate(double value) {
    if (!(value > 0.0) || value > kHighestRate) {
        return {};
    }
    const double rounded = static_cast<ncfSInt32>(value * 1000.0 + 0.5) / 1000.0;
    const auto whole = static_cast<ncfSInt32>(rounded + 0.5);
    const double fromWhole = std::fabs(whole - rounded);
    const double fromSlower = std::fabs(whole * 1000.0 / 1001.0 - rounded);
    if (whole == 0) {
        return {};
    }
    if (fromSlower > fromWhole) {
        return {whole, 1};
    }
    const ncfSInt64 numerator = ncfSInt64{whole} * 1000;
    const ncfSInt64 common = std::gcd(numerator, ncfSInt64{1001});
    return {static_cast<ncfSInt32>(numerator / common), static_cast<ncfSInt32>(1001 / common)};
}

ncfUInt64 Units(double seconds, double rate, double rounding) {
    const double units = seconds * rate + rounding;
    return units > 0.0 && units < 9e18 ? static_cast<ncfUInt64>(units) : 0;
}

}  // namespace

NCFRESULT QuickTimeWrapper::EditRateAndLength(double forcedRate, double editorRate,
                                              ncfUInt32 singleFrameDuration, bool useMovieHeader,
                                              double& rate, ncfUInt64& length) {
    const bool isForced = forcedRate > kLeastForcedRate;
    const ncfUInt32 video = movie_->FirstVideo();
    if (video == 0) {
        const ncfUInt32 audio = movie_->FirstAudio();
        rate = SnappedRate(isForced ? forcedRate : editorRate).Value();
        if (audio == 0 || rate <= 0.0) {
            return NCF_E_FAIL;
        }
        length = Units(movie_->Seconds(useMovieHeader ? 0 : audio), rate, 0.0);
        return NCF_OK;
    }
    if (MovieHasOneFrame()) {
        const double own = movie_->PictureRate();
        rate = isForced           ? forcedRate
               : editorRate > 0.0 ? editorRate
               : own > 0.0        ? own
                                  : kRateOfStills;
        rate = SnappedRate(rate).Value();
        length = singleFrameDuration > 0 ? singleFrameDuration : 1;
        return rate > 0.0 ? NCF_OK : NCF_E_FAIL;
    }
    rate = SnappedRate(isForced ? forcedRate : movie_->PictureRate()).Value();
    if (rate <= 0.0) {
        return NCF_E_FAIL;
    }
    length = Units(movie_->Seconds(useMovieHeader ? 0 : video), rate, 0.5);
    return NCF_OK;
}

NCFRESULT QuickTimeWrapper::DetermineMovieEditRateAndLength(
    double forcedRate, double editorRate, ncfUInt32 singleFrameDuration, ncfSInt32* num,
    ncfSInt32* den, ncfUInt64* length, ncfUInt64* trackLengths, ncfUInt32 trackLengthCount,
    ncfBool useMovieHeader) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(num && den && length);
        double rate = 0.0;
        ncfUInt64 units = 0;
        Check(EditRateAndLength(forcedRate, editorRate, singleFrameDuration, useMovieHeader != 0,
                                rate, units));
        const Rate snapped = SnappedRate(rate);
        *num = snapped.numerator;
        *den = snapped.denominator;
        *length = units;
        for (ncfUInt32 i = 0; trackLengths && i < trackLengthCount; ++i) {
            const bool exists = movie_->FindTrack(i + 1) != nullptr;
            trackLengths[i] = exists ? Units(movie_->Seconds(i + 1), rate, 0.5) : 0;
        }
        return NCF_OK;
    });
}

NCFRESULT QuickTimeWrapper::MovieTrackDurationIssues(ncfSInt32 rateNum, ncfSInt32 rateDen,
                                                     ncfUInt64 length, ncfBool* sound,
                                                     ncfBool* picture) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(rateNum > 0 && rateDen > 0, NCF_E_INVALIDARG);
        bool soundDiffers = false;
        bool pictureDiffers = false;
        if (length != 0) {
            const double rate = static_cast<double>(rateNum) / rateDen;
            for (const ncfUInt32 track : movie_->Numbers()) {
                if (movie_->IsAudio(track)) {
                    const ncfUInt64 own = Units(movie_->Seconds(track), rate, 0.5);
                    soundDiffers = soundDiffers || (own > length ? own - length : length - own) > 1;
                }
            }
            pictureDiffers =
                movie_->FirstVideo() != 0 && movie_->CountPictures(~ncfUInt64{0}) != length;
        }
        Give(soundDiffers, sound);
        Give(pictureDiffers, picture);
        return NCF_OK;
    });
}

ncfUInt32 QuickTimeWrapper::GetMovieTimeScale() {
    if (!movie_) {
        return 0;
    }
    return movie_->Atoms().timeScale > 0 ? movie_->Atoms().timeScale : kOwnTimeScale;
}

ncfUInt64 QuickTimeWrapper::GetTrackDuration(ncfUInt32 track) {
    if (!movie_ || !movie_->FindTrack(track)) {
        return 0;
    }
    ncfUInt64 duration = 0;
    Guarded([&] {
        duration = Units(movie_->Seconds(track), GetMovieTimeScale(), 0.5);
        return NCF_OK;
    });
    return duration;
}

}  // namespace host
