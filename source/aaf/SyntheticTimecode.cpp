// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <cstdio>
#include <ctime>

#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/util/NMAUtil.h"
#include "source/aaf/EditUnits.h"
#include "source/aaf/Timecode.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/os/Os.h"

namespace NMA::Impl {
namespace {

NCF_FUNCTION("NMA::Impl::AddSyntheticTimeCode");

// The file's last write in UTC. A date that can't be read counts as midnight;
// the line belongs to the query, though it names the conversion, which fails
// without a word.
std::tm FileDate(const NMAString& path) {
    std::tm utcTime{};
    os::FileTime written = 0;
    if (!os::GetLastWriteTime(path.GetUTF16String(), &written)) {
        const ncfUInt32 error = os::LastError();
        slog::Error(ncfFunction) << " - FileTimeToSystemTime, hresult: " << error;
        return utcTime;
    }
    os::DateTime date{};
    if (!os::ToDateTime(written, &date)) {
        return utcTime;
    }
    utcTime.tm_sec = date.second;
    utcTime.tm_min = date.minute;
    utcTime.tm_hour = date.hour;
    utcTime.tm_mday = date.day;
    utcTime.tm_mon = date.month - 1;
    utcTime.tm_year = date.year - 1900;
    utcTime.tm_wday = date.dayOfWeek - 1;  // Sunday is -1
    utcTime.tm_isdst = -1;
    return utcTime;
}

void TellDate(const NCFSmartPtr<INCFConsole>& console, const std::tm& date) {
    char text[128];
    std::snprintf(text, sizeof(text), "day %d, hour %d, minute %d, second %d\n", date.tm_mday,
                  date.tm_hour, date.tm_min, date.tm_sec);
    console->Write(4, "Modification Date is %s\n", text);
}

}  // namespace

NCFRESULT AddSyntheticTimeCode(std::tr1::shared_ptr<BaseClip> media, ncfUInt32* totalExistingSlots,
                               NCFSmartPtr<INCFConsole> pConsole,
                               IAAFSmartPointer<IAAFDictionary> pDictionary,
                               IAAFSmartPointer<IAAFMob> pMobSourceMob) {
    CHK_PTR(media.get());
    CHK_PTR(totalExistingSlots);
    CHK_PTR(pConsole);
    CHK_PTR(pDictionary);
    CHK_PTR(pMobSourceMob);

    Rational movieEditRate;
    ncfUInt64 movieLength = 0;
    NCF_RETURN(media->GetEditRate(&movieEditRate));
    NCF_RETURN(media->GetMovieLength(&movieLength));
    const aafRational_t aafEditRate = AAFRational(movieEditRate);
    const ncfUInt16 numFPS = (ncfUInt16)WholeRate(movieEditRate);

    const std::tm utcTime = FileDate(NMAString(media->GetFileName().inArg(), kNCFWCHAR));
    const std::tm* const pUTCTime = &utcTime;
    TellDate(pConsole, utcTime);

    // Counted as drop frame whatever the rate.
    ncfUInt32 tcInFrames = 0;
    NCF_RETURN_TEXT(
        "ConvertTCToFrames( pUTCTime->tm_hour, pUTCTime->tm_min, pUTCTime->tm_sec, 0, numFPS, "
        "TRUE, &tcInFrames)",
        ConvertTCToFrames((ncfUInt32)pUTCTime->tm_hour, (ncfUInt32)pUTCTime->tm_min,
                          (ncfUInt32)pUTCTime->tm_sec, 0, numFPS, true, &tcInFrames));

    const ncfUInt32 maxDuration = GetMaxDuration(numFPS, false);
    ncfUInt32 tcTrackNum = *totalExistingSlots;
    const aafTimecode_t timecode = {0, kAAFTcNonDrop, numFPS};
    NCF_RETURN(AddTimecodeAAFTrack( timecode, tcTrackNum++, (*totalExistingSlots)++, aafEditRate,
                                   maxDuration, 0, 0, pDictionary, pMobSourceMob));
    const aafTimecode_t auxTimecode = {tcInFrames, kAAFTcDrop, numFPS};
    NCF_RETURN(AddTimecodeAAFTrack( auxTimecode, tcTrackNum, (*totalExistingSlots)++, aafEditRate,
                                   movieLength, maxDuration, 0, pDictionary, pMobSourceMob));
    return NCF_OK;
}

}  // namespace NMA::Impl
