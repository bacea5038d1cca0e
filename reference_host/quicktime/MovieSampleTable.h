// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>
#include <mutex>
#include <vector>

#include "host_interfaces/quicktime/SampleTable.h"
#include "reference_host/framework/Component.h"
#include "reference_host/quicktime/PacketList.h"

namespace host {

// The wrapper's sample table: every stored sample, edit lists left aside. A
// track is read when it is first asked for. Linear sound counts each frame of
// all channels as a sample, though the container stores many together. Places of
// samples are refused where no bytes of the file are the sample.
class MovieSampleTable final : public Component<QTWrapper::IQTWSampleTable> {
public:
    struct Source {
        std::filesystem::path path;
        std::map<ncfUInt32, int> streams;  // of each track
        bool indexIsWhole = false;
        // Of each stream: samples, from 0, with another description than before.
        std::map<int, std::vector<ncfUInt64>> descriptionChanges;
    };
    explicit MovieSampleTable(Source source) : source_(std::move(source)) {}

    NCFRESULT GetNumSamples(ncfUInt32 track, ncfUInt64* n) override;
    NCFRESULT GetDataOffset(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* position) override;
    NCFRESULT GetSampleFlags(ncfUInt32 track, ncfUInt64 sample,
                             QTWrapper::QTWSamplePropertyFlags_t* flags) override;
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32 track, ncfUInt64 sample,
                                                      ncfUInt64* next) override;
    NCFRESULT GetDataSizePerSample(ncfUInt32 track, ncfUInt64 sample, ncfUInt32* bytes) override;
    NCFRESULT GetDisplayOffset(ncfUInt32 track, ncfUInt64 sample, ncfSInt64* offset) override;
    NCFRESULT GetDecodeDuration(ncfUInt32 track, ncfUInt64 sample, ncfSInt64* duration) override;
    ncfUInt32 GetMaxDataSize(ncfUInt32 track) override;
    ncfBool HasOutOfOrderFrameDependencies(ncfUInt32 track) override;

private:
    struct Track {
        std::vector<PacketEntry> packets;
        std::vector<ncfUInt64> firstSamples;  // of each packet, when one holds several
        std::vector<std::size_t> runEnds;     // of each packet: where bytes stop following
        ncfUInt64 samples = 0;
        ncfUInt32 frameBytes = 0;  // of linear sound, else 0
        ncfSInt64 frameDuration = 1;
        ncfSInt64 shift = 0;  // offsets relative to display order
        // Whether each sample's bytes stand in the file as they are; program and
        // transport streams cut them up.
        bool isPlain = true;
        std::vector<ncfUInt64> descriptionChanges;
    };
    struct Place {
        std::size_t packet;
        ncfUInt64 within;  // samples of the packet before this one
    };

    const Track* Find(ncfUInt32 track);
    Track Load(int stream) const;
    template <class Out, class Value>
    NCFRESULT ForSample(ncfUInt32 track, ncfUInt64 sample, Out* out, Value value);
    template <class Out, class Value>
    NCFRESULT ForPlainSample(ncfUInt32 track, ncfUInt64 sample, Out* out, Value value);
    static Place PlaceOf(const Track& track, ncfUInt64 sample);
    static ncfSInt64 OffsetOf(const Track& track, const PacketEntry& packet);

    std::mutex mutex_;
    const Source source_;
    std::map<int, Track> tracks_;  // by stream
};

}  // namespace host
