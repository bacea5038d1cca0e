// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Fresh.h"

#include <chrono>
#include <mutex>
#include <optional>
#include <random>

namespace aaf {

namespace {

std::mutex& PinLock() {
    static std::mutex lock;
    return lock;
}

// Guarded by PinLock.
std::optional<aafTimeStamp_t> pinnedTime;
std::optional<aafUID_t> pinnedGeneration;

// Splits days since 1970-01-01 into a date of the proleptic Gregorian calendar.
// Counting years from March puts the leap day at their end.
aafDateStruct_t DateOf(long long days) {
    const long long shifted = days + 719468;
    const long long era = (shifted >= 0 ? shifted : shifted - 146096) / 146097;
    const long long dayOfEra = shifted - era * 146097;
    const long long yearOfEra =
        (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const long long dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const long long monthFromMarch = (5 * dayOfYear + 2) / 153;
    const long long day = dayOfYear - (153 * monthFromMarch + 2) / 5 + 1;
    const long long month = monthFromMarch < 10 ? monthFromMarch + 3 : monthFromMarch - 9;
    const long long year = yearOfEra + era * 400 + (month <= 2 ? 1 : 0);
    return aafDateStruct_t{static_cast<aafInt16>(year), static_cast<aafUInt8>(month),
                           static_cast<aafUInt8>(day)};
}

}  // namespace

aafUID_t FreshId() {
    thread_local std::mt19937_64 generator{[] {
        std::random_device device;
        std::seed_seq seed{device(), device(), device(), device(),
                           device(), device(), device(), device()};
        return std::mt19937_64(seed);
    }()};
    const std::uint64_t high = generator();
    const std::uint64_t low = generator();
    aafUID_t id{};
    id.Data1 = static_cast<decltype(id.Data1)>(high >> 32);
    id.Data2 = static_cast<std::uint16_t>(high >> 16);
    // Version 4, variant 1: a random id.
    id.Data3 = static_cast<std::uint16_t>((high & 0x0FFF) | 0x4000);
    for (int at = 0; at < 8; ++at) {
        id.Data4[at] = static_cast<std::uint8_t>(low >> (8 * at));
    }
    id.Data4[0] = static_cast<std::uint8_t>((id.Data4[0] & 0x3F) | 0x80);
    return id;
}

aafTimeStamp_t CurrentTime() {
    {
        const std::lock_guard<std::mutex> guard(PinLock());
        if (pinnedTime) {
            return *pinnedTime;
        }
    }
    const long long seconds = std::chrono::duration_cast<std::chrono::seconds>(
                                  std::chrono::system_clock::now().time_since_epoch())
                                  .count();
    constexpr long long kDay = 86400;
    const long long secondOfDay = (seconds % kDay + kDay) % kDay;
    return aafTimeStamp_t{DateOf((seconds - secondOfDay) / kDay),
                          aafTimeStruct_t{static_cast<aafUInt8>(secondOfDay / 3600),
                                          static_cast<aafUInt8>(secondOfDay / 60 % 60),
                                          static_cast<aafUInt8>(secondOfDay % 60), 0}};
}

aafUID_t NewGenerationId() {
    {
        const std::lock_guard<std::mutex> guard(PinLock());
        if (pinnedGeneration) {
            return *pinnedGeneration;
        }
    }
    return FreshId();
}

void PinTime(const aafTimeStamp_t* time, const aafUID_t* generation) {
    const std::lock_guard<std::mutex> guard(PinLock());
    pinnedTime = time == nullptr ? std::nullopt : std::make_optional(*time);
    pinnedGeneration = generation == nullptr ? std::nullopt : std::make_optional(*generation);
}

}  // namespace aaf
