// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FrameSink.h"

#include <fmt/format.h>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/cliphost/PixelsToPicture.h"
#include "reference_host/cliphost/PngFile.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

using host::DisplayPath;

void WriteRaw(OutputFile& output, const FrameReader& reader) {
    output.Write(reader.bytes(), static_cast<std::size_t>(reader.frameBytes()));
}

// Gives the picture that was written.
Picture WritePng(const std::filesystem::path& file, const FrameReader& reader,
                 const FrameReader* alpha, const PictureTurn& turn) {
    Picture picture = reader.ToPicture();
    if (alpha) {
        picture = WithAlpha(picture, alpha->ToPicture());
    }
    picture = Turned(std::move(picture), turn);
    const std::vector<unsigned char> png = ToPng(picture);
    if (png.empty()) {
        throw Failure(
            kExitFile, file,
            fmt::format("a picture of {} x {} in the format {} can't be written as a PNG file",
                        reader.width(), reader.height(), reader.layout().name),
            "write a .raw file");
    }
    WriteWholeFile(file, png);
    return picture;
}

class RawSink final : public FrameSink {
public:
    explicit RawSink(const std::filesystem::path& file) : file_(file), output_(file) {}

    void Take(std::uint64_t, const FrameReader& reader, const FrameReader*) override {
        WriteRaw(output_, reader);
        ++frames_;
    }
    void TakeMade(const MadeFrame& made) override {
        AppendTo(output_, made.file, made.bytes, file_);
        ++frames_;
    }
    std::filesystem::path PlaceOf(std::uint64_t) const override { return file_; }
    void Finish() override { output_.Finish(); }
    std::string Summary() const override {
        return host::system::IsStandardOutput(file_)
                   ? std::string()
                   : fmt::format("{}: {}", DisplayPath(file_), Counted(frames_, "raw frame"));
    }
    bool IsRaw() const override { return true; }

private:
    std::filesystem::path file_;
    OutputFile output_;
    std::uint64_t frames_ = 0;
};

class PngSink final : public FrameSink {
public:
    PngSink(std::filesystem::path file, const PictureTurn& turn)
        : file_(std::move(file)), turn_(turn) {}

    void Take(std::uint64_t frame, const FrameReader& reader, const FrameReader* alpha) override {
        Tell(WriteFrameFile(file_, frame, reader, alpha, turn_, false));
    }
    void TakeMade(const MadeFrame& made) override {
        PutIntoPlace(made.file, file_);
        Tell(made);
    }
    std::filesystem::path PlaceOf(std::uint64_t) const override { return file_; }
    void Finish() override {}
    std::string Summary() const override { return words_; }
    bool IsRaw() const override { return false; }

private:
    void Tell(const MadeFrame& made) {
        words_ = fmt::format("{}: frame {}, {} x {}", DisplayPath(file_), made.frame, made.width,
                             made.height);
    }

    std::filesystem::path file_;
    PictureTurn turn_;
    std::string words_;
};

class FolderSink final : public FrameSink {
public:
    FolderSink(std::filesystem::path folder, std::filesystem::path stem, const PictureTurn& turn)
        : folder_(std::move(folder)), made_(folder_), stem_(std::move(stem)), turn_(turn) {}

    void Take(std::uint64_t frame, const FrameReader& reader, const FrameReader* alpha) override {
        WritePng(PlaceOf(frame), reader, alpha, turn_);
        ++frames_;
    }
    void TakeMade(const MadeFrame& made) override {
        PutIntoPlace(made.file, PlaceOf(made.frame));
        ++frames_;
    }
    std::filesystem::path PlaceOf(std::uint64_t frame) const override {
        std::filesystem::path name = stem_;
        name += fmt::format("_{:06}.png", frame);
        return folder_ / name;
    }
    void Finish() override {}
    std::string Summary() const override {
        return fmt::format("{}: {}", DisplayPath(folder_), Counted(frames_, "picture"));
    }
    bool IsRaw() const override { return false; }

private:
    std::filesystem::path folder_;
    OutputFolder made_;
    std::filesystem::path stem_;
    PictureTurn turn_;
    std::uint64_t frames_ = 0;
};

}  // namespace

MadeFrame WriteFrameFile(const std::filesystem::path& file, std::uint64_t frame,
                         const FrameReader& reader, const FrameReader* alpha,
                         const PictureTurn& turn, bool isRaw) {
    if (isRaw) {
        OutputFile output(file);
        WriteRaw(output, reader);
        output.Finish();
        return {frame, file, reader.width(), reader.height(), reader.frameBytes()};
    }
    const Picture picture = WritePng(file, reader, alpha, turn);
    return {frame, file, picture.width, picture.height, 0};
}

bool IsRawFile(const std::filesystem::path& output) {
    std::error_code ignored;
    return output.extension() == ".raw" && !std::filesystem::is_directory(output, ignored);
}

std::unique_ptr<FrameSink> MakeFrameSink(const std::filesystem::path& output,
                                         const std::filesystem::path& movie, bool isOneFrame,
                                         const PictureTurn& turn) {
    const std::string ending = host::system::PathText(output.extension());
    std::error_code ignored;
    RefuseOutputOntoMovie(output, movie);
    if (std::filesystem::is_directory(output, ignored)) {
        return std::make_unique<FolderSink>(output, movie.stem(), turn);
    }
    if (host::system::DescriptorOf(output) || IsRawFile(output) ||
        (OutputFile::IsDevice(output) && ending != ".png")) {
        return std::make_unique<RawSink>(output);
    }
    if (ending == ".png") {
        if (isOneFrame) {
            return std::make_unique<PngSink>(output, turn);
        }
        throw Failure(kExitCaller, output, "a PNG file holds one frame",
                      "give a folder or a .raw file for a range");
    }
    if (!ending.empty()) {
        throw Failure(kExitCaller, output,
                      fmt::format("a name that ends in '{}' can't be written", ending),
                      "give FILE.png, FILE.raw, a folder, or - for standard output");
    }
    return std::make_unique<FolderSink>(output, movie.stem(), turn);
}

std::string RawWords(const FrameReader& reader, const ClipTrack& track) {
    std::string words = fmt::format("raw frames: {} x {}, {}, {} a frame, {}", reader.width(),
                                    reader.height(), WordsFor(reader.format()),
                                    Counted(reader.frameBytes(), "byte"), RateWords(track));
    const char* const name = reader.layout().rawName;
    if (!name) {
        return words +
               "\nFFmpeg has no name for this layout; choose another with --format, if one "
               "is offered";
    }
    words += fmt::format("\nfor FFmpeg: -f rawvideo -pixel_format {} -video_size {}x{}", name,
                         reader.width(), reader.height());
    return track.RateAsNumber() > 0.0 ? words + " -framerate " + RateText(track) : words;
}

}  // namespace cliphost
