// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <algorithm>
#include <optional>

#include "reference_host/framework/Guard.h"
#include "reference_host/quicktime/MovieFile.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PacketSeek.h"
#include "reference_host/quicktime/PictureDecoder.h"
#include "reference_host/quicktime/PictureReader.h"
#include "reference_host/quicktime/Thumbnails.h"
#include "reference_host/quicktime/pixels/PictureWriter.h"

namespace host {
namespace {

// Where all samples claim to be sync samples, decoders that know other pictures by their
// content leave these out; for the rest only codecs without such pictures are believed.
bool AreTrueSyncs(const PictureOrder& order, AVCodecID id) {
    const AVCodecDescriptor* const codec = avcodec_descriptor_get(id);
    const int telling = AV_CODEC_PROP_INTRA_ONLY | AV_CODEC_PROP_REORDER;
    return !order.IsIntraOnly() || (codec && (codec->props & telling) != 0);
}

class ThumbnailReader final : public Thumbnails {
public:
    struct Source {
        std::filesystem::path path;
        int stream = -1;
        bool indexIsWhole = false;
        int width = 0;
        int height = 0;
    };
    ThumbnailReader(Source source, InputOwner input);

    int Width() const override { return source_.width; }
    int Height() const override { return source_.height; }
    std::size_t Count() const override { return order_.PictureCount(); }
    std::size_t SyncCount() const override { return syncs_.size(); }
    void SetForm(const ThumbnailForm& form) override;
    NCFRESULT Read(std::size_t picture, Which which, Thumbnail& thumbnail) override;

private:
    AVStream& Stream() const { return *input_->streams[source_.stream]; }
    std::optional<std::size_t> NearestSync(std::size_t picture) const;
    void FindSyncs();
    void LearnLead();
    bool OpenSyncDecoder();
    FrameOwner DecodeAlone(std::size_t picture);
    NCFRESULT ReadExactly(std::size_t picture, Thumbnail& thumbnail);
    bool Write(const AVFrame& frame, Thumbnail& thumbnail) const;

    Source source_;
    InputOwner input_;
    PictureOrder order_;
    std::vector<std::size_t> syncs_;       // their numbers, rising
    ncfSInt64 lead_ = 0;                   // of decoding before display, where the list tells none
    std::optional<std::size_t> lastSync_;  // that `last_` shows; neighbours often share it
    Thumbnail last_;
    ThumbnailForm form_;
    int halvings_ = 0;
    CodecOwner codec_;
    PacketOwner packet_;
    std::unique_ptr<PictureReader> exact_;  // opened when first needed
};

// Where the index names every sample it tells enough: a picture that is reordered counts as
// where it is decoded, which is near.
std::vector<PacketEntry> PacketsOf(AVFormatContext& input, int stream, bool indexIsWhole) {
    return indexIsWhole ? ListByIndex(*input.streams[stream])
                        : ListPackets(input, stream, indexIsWhole);
}

ThumbnailReader::ThumbnailReader(Source source, InputOwner input)
    : source_(std::move(source)),
      input_(std::move(input)),
      order_(PacketsOf(*input_, source_.stream, source_.indexIsWhole)),
      packet_(av_packet_alloc()) {
    UseOneStream(*input_, source_.stream);
    if (TellsTimesOfAll(*input_) && AreTrueSyncs(order_, Stream().codecpar->codec_id)) {
        FindSyncs();
    }
    if (source_.indexIsWhole) {
        LearnLead();
    }
}

void ThumbnailReader::FindSyncs() {
    for (std::size_t i = 0; i < order_.PictureCount(); ++i) {
        const PacketEntry& entry = order_.Packet(order_.PacketOfPicture(i));
        if (entry.isSync && !entry.second.isApart && entry.displayTime != AV_NOPTS_VALUE) {
            syncs_.push_back(i);
        }
    }
}

// The index has times of decoding alone, and those of display are sought. A sync sample leads
// by as much as the first one.
void ThumbnailReader::LearnLead() {
    while (packet_ && av_read_frame(input_.get(), packet_.get()) >= 0) {
        const bool isFirst = packet_->stream_index == source_.stream;
        if (isFirst && packet_->pts != AV_NOPTS_VALUE && packet_->dts != AV_NOPTS_VALUE) {
            lead_ = packet_->pts - packet_->dts;
        }
        av_packet_unref(packet_.get());
        if (isFirst) {
            return;
        }
    }
}

void ThumbnailReader::SetForm(const ThumbnailForm& form) {
    form_ = form;
    form_.width = std::clamp(form.width, 1, source_.width);
    form_.height = std::clamp(form.height, 1, source_.height);
    const int times = std::min(source_.width / form_.width, source_.height / form_.height);
    const int most = MostHalvings(Stream());
    halvings_ = 0;
    // Chroma, which may have half the sides, is to stay no smaller than the thumbnail.
    while (halvings_ < most && 4 << halvings_ <= times) {
        ++halvings_;
    }
    codec_.reset();
    lastSync_.reset();
}

std::optional<std::size_t> ThumbnailReader::NearestSync(std::size_t picture) const {
    const auto behind = std::lower_bound(syncs_.begin(), syncs_.end(), picture);
    if (behind == syncs_.begin()) {
        return syncs_.empty() ? std::nullopt : std::optional(syncs_.front());
    }
    const std::size_t before = *std::prev(behind);
    return behind == syncs_.end() || picture - before <= *behind - picture ? before : *behind;
}

bool ThumbnailReader::OpenSyncDecoder() {
    if (!codec_) {
        codec_ = OpenPictureDecoder(Stream(), DecoderUse::SyncSamples, halvings_);
    }
    return codec_ != nullptr;
}

// Null where it takes more than this one sample.
FrameOwner ThumbnailReader::DecodeAlone(std::size_t picture) {
    const bool isThere =
        OpenSyncDecoder() && packet_ &&
        ReadPacketOf(*input_, source_.stream, order_.Packet(order_.PacketOfPicture(picture)), lead_,
                     *packet_) &&
        (packet_->flags & AV_PKT_FLAG_CORRUPT) == 0;
    FrameOwner frame(av_frame_alloc());
    const bool isDecoded = isThere && frame &&
                           avcodec_send_packet(codec_.get(), packet_.get()) >= 0 &&
                           avcodec_send_packet(codec_.get(), nullptr) >= 0 &&
                           avcodec_receive_frame(codec_.get(), frame.get()) >= 0;
    if (packet_) {
        av_packet_unref(packet_.get());
    }
    if (codec_) {
        avcodec_flush_buffers(codec_.get());
    }
    // The palette may have come with another sample.
    const bool isWhole = isDecoded && !IsDamaged(*frame) && frame->format != AV_PIX_FMT_PAL8;
    return isWhole ? std::move(frame) : nullptr;
}

NCFRESULT ThumbnailReader::ReadExactly(std::size_t picture, Thumbnail& thumbnail) {
    if (!exact_) {
        exact_ = PictureReader::Open(source_.path, source_.stream, source_.indexIsWhole);
        Need(exact_ != nullptr, NCF_E_FAIL);
    }
    std::shared_ptr<const AVFrame> frame;
    const NCFRESULT result = exact_->Read(picture, frame);
    return result != NCF_OK || Write(*frame, thumbnail) ? result : NCF_E_FAIL;
}

NCFRESULT ThumbnailReader::Read(std::size_t picture, Which which, Thumbnail& thumbnail) {
    return Guarded([&] {
        Need(picture < Count(), NMA_E_NODATA);
        const std::optional<std::size_t> sync =
            which == Which::NearestSync ? NearestSync(picture) : std::nullopt;
        if (sync && sync != lastSync_) {
            const FrameOwner frame = DecodeAlone(*sync);
            lastSync_.reset();
            if (frame && Write(*frame, last_)) {
                lastSync_ = sync;
            }
        }
        if (sync && sync == lastSync_) {
            thumbnail = last_;
            return NCF_OK;
        }
        return ReadExactly(picture, thumbnail);
    });
}

bool ThumbnailReader::Write(const AVFrame& frame, Thumbnail& thumbnail) const {
    const auto write = [&](int width, int height) {
        SmallPicture picture{source_.width, source_.height, width, height};
        picture.matrix = form_.matrix == ThumbnailForm::Matrix::Rec601   ? AVCOL_SPC_SMPTE170M
                         : form_.matrix == ThumbnailForm::Matrix::Rec709 ? AVCOL_SPC_BT709
                                                                         : AVCOL_SPC_UNSPECIFIED;
        const ncfUInt32 size = PictureBytes(PixelLayout::Bgra8, static_cast<ncfUInt32>(width),
                                            static_cast<ncfUInt32>(height));
        thumbnail.width = width;
        thumbnail.height = height;
        thumbnail.bytes.resize(size);
        return size != 0 && WriteSmallPicture(frame, picture, thumbnail.bytes.data());
    };
    // What can't be made smaller is taken as it is.
    return write(form_.width, form_.height) || write(source_.width, source_.height);
}

}  // namespace

std::unique_ptr<Thumbnails> OpenThumbnails(const std::filesystem::path& movie) {
    std::string ignored;
    const auto file = MovieFile::Open(movie, ignored);
    const ncfUInt32 track = file ? file->FirstVideo() : 0;
    if (track == 0) {
        return nullptr;
    }
    const MovieFile::Raster raster = file->RasterOf(track);
    ThumbnailReader::Source source{movie, file->StreamOf(track), file->IndexIsWhole(), raster.width,
                                   raster.height};
    InputOwner input = OpenForPictures(movie, source.stream);
    const bool canBeRead =
        input && source.width > 0 && source.height > 0 &&
        avcodec_find_decoder(input->streams[source.stream]->codecpar->codec_id) != nullptr;
    if (!canBeRead) {
        return nullptr;
    }
    auto thumbnails = std::make_unique<ThumbnailReader>(std::move(source), std::move(input));
    thumbnails->SetForm({});
    return thumbnails;
}

}  // namespace host
