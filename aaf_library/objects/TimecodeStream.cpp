// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/TimecodeStream.h"

#include <algorithm>

#include "aaf_library/objects/Rates.h"

namespace aaf {

namespace {

// The 64 bits of a linear timecode word, its first bit in the lowest of the first byte: each byte
// has a digit below and four user bits above. Tens share their half with flags.
constexpr std::size_t kWordBytes = 8;
constexpr std::size_t kSyncBytes = 2;
constexpr std::uint8_t kSync[kSyncBytes] = {0xFC, 0xBF};
constexpr std::uint8_t kDropFlag = 0x04;  // beside the tens of frames

constexpr aafInt64 kMinutesOfADay = 24 * 60;

// Only counts of 30 and its multiples drop numbers. For others the flag has no meaning.
bool MayDrop(aafInt64 fps) {
    return fps % 30 == 0;
}

// The numbers dropped at the start of each minute but every tenth.
aafInt64 DroppedNumbers(aafInt64 fps) {
    return fps / 15;
}

struct Clock {
    aafInt64 hours;
    aafInt64 minutes;
    aafInt64 seconds;
    aafInt64 frames;
};

aafInt64 CountOf(const Clock& clock, aafInt64 fps, bool drop) {
    const aafInt64 minutes = clock.hours * 60 + clock.minutes;
    const aafInt64 count = (minutes * 60 + clock.seconds) * fps + clock.frames;
    return drop ? count - DroppedNumbers(fps) * (minutes - minutes / 10) : count;
}

Clock ClockOf(aafInt64 count, aafInt64 fps, bool drop) {
    if (drop) {
        const aafInt64 dropped = DroppedNumbers(fps);
        const aafInt64 minute = fps * 60 - dropped;
        const aafInt64 tenMinutes = minute * 10 + dropped;
        const aafInt64 tens = count / tenMinutes;
        const aafInt64 rest = count % tenMinutes;
        const aafInt64 minutes = rest < fps * 60 ? 0 : 1 + (rest - fps * 60) / minute;
        count += dropped * (tens * 9 + minutes);
    }
    const aafInt64 seconds = count / fps;
    return {seconds / 3600, seconds / 60 % 60, seconds % 60, count % fps};
}

std::uint8_t* WordAt(Bytes& source, std::size_t at) {
    return source.data() + at;
}

void PutDigits(std::uint8_t* pair, aafInt64 number, std::uint8_t tensMask) {
    pair[0] = static_cast<std::uint8_t>((pair[0] & 0xF0) | (number % 10));
    pair[1] = static_cast<std::uint8_t>((pair[1] & ~tensMask) | (number / 10));
}

aafInt64 DigitsOf(const std::uint8_t* pair, std::uint8_t tensMask) {
    return (pair[0] & 0x0F) + (pair[1] & tensMask) * 10;
}

}  // namespace

aafInt64 TimecodeStream::FramesPerSecond() const {
    aafRational_t rate{};
    ReadStruct(prop::TimecodeStream_SampleRate, &rate);
    return NominalFrames(rate);
}

HRESULT TimecodeStream::GetSampleSize(aafUInt32* sampleSize) {
    if (sampleSize == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const std::size_t bytes = SampleBytes();
    if (bytes == 0) {
        return AAFRESULT_BAD_TYPE;
    }
    *sampleSize = static_cast<aafUInt32>(bytes);
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::GetSource(aafUInt32 valueSize, aafDataBuffer_t value,
                                  aafUInt32* bytesRead) {
    if (value == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* const source = FindValue(prop::TimecodeStream_Source);
    if (source == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    if (valueSize < source->bytes().size()) {
        return AAFRESULT_SMALLBUF;
    }
    std::copy(source->bytes().begin(), source->bytes().end(), value);
    *bytesRead = static_cast<aafUInt32>(source->bytes().size());
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::GetSourceBufLen(aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* const source = FindValue(prop::TimecodeStream_Source);
    if (source == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    *len = static_cast<aafUInt32>(source->bytes().size());
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::SetSource(aafUInt32 valueSize, aafDataBuffer_t value) {
    if (value == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    RequireValue(prop::TimecodeStream_Source)->BytesToChange().assign(value, value + valueSize);
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::FindSample(aafPosition_t position, std::size_t* at) const {
    const std::size_t bytes = SampleBytes();
    if (bytes == 0) {
        return AAFRESULT_BAD_TYPE;
    }
    const PropertyValue* const source = FindValue(prop::TimecodeStream_Source);
    if (source == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    if (position < 0 || static_cast<std::uint64_t>(position) >= source->bytes().size() / bytes) {
        return AAFRESULT_BADSAMPLEOFFSET;
    }
    *at = static_cast<std::size_t>(position) * bytes;
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::RequireSample(aafPosition_t position, std::size_t* at) {
    const std::size_t bytes = SampleBytes();
    if (bytes == 0) {
        return AAFRESULT_BAD_TYPE;
    }
    const PropertyValue* const present = FindValue(prop::TimecodeStream_Source);
    const std::size_t count = present == nullptr ? 0 : present->bytes().size() / bytes;
    if (position < 0 || static_cast<std::uint64_t>(position) > count) {
        return AAFRESULT_BADSAMPLEOFFSET;
    }
    *at = static_cast<std::size_t>(position) * bytes;
    Bytes& source = RequireValue(prop::TimecodeStream_Source)->BytesToChange();
    if (source.size() < *at + bytes) {
        source.resize(*at + bytes);
        if (bytes > kWordBytes) {
            std::copy_n(kSync, kSyncBytes, WordAt(source, *at) + kWordBytes);
        }
    }
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::GetPositionTimecode(aafPosition_t position, aafTimecode_t* timecode) {
    if (timecode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    std::size_t at = 0;
    if (const HRESULT result = FindSample(position, &at); result < 0) {
        return result;
    }
    const aafInt64 fps = FramesPerSecond();
    if (fps == 0) {
        return AAFRESULT_BADRATE;
    }
    const std::uint8_t* const word = FindValue(prop::TimecodeStream_Source)->bytes().data() + at;
    const bool drop = MayDrop(fps) && (word[1] & kDropFlag) != 0;
    const Clock clock{DigitsOf(word + 6, 0x03), DigitsOf(word + 4, 0x07), DigitsOf(word + 2, 0x07),
                      DigitsOf(word, 0x03)};
    *timecode = aafTimecode_t{CountOf(clock, fps, drop), drop ? kAAFTcDrop : kAAFTcNonDrop,
                              static_cast<aafUInt16>(fps)};
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::SetPositionTimecode(aafPosition_t position, aafTimecode_t timecode) {
    const aafInt64 fps = FramesPerSecond();
    if (fps == 0) {
        return AAFRESULT_BADRATE;
    }
    const bool drop = MayDrop(fps) && timecode.drop == kAAFTcDrop;
    const aafInt64 day = CountOf({kMinutesOfADay / 60, 0, 0, 0}, fps, drop);
    if ((!drop && timecode.drop != kAAFTcNonDrop) || timecode.fps != fps || fps > 40 ||
        timecode.startFrame < 0 || timecode.startFrame >= day) {
        return AAFRESULT_INVALID_TIMECODE;
    }
    std::size_t at = 0;
    if (const HRESULT result = RequireSample(position, &at); result < 0) {
        return result;
    }
    std::uint8_t* const word =
        WordAt(RequireValue(prop::TimecodeStream_Source)->BytesToChange(), at);
    const Clock clock = ClockOf(timecode.startFrame, fps, drop);
    PutDigits(word, clock.frames, 0x03);
    PutDigits(word + 2, clock.seconds, 0x07);
    PutDigits(word + 4, clock.minutes, 0x07);
    PutDigits(word + 6, clock.hours, 0x03);
    word[1] = static_cast<std::uint8_t>((word[1] & ~kDropFlag) | (drop ? kDropFlag : 0));
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::GetUserDataLength(aafInt32* length) {
    if (length == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (SampleBytes() == 0) {
        return AAFRESULT_BAD_TYPE;
    }
    *length = static_cast<aafInt32>(kWordBytes / 2);
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::GetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                              aafDataBuffer_t buffer) {
    if (buffer == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (buflen < static_cast<aafInt32>(kWordBytes / 2)) {
        return AAFRESULT_SMALLBUF;
    }
    std::size_t at = 0;
    if (const HRESULT result = FindSample(position, &at); result < 0) {
        return result;
    }
    const std::uint8_t* const word = FindValue(prop::TimecodeStream_Source)->bytes().data() + at;
    for (std::size_t pair = 0; pair < kWordBytes / 2; ++pair) {
        buffer[pair] = static_cast<aafUInt8>((word[2 * pair] >> 4) | (word[2 * pair + 1] & 0xF0));
    }
    return AAFRESULT_SUCCESS;
}

HRESULT TimecodeStream::SetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                              aafDataBuffer_t buffer) {
    if (buffer == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (buflen != static_cast<aafInt32>(kWordBytes / 2)) {
        return AAFRESULT_INVALID_PARM_SIZE;
    }
    std::size_t at = 0;
    if (const HRESULT result = RequireSample(position, &at); result < 0) {
        return result;
    }
    std::uint8_t* const word =
        WordAt(RequireValue(prop::TimecodeStream_Source)->BytesToChange(), at);
    for (std::size_t pair = 0; pair < kWordBytes / 2; ++pair) {
        std::uint8_t* const both = word + 2 * pair;
        both[0] = static_cast<std::uint8_t>((both[0] & 0x0F) | (buffer[pair] << 4));
        both[1] = static_cast<std::uint8_t>((both[1] & 0x0F) | (buffer[pair] & 0xF0));
    }
    return AAFRESULT_SUCCESS;
}

std::size_t TimecodeStream12M::SampleBytes() const {
    return IntegerOr(prop::TimecodeStream12M_IncludeSync, kAAFFalse) != 0 ? kWordBytes + kSyncBytes
                                                                          : kWordBytes;
}

}  // namespace aaf
