// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/header_parser/BrokenMovies.h"

#include <cmath>
#include <functional>

#include "tests/unit/header_parser/ParsedMovie.h"

using movies::Box;
using movies::Bytes;
using movies::Movie;
using movies::Track;

namespace {

// A small movie whose first track was changed.
Bytes WithTrack(const std::function<void(Track&)>& change) {
    Movie movie = PlainMovie();
    change(movie.tracks.front());
    return movies::Build(movie).ToBytes();
}

Bytes WithMovie(const std::function<void(Movie&)>& change) {
    Movie movie = PlainMovie();
    change(movie);
    return movies::Build(movie).ToBytes();
}

Bytes WithAtom(const Box& atom) {
    return WithTrack([&](Track& track) { track.replaced.push_back(atom); });
}

Bytes Without(const char* type) {
    return WithTrack([&](Track& track) { track.omitted.emplace_back(type); });
}

Bytes Join(std::initializer_list<Box> boxes) {
    Bytes bytes;
    for (const Box& box : boxes) {
        const Bytes more = box.ToBytes();
        bytes.insert(bytes.end(), more.begin(), more.end());
    }
    return bytes;
}

Bytes ManyAtoms(std::size_t count) {
    Bytes bytes = Box("ftyp").Code("qt  ").ToBytes();
    const Bytes free = Box("free").ToBytes();
    for (std::size_t i = 0; i < count; ++i) {
        bytes.insert(bytes.end(), free.begin(), free.end());
    }
    return bytes;
}

Bytes Bomb() {
    Movie movie = PlainMovie();
    movie.compressed = true;
    movie.inHeader.push_back(Box("free").Zeros(4 << 20));
    return movies::Build(movie).ToBytes();
}

void AddTables(std::vector<BrokenMovie>& list) {
    const auto add = [&](const char* name, const Bytes& bytes) {
        list.push_back({name, bytes, NCF_E_FAIL});
    };
    add("stts_missing", Without("stts"));
    add("stts_claims_more_entries", WithAtom(Box("stts").Version(0).U32(2).U32(30).U32(1)));
    add("stts_claims_all_entries", WithAtom(Box("stts").Version(0).U32(0xFFFFFFFF).U32(30).U32(1)));
    add("stts_counts_too_few", WithAtom(Box("stts").Version(0).U32(1).U32(29).U32(1)));
    add("stts_counts_too_many", WithAtom(Box("stts").Version(0).U32(1).U32(31).U32(1)));
    add("stts_counts_wrap",
        WithAtom(Box("stts").Version(0).U32(2).U32(0xFFFFFFFF).U32(1).U32(31).U32(1)));
    add("stts_cut_in_count", WithAtom(Box("stts").Version(0).U16(0)));
    add("ctts_counts_too_few", WithTrack([](Track& track) {
            track.added = {Box("ctts").Version(0).U32(1).U32(3).U32(1)};
        }));
    add("ctts_counts_too_many", WithTrack([](Track& track) {
            track.added = {Box("ctts").Version(0).U32(1).U32(31).U32(1)};
        }));
    add("ctts_claims_more_entries", WithTrack([](Track& track) {
            track.added = {Box("ctts").Version(0).U32(1000).U32(30).U32(1)};
        }));
    add("stsc_missing", Without("stsc"));
    add("stsc_empty", WithAtom(Box("stsc").Version(0).U32(0)));
    add("stsc_begins_behind_first_chunk",
        WithAtom(Box("stsc").Version(0).U32(1).U32(2).U32(15).U32(1)));
    add("stsc_begins_at_chunk_0", WithAtom(Box("stsc").Version(0).U32(1).U32(0).U32(10).U32(1)));
    add("stsc_chunk_out_of_range",
        WithAtom(Box("stsc").Version(0).U32(2).U32(1).U32(10).U32(1).U32(9).U32(10).U32(1)));
    add("stsc_does_not_rise", WithAtom(Box("stsc")
                                           .Version(0)
                                           .U32(3)
                                           .U32(1)
                                           .U32(10)
                                           .U32(1)
                                           .U32(3)
                                           .U32(10)
                                           .U32(1)
                                           .U32(2)
                                           .U32(10)
                                           .U32(1)));
    add("stsc_no_samples_in_chunk", WithAtom(Box("stsc").Version(0).U32(1).U32(1).U32(0).U32(1)));
    add("stsc_unknown_description", WithAtom(Box("stsc").Version(0).U32(1).U32(1).U32(10).U32(2)));
    add("stsc_description_0", WithAtom(Box("stsc").Version(0).U32(1).U32(1).U32(10).U32(0)));
    add("stsc_places_too_few", WithAtom(Box("stsc").Version(0).U32(1).U32(1).U32(9).U32(1)));
    add("stsc_places_too_many", WithAtom(Box("stsc").Version(0).U32(1).U32(1).U32(16).U32(1)));
    add("stsc_places_overflow",
        WithAtom(Box("stsc").Version(0).U32(1).U32(1).U32(0xFFFFFFFF).U32(1)));
    add("stsz_missing", Without("stsz"));
    add("stsz_claims_more_entries", WithAtom(Box("stsz").Version(0).U32(0).U32(30).Zeros(119)));
    add("stsz_claims_all_entries", WithAtom(Box("stsz").Version(0).U32(0).U32(0xFFFFFFFF)));
    add("stsz_cut_in_count", WithAtom(Box("stsz").Version(0).U32(0).U16(0)));
    add("stsz_constant_for_all_numbers",
        WithAtom(Box("stsz").Version(0).U32(0xFFFFFFFF).U32(0xFFFFFFFF)));
    add("stz2_of_5_bits", WithTrack([](Track& track) {
            track.omitted = {"stsz"};
            track.added = {Box("stz2").Version(0).U32(5).U32(30).Zeros(30)};
        }));
    add("stz2_claims_more_entries", WithTrack([](Track& track) {
            track.omitted = {"stsz"};
            track.added = {Box("stz2").Version(0).U32(4).U32(30).Zeros(14)};
        }));
    add("stco_missing", Without("stco"));
    add("stco_empty", WithAtom(Box("stco").Version(0).U32(0)));
    add("stco_claims_more_entries", WithAtom(Box("stco").Version(0).U32(3).U32(64).U32(64)));
    add("stco_zero_offsets", WithAtom(Box("stco").Version(0).U32(3).U32(0).U32(0).U32(0)));
    add("co64_beyond_any_file", WithTrack([](Track& track) {
            track.omitted = {"stco"};
            track.added = {Box("co64").Version(0).U32(3).U64(64).U64(64).U64(INT64_MAX)};
        }));
    add("co64_negative", WithTrack([](Track& track) {
            track.omitted = {"stco"};
            track.added = {Box("co64").Version(0).U32(3).U64(64).U64(64).U64(~0ull)};
        }));
    add("stss_claims_more_entries",
        WithTrack([](Track& track) { track.added = {Box("stss").Version(0).U32(2).U32(1)}; }));
    add("stss_does_not_rise", WithTrack([](Track& track) {
            track.added = {Box("stss").Version(0).U32(2).U32(5).U32(5)};
        }));
    add("stss_beyond_the_samples",
        WithTrack([](Track& track) { track.added = {Box("stss").Version(0).U32(1).U32(31)}; }));
    add("stss_sample_0",
        WithTrack([](Track& track) { track.added = {Box("stss").Version(0).U32(1).U32(0)}; }));
    add("sdtp_too_short",
        WithTrack([](Track& track) { track.added = {Box("sdtp").Version(0).Zeros(29)}; }));
}

void AddTrackAtoms(std::vector<BrokenMovie>& list) {
    const auto add = [&](const char* name, const Bytes& bytes, NCFRESULT expected = NCF_E_FAIL) {
        list.push_back({name, bytes, expected});
    };
    add("tkhd_missing", Without("tkhd"));
    add("tkhd_cut", WithAtom(Box("tkhd").Version(0).U32(0).U32(0).U32(1)));
    add("tkhd_version_2", WithTrack([](Track& track) {
            track.replaced = {Box("tkhd").Version(2).U64(0).U32(1).Zeros(200)};
        }));
    add("tkhd_number_0", WithAtom(Box("tkhd").Version(0).Zeros(80)));
    add("mdhd_missing", Without("mdhd"));
    add("mdhd_cut", WithAtom(Box("mdhd").Version(0).U32(0).U32(0)));
    add("mdhd_version_9", WithAtom(Box("mdhd").Version(9).Zeros(40)));
    add("mdhd_no_time_scale", WithAtom(Box("mdhd").Version(0).Zeros(20)));
    add("mdhd_duration_of_33_bits",
        WithAtom(Box("mdhd").Version(1).U64(0).U64(0).U32(30).U64(0x100000000).U32(0)),
        NCF_E_NOTSUPPORTED);
    add("track_duration_of_33_bits", WithTrack([](Track& track) {
            track.headerVersion = 1;
            track.trackDuration = 0x100000000;
        }),
        NCF_E_NOTSUPPORTED);
    add("media_duration_of_samples_of_33_bits", WithTrack([](Track& track) {
            track.samples = {{30, 100, 0xF0000000}};
            track.mediaDuration = 0;
            track.trackDuration = 1;
        }),
        NCF_E_NOTSUPPORTED);
    add("mdia_missing", Without("mdia"));
    add("minf_missing", Without("minf"));
    add("stbl_missing", Without("stbl"));
    add("stsd_missing", Without("stsd"));
    add("stsd_claims_more_entries",
        WithAtom(Box("stsd").Version(0).U32(2).Add(movies::VideoFormat().ToBox())));
    add("stsd_claims_all_entries",
        WithAtom(Box("stsd").Version(0).U32(0xFFFFFFFF).Add(movies::VideoFormat().ToBox())));
    add("stsd_entry_too_short", WithAtom(Box("stsd").Version(0).U32(1).Add(Box("avc1").Zeros(8))));
    add("stsd_entry_beyond_its_end",
        WithAtom(Box("stsd").Version(0).U32(1).Add(Box("avc1").Zeros(78).ClaimSize(87))));
    add("dref_claims_more_entries",
        WithAtom(Box("dref").Version(0).U32(2).Add(Box("url ").Version(0, 1))));
    add("data_reference_that_is_none", WithTrack([](Track& track) {
            movies::VideoFormat format;
            format.dataReference = 2;
            track.descriptions = {format.ToBox()};
        }));
    add("elst_claims_more_entries", WithTrack([](Track& track) {
            track.edits = {{600, 0, 1.0}};
            track.replaced = {Box("elst").Version(0).U32(2).U32(600).U32(0).U32(0x10000)};
        }));
    add("elst_version_3", WithTrack([](Track& track) {
            track.edits = {{600, 0, 1.0}};
            track.replaced = {Box("elst").Version(3).U32(1).Zeros(20)};
        }));
    add("elst_durations_overflow", WithTrack([](Track& track) {
            track.editVersion = 1;
            track.edits = {{0x7000000000000000, 0, 1.0}, {0x7000000000000000, 0, 1.0}};
        }));
    add("elst_negative_media_time", WithTrack([](Track& track) {
            track.edits = {{600, -2, 1.0}};
        }));
    add("atom_of_size_4_in_track",
        WithTrack([](Track& track) { track.added = {Box("free").ClaimSize(4)}; }));
    add("atom_larger_than_its_parent",
        WithTrack([](Track& track) { track.added = {Box("free").ClaimSize(9)}; }));
    add("atom_of_64_bit_size_that_overflows",
        WithTrack([](Track& track) { track.added = {Box("free").LargeSize().ClaimSize(~0ull)}; }));
    add("zeros_among_the_tables",
        WithTrack([](Track& track) { track.added = {Box("free").ClaimSize(0)}; }));
}

void AddSound(std::vector<BrokenMovie>& list) {
    const auto add = [&](const char* name, const movies::SoundFormat& format) {
        Movie movie;
        movie.tracks = {movies::SoundTrack(movies::SoundFormat(), 100)};
        movie.tracks[0].descriptions = {format.ToBox()};
        list.push_back({name, movies::Build(movie).ToBytes(), NCF_E_FAIL});
    };
    movies::SoundFormat format;
    format.channels = 0;
    add("sound_without_channels", format);
    format = {};
    format.version = 3;
    add("sound_of_version_3", format);
    format = {};
    format.codec = "lpcm";
    format.version = 2;
    format.rate = 0.5;
    add("sound_rate_below_1", format);
    format.rate = 2e9;
    add("sound_rate_above_a_billion", format);
    format.rate = std::nan("");
    add("sound_rate_not_a_number", format);
    format.rate = -48000;
    add("sound_rate_negative", format);
    format.rate = 48000;
    format.bits = 65;
    add("sound_of_65_bits", format);
    format.bits = 16;
    format.channels = 70000;
    add("sound_of_70000_channels", format);
}

void AddMovieAtoms(std::vector<BrokenMovie>& list) {
    const auto add = [&](const char* name, const Bytes& bytes, NCFRESULT expected) {
        list.push_back({name, bytes, expected});
    };
    add("mvhd_missing", WithMovie([](Movie& m) { m.omitted = {"mvhd"}; }), NCF_E_FAIL);
    add("mvhd_cut", WithMovie([](Movie& m) { m.replaced = {Box("mvhd").Version(0).U32(0)}; }),
        NCF_E_FAIL);
    add("mvhd_version_2",
        WithMovie([](Movie& m) { m.replaced = {Box("mvhd").Version(2).Zeros(120)}; }), NCF_E_FAIL);
    add("mvhd_no_time_scale", WithMovie([](Movie& m) { m.timeScale = 0; }), NCF_E_FAIL);
    add("mvhd_duration_of_33_bits", WithMovie([](Movie& m) {
            m.headerVersion = 1;
            m.duration = 0x100000000;
        }),
        NCF_E_NOTSUPPORTED);
    add("mvex", WithMovie([](Movie& m) { m.inHeader = {Box("mvex").Add(Box("trex").Zeros(24))}; }),
        NCF_E_NOTSUPPORTED);
    add("moof_in_front", Join({Box("ftyp").Code("isom"), Box("moof").Zeros(8)}),
        NCF_E_NOTSUPPORTED);
    add("reference_movie",
        Join({Box("moov").Add(Box("rmra").Add(Box("rmda").Add(Box("rdrf").Zeros(12))))}),
        NCF_E_NOTSUPPORTED);
    add("moov_empty", Join({Box("ftyp").Code("qt  "), Box("moov")}), NCF_E_FAIL);
    add("moov_of_size_7", Join({Box("moov").ClaimSize(7)}), NCF_E_FAIL);
    add("moov_larger_than_the_file", Join({Box("moov").ClaimSize(0x7FFFFFFF)}), NCF_E_OUTOFMEMORY);
    add("moov_larger_than_any_file", Join({Box("moov").LargeSize().ClaimSize(~0ull)}), NCF_E_FAIL);
    add("moov_to_the_end_without_end", Join({Box("moov").SizeToEnd()}), NCF_E_FAIL);
    add("mdat_to_the_end", Join({Box("ftyp").Code("qt  "), Box("mdat").SizeToEnd()}), NMA_E_NODATA);
    add("mdat_beyond_the_end", Join({Box("mdat").LargeSize().ClaimSize(1ull << 40)}), NMA_E_NODATA);
    add("mdat_of_size_15_in_64_bits", Join({Box("mdat").LargeSize().ClaimSize(15)}), NCF_E_FAIL);
    add("sizes_wrap_around",
        Join({Box("free").Zeros(8), Box("mdat").LargeSize().ClaimSize(INT64_MAX)}), NCF_E_FAIL);
    add("only_ftyp", Join({Box("ftyp").Code("qt  ")}), NMA_E_NODATA);
    add("zeros", Bytes(5000, 0), NMA_E_NODATA);
    add("one_byte", Bytes(1, 0x20), NCF_E_NOTSUPPORTED);
    add("a_wave_file", Join({Box("WAVE").ClaimSize(0x52494646)}), NCF_E_NOTSUPPORTED);
    add("text_that_looks_like_atoms", Bytes(5000, 'a'), NCF_E_NOTSUPPORTED);
    add("many_empty_atoms", ManyAtoms(70000), NCF_E_OUTOFMEMORY);
    add("cmov_bomb", Bomb(), NCF_E_OUTOFMEMORY);
    add("cmov_without_data", Join({Box("moov").Add(Box("cmov").Add(Box("dcom").Code("zlib")))}),
        NCF_E_FAIL);
    add("cmov_of_unknown_kind",
        Join({Box("moov").Add(
            Box("cmov").Add(Box("dcom").Code("lzma")).Add(Box("cmvd").U32(100).Zeros(50)))}),
        NCF_E_NOTSUPPORTED);
    add("cmov_garbage",
        Join({Box("moov").Add(
            Box("cmov").Add(Box("dcom").Code("zlib")).Add(Box("cmvd").U32(100).Zeros(50)))}),
        NCF_E_FAIL);
    Movie compressed = PlainMovie();
    compressed.compressed = true;
    Bytes bytes = movies::Build(compressed).ToBytes();
    for (std::size_t i = 0; i + 4 < bytes.size(); ++i) {
        if (std::equal(bytes.begin() + static_cast<std::ptrdiff_t>(i),
                       bytes.begin() + static_cast<std::ptrdiff_t>(i) + 4, "cmvd")) {
            bytes[i + 7] ^= 1;
        }
    }
    add("cmov_of_another_size", bytes, NCF_E_FAIL);
}

// A description with every atom that the parser reads, the texts as raw boxes.
Box FullDescription() {
    movies::VideoFormat format;
    format.fields = {{2, 9}};
    format.nclc = {{1, 1, 1}};
    format.pixelAspect = {{10, 11}};
    format.cleanAperture = {{704, 1, 480, 1, 0, 1, 0, 1}};
    format.extensions = {Box("chRI").Text("<Bounds></Bounds>"),
                         Box("chCM").Text("<ColorSpaceDescriptor/>")};
    format.alphaCodings = {{0, 1}};
    format.resolutionId = 10950;
    return format.ToBox();
}

}  // namespace

std::vector<BrokenMovie> BrokenMovies() {
    std::vector<BrokenMovie> list;
    AddMovieAtoms(list);
    AddTrackAtoms(list);
    AddTables(list);
    AddSound(list);
    return list;
}

std::vector<BrokenMovie> WholeMovies() {
    std::vector<BrokenMovie> list;
    const auto add = [&](const char* name, const Movie& movie) {
        list.push_back({name, movies::Build(movie).ToBytes(), NCF_OK});
    };
    Movie movie = PlainMovie();
    movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 4800));
    movie.tracks.push_back(movies::TimecodeTrack(movies::TimecodeFormat(), 90000, 25));
    movie.tracks.push_back(movies::OtherTrack("text", 3, 600, 200));
    add("all_kinds_of_tracks", movie);
    movie.compressed = true;
    add("compressed_header", movie);
    movie.compressed = false;
    movie.header = movies::Place::kBeforeMedia;
    movie.mediaToEnd = true;
    add("header_in_front_media_to_end", movie);
    movie.header = movies::Place::kBehindMedia;
    movie.mediaToEnd = false;
    movie.headerToEnd = true;
    add("header_to_end", movie);
    movie = PlainMovie();
    movies::Track& track = movie.tracks.front();
    track.samples.clear();
    for (int i = 0; i < 10; ++i) {
        track.samples.push_back({1, 400, 1, 2, i == 0, false});
        track.samples.push_back({2, 150, 1, 0, false, true});
        track.samples.push_back({1, 120, 1, 2, false, false});
    }
    track.edits = {{100, -1, 1.0}, {500, 1, 1.0}, {100, 10, 0.5}};
    track.descriptions = {FullDescription(), movies::VideoFormat().ToBox()};
    add("reordered_with_edits_and_attributes", movie);
    return list;
}
