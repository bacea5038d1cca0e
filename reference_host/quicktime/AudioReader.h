// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>
#include <memory>
#include <mutex>

#include "host_interfaces/quicktime/Readers.h"
#include "reference_host/framework/Component.h"
#include "reference_host/quicktime/EditedSound.h"

namespace host {

// The wrapper's audio reader. Each track has a decoder and parameters of its
// own, so that tracks negotiated in turn do not disturb each other.
class AudioReader final : public Component<QTWrapper::IQTAudioReader> {
public:
    // The stream of each sound track, by the track's number.
    AudioReader(std::filesystem::path path, std::map<ncfUInt32, EditedSound::Source> streams,
                bool hasWholeIndex)
        : path_(std::move(path)), streams_(std::move(streams)), hasWholeIndex_(hasWholeIndex) {}

    NCFRESULT SetParams(ncfUInt32 track, ncfUInt32 bytesPerSample, ncfUInt8 littleEndian,
                        double sampleRate, ncfUInt32& channels) override;
    NCFRESULT ReadSamples(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* count, void* destination,
                          ncfUInt64 size, ncfUInt8, ncfUInt8) override;

private:
    struct Track {
        int bytesPerSample = 0;  // 0: no parameters yet
        bool littleEndian = false;
        std::unique_ptr<EditedSound> decoder;
    };

    std::mutex mutex_;
    std::filesystem::path path_;
    std::map<ncfUInt32, EditedSound::Source> streams_;
    bool hasWholeIndex_;
    std::map<ncfUInt32, Track> tracks_;
    std::vector<ncfSInt32> words_;
};

}  // namespace host
