// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/system/SoundMovies.h"

#include <gtest/gtest.h>

#include <random>

#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

using movies::Bytes;

// Bits of a packet, to be written anew.
class Bits {
public:
    explicit Bits(const Bytes& bytes) {
        for (const std::uint8_t byte : bytes) {
            Put(byte, 8);
        }
    }
    void Put(unsigned value, unsigned count) {
        while (count-- > 0) {
            bits_.push_back((value >> count & 1u) != 0);
        }
    }
    // The last element of a packet of AAC is three ones, and zeros up to the byte.
    bool DropEnd() {
        while (!bits_.empty() && !bits_.back()) {
            bits_.pop_back();
        }
        for (int i = 0; i < 3; ++i) {
            if (bits_.empty() || !bits_.back()) {
                return false;
            }
            bits_.pop_back();
        }
        return true;
    }
    Bytes ToBytes() const {
        Bytes bytes((bits_.size() + 7) / 8, 0);
        for (std::size_t i = 0; i < bits_.size(); ++i) {
            bytes[i / 8] =
                static_cast<std::uint8_t>(bytes[i / 8] | (bits_[i] ? 0x80u >> i % 8 : 0u));
        }
        return bytes;
    }

private:
    std::vector<bool> bits_;
};

}  // namespace

SoundPackets SoundPacketsOf(const std::filesystem::path& file) {
    const Bytes bytes = ReadFile(file);
    SoundPackets packets;
    for (const Packet& packet : PacketsOf(file, "a:0")) {
        const auto begin = bytes.begin() + static_cast<std::ptrdiff_t>(packet.position);
        packets.emplace_back(begin, begin + static_cast<std::ptrdiff_t>(packet.size));
    }
    EXPECT_FALSE(packets.empty()) << file;
    return packets;
}

SoundPackets Joined(const SoundPackets& first, const SoundPackets& second) {
    SoundPackets all = first;
    all.insert(all.end(), second.begin(), second.end());
    return all;
}

movies::Track SoundTrackOf(const SoundPackets& packets, const movies::SoundFormat& format,
                           std::uint32_t timeScale, std::uint32_t duration) {
    movies::Track track = movies::SoundTrack(format, 1);
    track.mediaTimeScale = timeScale;
    track.samples.clear();
    for (const Bytes& packet : packets) {
        movies::SampleRun run;
        run.size = static_cast<std::uint32_t>(packet.size());
        run.duration = duration;
        track.samples.push_back(run);
        track.data.insert(track.data.end(), packet.begin(), packet.end());
    }
    return track;
}

movies::SoundFormat Mpeg4Sound(unsigned kind, const Bytes& config, unsigned channels, double rate) {
    const auto configSize = static_cast<unsigned>(config.size());
    movies::Box esds("esds");
    esds.Version(0).U8(3).U8(20 + configSize).U16(0).U8(0);
    esds.U8(4).U8(15 + configSize).U8(kind).U8(0x15).Zeros(11);
    esds.U8(5).U8(configSize).Raw(config);
    movies::SoundFormat format;
    format.codec = "mp4a";
    format.channels = channels;
    format.rate = rate;
    format.extensions = {esds};
    return format;
}

SoundPackets WithEmptyBandExtension(const SoundPackets& packets) {
    SoundPackets extended;
    for (const Bytes& packet : packets) {
        Bits bits(packet);
        EXPECT_TRUE(bits.DropEnd());
        bits.Put(6, 3);    // a filling element
        bits.Put(2, 4);    // of two bytes
        bits.Put(0xD, 4);  // an extension of bands
        bits.Put(0, 12);   // without a header of its own
        bits.Put(7, 3);
        extended.push_back(bits.ToBytes());
    }
    return extended;
}

SoundPackets TelephoneBlocks(std::size_t count, unsigned seed) {
    std::mt19937 random(seed);
    SoundPackets blocks;
    for (std::size_t i = 0; i < count; ++i) {
        Bytes block = {0x04};  // the lowest rate, a good block
        for (int byte = 1; byte < 13; ++byte) {
            block.push_back(static_cast<std::uint8_t>(random()));
        }
        blocks.push_back(block);
    }
    return blocks;
}
