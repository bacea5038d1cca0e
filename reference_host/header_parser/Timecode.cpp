// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Timecode.h"

namespace header_parser {

namespace {

// Frame numbers that drop-frame counting leaves out at the start of each
// minute but every tenth: 2 at 30 frames a second, 4 at 60. At rates that are
// no multiple of 30 there is nothing to leave out.
ncfUInt64 DroppedPerMinute(const TimecodeDescription& description) {
    const bool drops = description.IsDropFrame() && description.numFrames % 30 == 0;
    return drops ? description.numFrames / 15 : 0;
}

ncfUInt64 FramesInTenMinutes(const TimecodeDescription& description) {
    return ncfUInt64{description.numFrames} * 600 - 9 * DroppedPerMinute(description);
}

ncfUInt64 FramesInDay(const TimecodeDescription& description) {
    return FramesInTenMinutes(description) * 6 * 24;
}

TimecodeAddress AddressOf(ncfUInt64 frame, const TimecodeDescription& description) {
    const ncfUInt64 rate = description.numFrames;
    const ncfUInt64 dropped = DroppedPerMinute(description);
    if (dropped != 0) {
        const ncfUInt64 tens = frame / FramesInTenMinutes(description);
        const ncfUInt64 rest = frame % FramesInTenMinutes(description);
        const ncfUInt64 minutes = rest < rate * 60 ? 0 : (rest - dropped) / (rate * 60 - dropped);
        frame += dropped * (9 * tens + minutes);
    }
    TimecodeAddress address;
    address.frames = static_cast<ncfUInt8>(frame % rate);
    address.seconds = static_cast<ncfUInt8>(frame / rate % 60);
    address.minutes = static_cast<ncfUInt8>(frame / rate / 60 % 60);
    address.hours = static_cast<ncfUInt8>(frame / rate / 3600 % 24);
    return address;
}

// The stored number is the rate rounded up. Some recorders cut it off, and
// write 29 for 29.97; they still count in thirties.
ncfUInt32 FramesPerSecond(const TimecodeDescription& description) {
    if (description.frameDuration == 0 || description.IsCounter()) {
        return description.numFrames;
    }
    const ncfUInt32 whole = description.timeScale / description.frameDuration;
    const ncfUInt32 rest = description.timeScale % description.frameDuration;
    const bool isCutOff = description.numFrames == whole && whole != 0 && whole < 255 &&
                          rest >= description.frameDuration - rest;
    return isCutOff ? whole + 1 : description.numFrames;
}

// Hours, minutes with the sign on top, seconds and frames, one byte each.
bool IsPackedAddress(const ncfUInt8* sample, const TimecodeDescription& description) {
    return sample[0] < 24 && (sample[1] & 0x7F) < 60 && sample[2] < 60 &&
           sample[3] < description.numFrames;
}

}  // namespace

TimecodeDescription ReadTimecodeDescription(const Atom& entry) {
    ByteReader reader(entry.begin, entry.end);
    TimecodeDescription description;
    reader.Skip(6 + 2 + 4);  // reserved, data reference, reserved
    description.flags = reader.U32();
    description.timeScale = reader.U32();
    description.frameDuration = reader.U32();
    description.numFrames = reader.U8();
    description.numFrames = FramesPerSecond(description);
    description.isPresent = !reader.Failed() && entry.type == Code("tmcd");
    return description;
}

// Nearly every writer stores the number of the frame. A few old ones stored
// the address itself; it is known by being no frame of a day while its bytes
// are an address. Numbers wrap at midnight, also below zero.
TimecodeAddress ReadTimecodeSample(const ncfUInt8* sample, const TimecodeDescription& description) {
    const ncfUInt32 number = LoadU32(sample);
    const ncfUInt64 day = FramesInDay(description);
    if (description.IsCounter()) {
        return AddressOf(number % day, description);
    }
    if (number < day) {
        return AddressOf(number, description);
    }
    if (IsPackedAddress(sample, description)) {
        return {sample[0], static_cast<ncfUInt8>(sample[1] & 0x7F), sample[2], sample[3]};
    }
    const ncfSInt64 within = static_cast<ncfSInt32>(number) % static_cast<ncfSInt64>(day);
    return AddressOf(
        static_cast<ncfUInt64>(within < 0 ? within + static_cast<ncfSInt64>(day) : within),
        description);
}

}  // namespace header_parser
