// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SyncTeller.h"

#include <algorithm>
#include <cstdint>
#include <iterator>

#include "reference_host/quicktime/CodecParser.h"

namespace host {
namespace {

// Whose parsers know the kind of each picture.
constexpr AVCodecID kParsed[] = {AV_CODEC_ID_H264,       AV_CODEC_ID_HEVC,  AV_CODEC_ID_MPEG1VIDEO,
                                 AV_CODEC_ID_MPEG2VIDEO, AV_CODEC_ID_MPEG4, AV_CODEC_ID_H263,
                                 AV_CODEC_ID_VP9};

class ParsedSyncs final : public SyncTeller {
public:
    explicit ParsedSyncs(const AVStream& stream) : parser_(*stream.codecpar) {}

    bool StandsAlone(const AVPacket& packet) override {
        AVCodecParserContext* const parser = parser_.get();
        if (!parser) {
            return false;
        }
        parser->key_frame = -1;
        parser->pict_type = AV_PICTURE_TYPE_NONE;
        parser_.Look(packet);
        // A point of recovery may lie at a picture that leans on others, too.
        return parser->key_frame != 0 && parser->pict_type == AV_PICTURE_TYPE_I;
    }

private:
    CodecParser parser_;
};

// Bytes of a packet in order; zeros behind the end, where `isWhole` is taken back.
class Bytes {
public:
    explicit Bytes(const AVPacket& packet) : at_(packet.data), end_(packet.data + packet.size) {}

    int Byte() {
        isWhole_ = isWhole_ && at_ < end_;
        return isWhole_ ? *at_++ : 0;
    }
    int Word() {
        const int high = Byte();
        return high << 8 | Byte();
    }
    void Skip(std::ptrdiff_t count) {
        isWhole_ = isWhole_ && end_ - at_ >= count;
        at_ += isWhole_ ? count : 0;
    }
    bool IsWhole() const { return isWhole_; }

private:
    const std::uint8_t* at_;
    const std::uint8_t* end_;
    bool isWhole_ = true;
};

// Runs of pixels that tell which of the picture before they leave as they are. One that writes
// every pixel stands alone.
class RunLengthSyncs final : public SyncTeller {
public:
    RunLengthSyncs(int width, int height, int bits)
        : height_(height),
          bytesOfUnit_(bits == 8 ? 4 : bits / 8),
          unitsOfLine_(bits == 8 ? (width + 3) / 4 : width) {}

    static bool Knows(int bits) { return bits == 8 || bits == 16 || bits == 24 || bits == 32; }

    bool StandsAlone(const AVPacket& packet) override {
        constexpr int kOfSomeLines = 8;
        Bytes bytes(packet);
        bytes.Skip(4);  // its size
        if ((bytes.Word() & kOfSomeLines) != 0) {
            const int first = bytes.Word();
            bytes.Skip(2);
            const int lines = bytes.Word();
            bytes.Skip(2);
            if (first != 0 || lines != height_) {
                return false;
            }
        }
        for (int line = 0; line < height_; ++line) {
            if (!IsWholeLine(bytes)) {
                return false;
            }
        }
        return true;
    }

private:
    bool IsWholeLine(Bytes& bytes) const {
        constexpr int kNoneSkipped = 1, kEndOfLine = -1;
        if (bytes.Byte() != kNoneSkipped) {
            return false;
        }
        int units = 0;
        for (;;) {
            const int run = static_cast<std::int8_t>(bytes.Byte());
            if (run == kEndOfLine || !bytes.IsWhole()) {
                return bytes.IsWhole() && units == unitsOfLine_;
            }
            if (run == 0 && bytes.Byte() != kNoneSkipped) {
                return false;
            }
            bytes.Skip(std::ptrdiff_t{bytesOfUnit_} * (run < 0 ? 1 : run));
            // Of a line that is too long this is one too many.
            units = std::min(units + (run < 0 ? -run : run), unitsOfLine_ + 1);
        }
    }

    int height_;
    int bytesOfUnit_;
    int unitsOfLine_;
};

}  // namespace

std::unique_ptr<SyncTeller> SyncTeller::Of(const AVStream& stream) {
    const AVCodecParameters& form = *stream.codecpar;
    // Grey is told by 32 more.
    const int bits = form.bits_per_coded_sample > 32 ? form.bits_per_coded_sample - 32
                                                     : form.bits_per_coded_sample;
    if (form.codec_id == AV_CODEC_ID_QTRLE && RunLengthSyncs::Knows(bits)) {
        return std::make_unique<RunLengthSyncs>(form.width, form.height, bits);
    }
    if (std::find(std::begin(kParsed), std::end(kParsed), form.codec_id) != std::end(kParsed)) {
        return std::make_unique<ParsedSyncs>(stream);
    }
    return nullptr;
}

}  // namespace host
