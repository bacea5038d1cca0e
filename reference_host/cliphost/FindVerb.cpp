// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <algorithm>
#include <utility>

#include "reference_host/catalog/FindQuery.h"
#include "reference_host/cliphost/CatalogFile.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

using catalog::Statement;
using nlohmann::ordered_json;

constexpr int kExitNothing = 1;  // no movie fits

// What is told of a movie, in this order; the names are those of the members in JSON.
constexpr char kColumns[] =
    "path, name, size, date, route, failed, master_mob AS id, rate_numerator, rate_denominator, "
    "length, seconds, start, codec, codec_name AS codecName, width, height, alpha, "
    "sound_codec AS soundCodec, sound_name AS soundName, sound_rate AS soundRate, channels";
enum Column {
    kPath,
    kName,
    kSize,
    kDate,
    kRoute,
    kFailed,
    kId,
    kRateNumerator,
    kRateDenominator,
    kLength,
    kSeconds,
    kStart,
    kCodec,
    kCodecName,
    kWidth,
    kHeight,
    kAlpha,
    kSoundCodec,
    kSoundName,
    kSoundRate,
    kChannels
};

struct FindOptions {
    std::filesystem::path catalog;
    std::vector<std::string> words;
    bool json = false;
    bool paths = false;
};

// The numbers of the movies that fit, in the order of their paths.
std::vector<std::int64_t> Fitting(catalog::Catalog& catalog, const std::string& query) {
    const std::vector<catalog::Term> terms = catalog::TermsOf(query);
    const catalog::Condition condition = catalog::ConditionOf(terms);
    // The index of paths gives all movies in their order, but to find some there are better ones.
    const char* const order = terms.empty() ? "path" : "+path";
    Statement select = catalog.database().Prepare(
        fmt::format("SELECT id FROM movies WHERE {} ORDER BY {}", condition.sql, order));
    int parameter = 0;
    for (const auto& value : condition.values) {
        ++parameter;
        std::visit([&](const auto& known) { select.Bind(parameter, known); }, value);
    }
    std::vector<std::int64_t> movies;
    while (select.Step()) {
        movies.push_back(select.Integer(0));
    }
    return movies;
}

ordered_json CellOf(const Statement& row, int column) {
    switch (column) {
        case kFailed:
        case kAlpha:
            return row.IsNull(column) ? ordered_json() : ordered_json(row.Integer(column) != 0);
        default:
            return row.IsNull(column)      ? ordered_json()
                   : row.IsInteger(column) ? ordered_json(row.Integer(column))
                   : row.IsReal(column)    ? ordered_json(row.Real(column))
                                           : ordered_json(row.Text(column));
    }
}

ordered_json JsonOf(const Statement& row) {
    ordered_json movie;
    for (int column = 0; column < row.Columns(); ++column) {
        if (column == kRateNumerator) {
            movie["rate"] = row.IsNull(column)
                                ? ordered_json()
                                : ordered_json(fmt::format("{}/{}", row.Integer(kRateNumerator),
                                                           row.Integer(kRateDenominator)));
        } else if (column != kRateDenominator) {
            movie[row.NameOf(column)] = CellOf(row, column);
        }
    }
    return movie;
}

// "1920 x 1080, Apple ProRes 422, 25 a second, 10.4 s, from 01:00:00:00, 2 channels"
std::string FactsOf(const Statement& row) {
    if (row.Integer(kFailed) != 0) {
        return "not described";
    }
    std::string facts;
    const auto add = [&](const std::string& fact) { facts += facts.empty() ? fact : ", " + fact; };
    const auto addName = [&](Column name, Column code) {
        const std::string known = row.Text(name);
        if (!known.empty() || !row.Text(code).empty()) {
            add(known.empty() ? row.Text(code) : known);
        }
    };
    if (!row.IsNull(kWidth)) {
        add(fmt::format("{} x {}", row.Integer(kWidth), row.Integer(kHeight)));
        addName(kCodecName, kCodec);
    }
    if (row.Integer(kAlpha) != 0) {
        add("alpha");
    }
    if (!row.IsNull(kRateNumerator)) {
        add(row.Integer(kRateDenominator) == 1
                ? fmt::format("{} a second", row.Integer(kRateNumerator))
                : fmt::format("{}/{} a second", row.Integer(kRateNumerator),
                              row.Integer(kRateDenominator)));
    }
    if (!row.IsNull(kSeconds)) {
        add(fmt::format("{:.6g} s", row.Real(kSeconds)));
    }
    if (!row.IsNull(kStart)) {
        add("from " + row.Text(kStart));
    }
    addName(kSoundName, kSoundCodec);
    if (row.Integer(kChannels) > 0) {
        add(Counted(static_cast<std::uint64_t>(row.Integer(kChannels)), "channel"));
    }
    return facts;
}

std::string LineOfMovie(const Statement& row, const FindOptions& options) {
    const std::filesystem::path path = PathOfMachinePath(row.Text(kPath));
    return options.paths ? host::system::PathText(path) + '\0'
                         : fmt::format("{}: {}\n", host::DisplayPath(path),
                                       host::text::PrintableLines(FactsOf(row)));
}

// What is printed, some movies at a time.
class FindAnswer {
public:
    explicit FindAnswer(const FindOptions& options) : options_(options) {}

    void Add(const Statement& row) {
        if (options_.json) {
            text_ += (count_ == 0 ? JsonHead() : ",") + '\n' + InLines(JsonOf(row), 4);
        } else {
            text_ += LineOfMovie(row, options_);
        }
        ++count_;
    }
    void Print() {
        hasBegun_ = hasBegun_ || !text_.empty();
        fmt::print("{}", std::exchange(text_, {}));
    }
    void End() {
        if (options_.json) {
            text_ += count_ == 0 ? JsonHead() + "]\n}\n" : "\n  ]\n}\n";
        }
        Print();
    }

    bool HasBegun() const { return hasBegun_; }
    std::size_t count() const { return count_; }

private:
    // Up to the list of the movies.
    std::string JsonHead() const {
        std::string head =
            InLines(WithSchema(schema::kFind, {{"catalog", MachinePath(options_.catalog)}}));
        head.resize(head.size() - std::string_view("\n}").size());
        return head + ",\n  \"movies\": [";
    }

    const FindOptions& options_;
    std::string text_;
    std::size_t count_ = 0;
    bool hasBegun_ = false;
};

// Of many movies only the numbers are kept. They are printed while the catalog is free: who reads
// what is printed may take his time, and nobody could write meanwhile. Movies that are removed then
// are left out.
void AnswerWith(const std::vector<std::int64_t>& movies, catalog::Catalog& catalog,
                FindAnswer& answer) {
    constexpr std::size_t kAtOnce = 500;
    catalog::Database& database = catalog.database();
    Statement select =
        database.Prepare(fmt::format("SELECT {} FROM movies WHERE id = ?", kColumns));
    for (std::size_t at = 0; at < movies.size(); at += kAtOnce) {
        database.Run("BEGIN");
        for (std::size_t i = at; i < std::min(at + kAtOnce, movies.size()); ++i) {
            select.Bind(1, movies[i]);
            while (select.Step()) {
                answer.Add(select);
            }
        }
        database.Run("COMMIT");
        answer.Print();
    }
    answer.End();
}

int Find(const FindOptions& options) {
    std::string query;
    for (const std::string& word : options.words) {
        query += query.empty() ? word : " " + word;
    }
    catalog::Catalog catalog = OpenCatalog(options.catalog, catalog::Catalog::For::Reading);
    FindAnswer answer(options);
    try {
        WithCatalog(options.catalog, [&] {
            try {
                AnswerWith(Fitting(catalog, query), catalog, answer);
            } catch (const catalog::QueryError& error) {
                throw Failure(kExitCaller, host::system::PathOfText(query), error.what());
            }
        });
    } catch (const Failure& failure) {
        if (!answer.HasBegun()) {
            throw;
        }
        // An answer that was begun stays without its end, so that nobody takes it for whole.
        TellProblem(failure.problem(), 0);
        return failure.status();
    }
    return answer.count() > 0 ? kExitFine : kExitNothing;
}

std::string FieldsHelp() {
    std::string help = "Fields:\n";
    for (const catalog::FieldHelp& field : catalog::AllFields()) {
        help += fmt::format("  {:<20} {}\n", field.example, field.meaning);
    }
    return help;
}

}  // namespace

void AddFind(CLI::App& app, int& status) {
    auto* const verb = app.add_subcommand("find", "Print the movies of a catalog that fit a query");
    verb->footer(
        "Examples:\n"
        "  cliphost find clips.sqlite interview 'codec:prores rate:25 alpha:yes'\n"
        "  cliphost find clips.sqlite '\"second take\" width:>=1920 -warning:yes'\n"
        "  cliphost find clips.sqlite copy:yes --json\n"
        "  cliphost find clips.sqlite 'reel:A0*' -0 | cliphost describe --files-from - -0 --bin "
        "A.aaf\n\n"
        "All words and fields have to fit. A word is sought in names, paths, codecs and columns; "
        "word* finds\nwhat begins so; '-' before a word or field means that it must not fit (after "
        "-- where the query\nbegins with it). Numbers: 25, <10, >=1920, 10..20.\n\n" +
        FieldsHelp() +
        "\nExit status: 0, movies were found; 1, none was; 2, the call or the catalog is at "
        "fault.");
    auto options = std::make_shared<FindOptions>();
    AddPath(*verb, "catalog", options->catalog, "The catalog")->required();
    verb->add_option("query", options->words, "Words and fields; none: all movies");
    auto* const json = verb->add_flag("--json", options->json, kJsonHelp);
    verb->add_flag("-0,--null", options->paths,
                   "Print the paths alone, each ended by a byte of zero, as other programs take "
                   "them from find -print0")
        ->excludes(json);
    verb->callback([&status, options] {
        AnswerFailureToo(options->json, schema::kFind, {{"catalog", MachinePath(options->catalog)}},
                         [&] { status = Find(*options); });
    });
}

}  // namespace cliphost
