// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/SampleProviderPolicy.h"

#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

NCFRESULT MovieRequiresSampleProviderForVideo(NCFSmartPtr<INCFConsole> console,
                                              std::tr1::shared_ptr<BaseClip> media,
                                              AAFInfo* aafInfo) {
    NCF_FUNCTION("MovieRequiresSampleProviderForVideo");
    CHK_INARG(console);
    CHK_INARG(media.get());
    const NCFRESULT answer = media->IsVideoSampleProviderMedia(aafInfo);
    if (answer == 0) {
        console->Write(2, "Forcing sample provider mode for video.\n");
        slog::Progress(ncfFunction) << "Forcing sample provider mode for video!";
    }
    return answer;
}

NCFRESULT MovieRequiresSampleProviderForAudio(NCFSmartPtr<INCFConsole> console,
                                              std::tr1::shared_ptr<BaseClip> media,
                                              ncfUInt32 qtTrack, ncfUInt64* numAudioSamples) {
    NCF_FUNCTION("MovieRequiresSampleProviderForAudio");
    CHK_PTR(media.get());
    const NCFRESULT answer = media->IsAudioSampleProviderMedia(qtTrack, numAudioSamples);
    if (answer == 0) {
        console->Write(2, "Forcing sample provider mode for audio track %lld.\n",
                       static_cast<long long>(qtTrack));
        slog::Progress(ncfFunction)
            << "Forcing sample provider mode for audio track: " << qtTrack << " is enabled!";
    }
    return answer;
}
