// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the parser says of each movie that it refuses: the sentence, word for
// word, and the place.

#include "reference_host/header_parser/Refusal.h"

#include <gtest/gtest.h>

#include <map>

#include "tests/unit/header_parser/BrokenMovies.h"
#include "tests/unit/header_parser/ParsedMovie.h"

using header_parser::Refusal;
using movies::Box;
using movies::Bytes;

namespace {

Refusal WhyRefused(const Bytes& bytes) {
    return ParsedMovie(bytes).Parser().WhyUnfinished(bytes.size());
}

struct Told {
    const char* atom;
    const char* sentence;
};

const std::map<std::string, Told> kTold = {
    {"mvhd_missing", {"moov", "'moov' holds no 'mvhd' (at byte 3028)"}},
    {"mvhd_cut", {"moov/mvhd", "'mvhd' is cut short: it holds 8 bytes (at byte 3036)"}},
    {"mvhd_version_2", {"moov/mvhd", "'mvhd' is of the unknown version 2 (at byte 3036)"}},
    {"mvhd_no_time_scale", {"moov/mvhd", "'mvhd' gives a time scale of 0 (at byte 3036)"}},
    {"mvhd_duration_of_33_bits",
     {"moov/mvhd", "the movie's duration of 4294967296 units does not fit 32 bits (at byte 3036)"}},
    {"mvex", {"moov/mvex", "the movie is fragmented, as 'mvex' shows (at byte 3598)"}},
    {"moof_in_front", {"", "the movie is fragmented, as 'moof' shows (at byte 12)"}},
    {"reference_movie",
     {"moov/rmra", "the movie only refers to other files, by 'rmra' (at byte 8)"}},
    {"moov_empty", {"moov", "'moov' holds no 'mvhd' (at byte 12)"}},
    {"moov_of_size_7", {"", "'moov' has the impossible size 7 (at byte 0)"}},
    {"moov_larger_than_the_file",
     {"", "the movie header claims 2147483647 bytes, at most 1073741824 are read (at byte 0)"}},
    {"moov_larger_than_any_file",
     {"", "'moov' has the impossible size 18446744073709551615 (at byte 0)"}},
    {"moov_to_the_end_without_end", {"moov", "'moov' holds no 'mvhd' (at byte 0)"}},
    {"mdat_to_the_end",
     {"", "'mdat' reaches to the end of the file, before any movie header (at byte 12)"}},
    {"mdat_beyond_the_end",
     {"",
      "'mdat' claims 1099511627776 bytes, the file ends at byte 16, before any movie header (at "
      "byte 0)"}},
    {"mdat_of_size_15_in_64_bits", {"", "'mdat' has the impossible size 15 (at byte 0)"}},
    {"sizes_wrap_around", {"", "'mdat' has the impossible size 9223372036854775807 (at byte 16)"}},
    {"only_ftyp", {"", "the file ends without 'moov', the movie header (at byte 12)"}},
    {"zeros", {"", "zeros where an atom should begin, before any movie header (at byte 0)"}},
    {"one_byte", {"", "the file holds 1 byte and no atom (at byte 0)"}},
    {"a_wave_file",
     {"",
      "its first atom would be 'WAVE', and no movie of the QuickTime family begins with that (at "
      "byte 0)"}},
    {"text_that_looks_like_atoms",
     {"",
      "its first atom would be 'aaaa', and no movie of the QuickTime family begins with that (at "
      "byte 0)"}},
    {"many_empty_atoms",
     {"", "more than 65536 atoms come before the movie header (at byte 524292)"}},
    {"cmov_bomb",
     {"moov/cmov/cmvd",
      "the compressed movie header unpacks to more than 437800 bytes (at byte 3056)"}},
    {"cmov_without_data", {"moov/cmov", "'cmov' has no 'cmvd' with packed bytes (at byte 8)"}},
    {"cmov_of_unknown_kind",
     {"moov/cmov/dcom",
      "the movie header is compressed by 'lzma', only 'zlib' is known (at byte 16)"}},
    {"cmov_garbage",
     {"moov/cmov/cmvd",
      "the compressed movie header can't be unpacked behind byte 2 of 50 (at byte 28)"}},
    {"cmov_of_another_size",
     {"moov/cmov/cmvd",
      "'cmvd' says that it unpacks to 571 bytes, it unpacks to 570 (at byte 3056)"}},
    {"tkhd_missing", {"moov/trak", "track 1: it lacks 'tkhd', the track header (at byte 3144)"}},
    {"tkhd_cut",
     {"moov/trak/tkhd", "track 1: 'tkhd' is cut short: it holds 16 bytes (at byte 3152)"}},
    {"tkhd_version_2",
     {"moov/trak/tkhd", "track 1: 'tkhd' is of the unknown version 2 (at byte 3152)"}},
    {"tkhd_number_0", {"moov/trak/tkhd", "track 1: 'tkhd' gives it the number 0 (at byte 3152)"}},
    {"mdhd_missing", {"moov/trak", "track 1: it lacks 'mdhd', the media header (at byte 3144)"}},
    {"mdhd_cut",
     {"moov/trak/mdia/mdhd", "track 1: 'mdhd' is cut short: it holds 12 bytes (at byte 3252)"}},
    {"mdhd_version_9",
     {"moov/trak/mdia/mdhd", "track 1: 'mdhd' is of the unknown version 9 (at byte 3252)"}},
    {"mdhd_no_time_scale",
     {"moov/trak/mdia/mdhd", "track 1: 'mdhd' gives a time scale of 0 (at byte 3252)"}},
    {"mdhd_duration_of_33_bits",
     {"moov/trak",
      "track 1: its duration of 4294967296 units does not fit 32 bits (at byte 3144)"}},
    {"track_duration_of_33_bits",
     {"moov/trak",
      "track 1: its duration of 4294967296 units does not fit 32 bits (at byte 3144)"}},
    {"media_duration_of_samples_of_33_bits",
     {"moov/trak",
      "track 1: its duration of 120795955200 units does not fit 32 bits (at byte 3144)"}},
    {"mdia_missing", {"moov/trak", "track 1: it lacks 'mdia', the media (at byte 3144)"}},
    {"minf_missing",
     {"moov/trak/mdia", "track 1: it lacks 'minf', the media information (at byte 3244)"}},
    {"stbl_missing",
     {"moov/trak/mdia/minf", "track 1: it lacks 'stbl', the sample table (at byte 3324)"}},
    {"stsd_missing",
     {"moov/trak", "track 1: it lacks 'stsd', the sample descriptions (at byte 3144)"}},
    {"stsd_claims_more_entries",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'stsd' claims 2 entries and holds 1 (at byte 3396)"}},
    {"stsd_claims_all_entries",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'stsd' claims 4294967295 entries, 86 bytes left (at byte 3396)"}},
    {"stsd_entry_too_short",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'avc1' is cut short: it holds 8 bytes (at byte 3412)"}},
    {"stsd_entry_beyond_its_end",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'stsd' claims 1 entry and holds 0 (at byte 3396)"}},
    {"dref_claims_more_entries",
     {"moov/trak/mdia/minf/dinf/dref",
      "track 1: 'dref' claims 2 entries, 12 bytes left (at byte 3360)"}},
    {"data_reference_that_is_none",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'avc1' names data reference 2, 'dref' has 1 (at byte 3412)"}},
    {"elst_claims_more_entries",
     {"moov/trak/edts/elst", "track 1: 'elst' claims 2 entries, 12 bytes left (at byte 3252)"}},
    {"elst_version_3",
     {"moov/trak/edts/elst", "track 1: 'elst' is of the unknown version 3 (at byte 3252)"}},
    {"elst_durations_overflow",
     {"moov/trak/edts/elst",
      "track 1: edits 1 to 1 last longer than 2305843009213693951 in total (at byte 3252)"}},
    {"elst_negative_media_time",
     {"moov/trak/edts/elst",
      "track 1: edit 1 begins at the impossible media time -2 (at byte 3252)"}},
    {"atom_of_size_4_in_track",
     {"moov/trak/mdia/minf/stbl",
      "track 1: 'free' in 'stbl' has the impossible size 4 (at byte 3598)"}},
    {"atom_larger_than_its_parent",
     {"moov/trak/mdia/minf/stbl",
      "track 1: 'free' claims 9 bytes, 8 left in 'stbl' (at byte 3598)"}},
    {"atom_of_64_bit_size_that_overflows",
     {"moov/trak/mdia/minf/stbl",
      "track 1: 'free' claims 18446744073709551615 bytes, 16 left in 'stbl' (at byte 3598)"}},
    {"zeros_among_the_tables",
     {"moov/trak/mdia/minf/stbl",
      "track 1: zeros in 'stbl' where an atom should begin (at byte 3598)"}},
    {"stts_missing",
     {"moov/trak", "track 1: it lacks 'stts', the sample durations (at byte 3144)"}},
    {"stts_claims_more_entries",
     {"moov/trak/mdia/minf/stbl/stts",
      "track 1: 'stts' claims 2 entries, 8 bytes left (at byte 3498)"}},
    {"stts_claims_all_entries",
     {"moov/trak/mdia/minf/stbl/stts",
      "track 1: 'stts' claims 4294967295 entries, 8 bytes left (at byte 3498)"}},
    {"stts_counts_too_few",
     {"moov/trak/mdia/minf/stbl/stts",
      "track 1: 'stts' counts 29 samples, the track has 30 (at byte 3498)"}},
    {"stts_counts_too_many",
     {"moov/trak/mdia/minf/stbl/stts",
      "track 1: 'stts' counts 31 samples or more, the track has 30 (at byte 3498)"}},
    {"stts_counts_wrap",
     {"moov/trak/mdia/minf/stbl/stts",
      "track 1: 'stts' counts 4294967295 samples or more, the track has 30 (at byte 3498)"}},
    {"stts_cut_in_count",
     {"moov/trak/mdia/minf/stbl/stts",
      "track 1: 'stts' is cut short: it holds 6 bytes (at byte 3498)"}},
    {"ctts_counts_too_few",
     {"moov/trak/mdia/minf/stbl/ctts",
      "track 1: 'ctts' counts 3 samples, the track has 30 (at byte 3598)"}},
    {"ctts_counts_too_many",
     {"moov/trak/mdia/minf/stbl/ctts",
      "track 1: 'ctts' counts 31 samples or more, the track has 30 (at byte 3598)"}},
    {"ctts_claims_more_entries",
     {"moov/trak/mdia/minf/stbl/ctts",
      "track 1: 'ctts' claims 1000 entries, 8 bytes left (at byte 3598)"}},
    {"stsc_missing",
     {"moov/trak", "track 1: it lacks 'stsc', the samples of its chunks (at byte 3144)"}},
    {"stsc_empty",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: 'stsc' is empty, the track has 30 samples (at byte 3522)"}},
    {"stsc_begins_behind_first_chunk",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: 'stsc' begins with chunk 2, not with 1 (at byte 3522)"}},
    {"stsc_begins_at_chunk_0",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: 'stsc' begins with chunk 0, not with 1 (at byte 3522)"}},
    {"stsc_chunk_out_of_range",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: entry 2 of 'stsc' begins with chunk 9, the track has 3 (at byte 3522)"}},
    {"stsc_does_not_rise",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: entry 2 of 'stsc' begins with chunk 3, entry 3 with 2 (at byte 3522)"}},
    {"stsc_no_samples_in_chunk",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: entry 1 of 'stsc' puts no sample in a chunk (at byte 3522)"}},
    {"stsc_unknown_description",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: entry 1 of 'stsc' names sample description 2, the track has 1 (at byte 3522)"}},
    {"stsc_description_0",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: entry 1 of 'stsc' names sample description 0, the track has 1 (at byte 3522)"}},
    {"stsc_places_too_few",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: 'stsc' places 27 samples in 3 chunks, the track has 30 (at byte 3522)"}},
    {"stsc_places_too_many",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: 'stsc' places 33 or more samples, the track has 30 (at byte 3522)"}},
    {"stsc_places_overflow",
     {"moov/trak/mdia/minf/stbl/stsc",
      "track 1: 'stsc' places 8589934591 or more samples, the track has 30 (at byte 3522)"}},
    {"stsz_missing", {"moov/trak", "track 1: it lacks 'stsz', the sample sizes (at byte 3144)"}},
    {"stsz_claims_more_entries",
     {"moov/trak/mdia/minf/stbl/stsz",
      "track 1: 'stsz' claims 30 entries, 119 bytes left (at byte 3550)"}},
    {"stsz_claims_all_entries",
     {"moov/trak/mdia/minf/stbl/stsz",
      "track 1: 'stsz' claims 4294967295 entries, 0 bytes left (at byte 3550)"}},
    {"stsz_cut_in_count",
     {"moov/trak/mdia/minf/stbl/stsz",
      "track 1: 'stsz' is cut short: it holds 10 bytes (at byte 3550)"}},
    {"stsz_constant_for_all_numbers",
     {"moov/trak/mdia/minf/stbl/stts",
      "track 1: 'stts' counts 30 samples, the track has 4294967295 (at byte 3498)"}},
    {"stz2_of_5_bits",
     {"moov/trak/mdia/minf/stbl/stz2",
      "track 1: 'stz2' gives sizes of 5 bits; 4, 8 and 16 are known (at byte 3578)"}},
    {"stz2_claims_more_entries",
     {"moov/trak/mdia/minf/stbl/stz2",
      "track 1: 'stz2' claims 30 entries, 14 bytes left (at byte 3578)"}},
    {"stco_missing",
     {"moov/trak", "track 1: it lacks 'stco', the places of its chunks (at byte 3144)"}},
    {"stco_empty",
     {"moov/trak/mdia/minf/stbl/stco",
      "track 1: 'stco' holds no chunk, the track has 30 samples (at byte 3570)"}},
    {"stco_claims_more_entries",
     {"moov/trak/mdia/minf/stbl/stco",
      "track 1: 'stco' claims 3 entries, 8 bytes left (at byte 3570)"}},
    {"stco_zero_offsets",
     {"moov/trak/mdia/minf/stbl/stco",
      "track 1: chunk 1 begins at byte 0, where the first atom has its header (at byte 3570)"}},
    {"co64_beyond_any_file",
     {"moov/trak/mdia/minf/stbl/co64",
      "track 1: chunk 3 begins at byte 9223372036854775807, beyond any file (at byte 3570)"}},
    {"co64_negative",
     {"moov/trak/mdia/minf/stbl/co64",
      "track 1: chunk 3 begins at byte 18446744073709551615, beyond any file (at byte 3570)"}},
    {"stss_claims_more_entries",
     {"moov/trak/mdia/minf/stbl/stss",
      "track 1: 'stss' claims 2 entries, 4 bytes left (at byte 3598)"}},
    {"stss_does_not_rise",
     {"moov/trak/mdia/minf/stbl/stss",
      "track 1: the numbers in 'stss' do not rise: 5 comes after 5 (at byte 3598)"}},
    {"stss_beyond_the_samples",
     {"moov/trak/mdia/minf/stbl/stss",
      "track 1: 'stss' names sample 31, the track has 30 (at byte 3598)"}},
    {"stss_sample_0",
     {"moov/trak/mdia/minf/stbl/stss",
      "track 1: the numbers in 'stss' do not rise: 0 comes after 0 (at byte 3598)"}},
    {"sdtp_too_short",
     {"moov/trak/mdia/minf/stbl/sdtp",
      "track 1: 'sdtp' holds 29 entries, the track has 30 samples (at byte 3598)"}},
    {"sound_without_channels",
     {"moov/trak/mdia/minf/stbl/stsd", "track 1: 'sowt' has no channels (at byte 808)"}},
    {"sound_of_version_3",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'sowt' is of the unknown version 3 (at byte 808)"}},
    {"sound_rate_below_1",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'lpcm' has the impossible rate 0.5 (at byte 808)"}},
    {"sound_rate_above_a_billion",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'lpcm' has the impossible rate 2000000000 (at byte 808)"}},
    {"sound_rate_not_a_number",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'lpcm' has the impossible rate nan (at byte 808)"}},
    {"sound_rate_negative",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'lpcm' has the impossible rate -48000 (at byte 808)"}},
    {"sound_of_65_bits",
     {"moov/trak/mdia/minf/stbl/stsd", "track 1: 'lpcm' has 2 channels of 65 bits (at byte 808)"}},
    {"sound_of_70000_channels",
     {"moov/trak/mdia/minf/stbl/stsd",
      "track 1: 'lpcm' has 70000 channels, at most 1024 are read (at byte 808)"}},
};

class RefusalTest : public testing::TestWithParam<BrokenMovie> {};

TEST_P(RefusalTest, IsToldInASentenceWithItsPlace) {
    const auto told = kTold.find(GetParam().name);
    const Refusal refusal = WhyRefused(GetParam().bytes);
    ASSERT_NE(told, kTold.end()) << refusal.Sentence();
    EXPECT_EQ(refusal.Sentence(), told->second.sentence);
    EXPECT_EQ(refusal.atom, told->second.atom);
    EXPECT_EQ(refusal.code, GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(All, RefusalTest, testing::ValuesIn(BrokenMovies()),
                         [](const auto& test) { return test.param.name; });

// The place counts from the start of the file, the track from the first one.
TEST(Refusal, CountsTracksInTheOrderOfTheFile) {
    movies::Movie movie = PlainMovie();
    movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 100));
    movie.tracks[1].id = 77;
    movie.tracks[1].replaced = {Box("stsz").Version(0).U32(0).U32(900).Zeros(12)};
    const Bytes bytes = movies::Build(movie).ToBytes();
    const Refusal refusal = WhyRefused(bytes);
    EXPECT_EQ(refusal.track, 2u);
    EXPECT_EQ(refusal.atom, "moov/trak/mdia/minf/stbl/stsz");
    ASSERT_TRUE(refusal.offset);
    const auto at = bytes.begin() + static_cast<std::ptrdiff_t>(*refusal.offset);
    EXPECT_EQ(std::string(at + 4, at + 8), "stsz");
    EXPECT_EQ(refusal.Sentence(), "track 2: 'stsz' claims 900 entries, 12 bytes left (at byte " +
                                      std::to_string(*refusal.offset) + ")");
}

TEST(Refusal, CountsInTheUnpackedHeaderOfACompressedOne) {
    movies::Movie movie = PlainMovie();
    movie.compressed = true;
    movie.tracks[0].omitted = {"stsz"};
    const Refusal refusal = WhyRefused(movies::Build(movie).ToBytes());
    EXPECT_TRUE(refusal.isUnpacked);
    EXPECT_EQ(refusal.Sentence(),
              "track 1: it lacks 'stsz', the sample sizes (at byte 108 of the unpacked header)");
}

// An atom whose size leads into the media is named, and where it stands.
TEST(Refusal, TellsWhichAtomLedAstray) {
    movies::Bytes bytes = Box("ftyp").Code("qt  ").ToBytes();
    const movies::Bytes media =
        Box("mdat").Text("0123456789\xFF\xFE\xFD\xFC").ClaimSize(14).ToBytes();
    bytes.insert(bytes.end(), media.begin(), media.end());
    EXPECT_EQ(WhyRefused(bytes).Sentence(),
              "no atom begins where 'mdat' ends, which is at byte 12 and claims 14 bytes (at "
              "byte 26)");
}

// "ends at byte 12", but not 120, nor an atom of 12 bytes; or that all of it is too
// short for an atom; or that nothing stands where the file ends.
bool TellsTheEnd(const std::string& said, std::size_t size) {
    const std::string number = std::to_string(size);
    return said.find("the file ends at byte " + number + ", ") != std::string::npos ||
           said.find("the file ends at byte " + number + " (") != std::string::npos ||
           said.rfind("the file holds " + number + (size == 1 ? " byte" : " bytes") + " and", 0) ==
               0 ||
           said == "the file ends without 'moov', the movie header (at byte " + number + ")";
}

// Whatever length a file is cut to, its own end is named and nothing that only
// zeros behind the end would be.
TEST(Refusal, NamesTheEndOfACutFile) {
    movies::Movie movie = PlainMovie();
    movie.header = movies::Place::kBeforeMedia;
    const Bytes whole = movies::Build(movie).ToBytes();
    for (std::size_t size = 1; size < 560; ++size) {
        const Bytes cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size));
        const Refusal refusal = WhyRefused(cut);
        ASSERT_TRUE(refusal) << size;
        const std::string said = refusal.Sentence();
        EXPECT_TRUE(TellsTheEnd(said, size)) << size << ": " << said;
    }
}

}  // namespace
