// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/FindQuery.h"

#include <fmt/format.h>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <optional>

namespace catalog {
namespace {

enum class Kind { Words, Either, Number, Seconds, Size, Rate, YesNo, Choice, Timecode, Columns };

struct Field {
    const char* name;
    Kind kind;
    // Words: the columns of the texts. Either: two columns of which one contains the value. Choice:
    // a column, and behind it, after spaces, what it may hold. Columns: the names of bin columns,
    // as a list; none: the value begins with the name. The rest: an expression on a movie.
    const char* on;
    const char* example;
    const char* meaning;
};

constexpr Field kFields[] = {
    {"name", Kind::Words, "name", "name:interview", "words of the clip's or the file's name"},
    {"path", Kind::Words, "path", "path:day2", "words of the path"},
    {"codec", Kind::Either, "codec codec_name", "codec:prores",
     "the picture's codec, by name or code"},
    {"sound", Kind::Either, "sound_codec sound_name", "sound:aac",
     "the first sound's codec, by name or code"},
    {"rate", Kind::Rate, "rate", "rate:23.976", "edit units a second; 24000/1001 too"},
    {"width", Kind::Number, "width", "width:>=1920", "of a frame, in pixels"},
    {"height", Kind::Number, "height", "height:1080", "of a frame, in pixels"},
    {"alpha", Kind::YesNo, "alpha", "alpha:yes", "whether the picture has alpha"},
    {"length", Kind::Seconds, "seconds", "length:<10", "in seconds"},
    {"frames", Kind::Number, "length", "frames:1", "the length in edit units"},
    {"tc", Kind::Timecode, "start", "tc:10:00..11:00", "the start timecode, or how it begins"},
    {"channels", Kind::Number, "channels", "channels:>2", "of sound, in all tracks"},
    {"hz", Kind::Number, "sound_rate", "hz:96000", "the first sound's samples a second"},
    {"size", Kind::Size, "size", "size:>1.5G", "of the file, in bytes; K, M, G and T"},
    {"route", Kind::Choice, "route header library none", "route:library",
     "by which way it is read"},
    {"reel", Kind::Columns, "'reel', 'reel name', 'tape', 'tape name', 'tapeid'", "reel:A001*",
     "what a column for reels holds"},
    {"tape", Kind::Columns, "'reel', 'reel name', 'tape', 'tape name', 'tapeid'", "tape:A001",
     "the same"},
    {"column", Kind::Columns, "", "column:Scene=12*", "what a column of any name holds"},
    {"warning", Kind::YesNo, "EXISTS (SELECT 1 FROM warnings WHERE movie = movies.id)",
     "warning:yes", "whether anything is told against it"},
    {"failed", Kind::YesNo, "failed", "failed:no", "whether it could not be described"},
    {"copy", Kind::YesNo,
     "EXISTS (SELECT 1 FROM movies AS other WHERE other.master_mob = movies.master_mob AND "
     "other.id <> movies.id)",
     "copy:yes", "whether another movie has the same content"},
};

const Field* Find(std::string_view name) {
    const auto found = std::find_if(std::begin(kFields), std::end(kFields),
                                    [&](const Field& field) { return field.name == name; });
    return found == std::end(kFields) ? nullptr : found;
}

std::string FieldNames() {
    std::string names;
    for (const Field& field : kFields) {
        names += names.empty() ? field.name : std::string(", ") + field.name;
    }
    return names;
}

[[noreturn]] void Refuse(const Field& field, const std::string& value, const std::string& what) {
    throw QueryError(fmt::format("{}:{} {}, such as {}", field.name, value, what, field.example));
}

// "<10", ">=10", "10..20" and "10": both ends count where they are there.
struct Range {
    struct End {
        std::string text;
        bool isIncluded = true;
    };
    std::optional<End> least;
    std::optional<End> most;
};

Range RangeIn(const std::string& value) {
    const auto behind = [&](std::size_t count) { return value.substr(count); };
    const bool hasEqual = value.size() > 1 && value[1] == '=';
    Range range;
    if (!value.empty() && value[0] == '<') {
        range.most = {behind(hasEqual ? 2 : 1), hasEqual};
    } else if (!value.empty() && value[0] == '>') {
        range.least = {behind(hasEqual ? 2 : 1), hasEqual};
    } else if (const std::size_t dots = value.find(".."); dots != std::string::npos) {
        range.least = {value.substr(0, dots)};
        range.most = {behind(dots + 2)};
    } else {
        range.least = {value};
        range.most = {value};
    }
    return range;
}

std::optional<double> NumberIn(std::string_view text) {
    double number = 0;
    const char* const end = text.data() + text.size();
    const auto read = std::from_chars(text.data(), end, number, std::chars_format::fixed);
    return read.ec == std::errc() && read.ptr == end && std::isfinite(number)
               ? std::optional(number)
               : std::nullopt;
}

std::optional<double> SizeIn(std::string_view text) {
    constexpr std::string_view kLetters = "KMGT";
    double unit = 1;
    if (const auto letter = text.empty() ? kLetters.npos : kLetters.find(text.back());
        letter != kLetters.npos) {
        unit = std::pow(1000.0, static_cast<double>(letter + 1));
        text.remove_suffix(1);
    }
    const std::optional<double> number = NumberIn(text);
    return number ? std::optional(*number * unit) : std::nullopt;
}

std::optional<double> RateIn(std::string_view text) {
    const std::size_t slash = text.find('/');
    if (slash == text.npos) {
        return NumberIn(text);
    }
    const auto over = NumberIn(text.substr(0, slash));
    const auto under = NumberIn(text.substr(slash + 1));
    return over && under && *under != 0 ? std::optional(*over / *under) : std::nullopt;
}

// Within half of the last place that people write: 23.98 is 24000/1001, and 24 is not.
double RateTolerance(double) {
    return 0.005;
}

double NoTolerance(double) {
    return 0;
}

// Within half of the last of the six digits that are shown.
double SecondsTolerance(double seconds) {
    return seconds > 0 ? 0.5 * std::pow(10.0, std::floor(std::log10(seconds)) - 5) : 0;
}

void AddRange(const Field& field, const std::string& value,
              std::optional<double> (*read)(std::string_view), double (*toleranceOf)(double),
              Condition& all) {
    const Range range = RangeIn(value);
    const auto number = [&](const Range::End& end) {
        const std::optional<double> found = read(end.text);
        if (!found) {
            Refuse(field, value, "is no number");
        }
        return *found;
    };
    std::string sql;
    if (range.least) {
        const double least = number(*range.least);
        const double slack = toleranceOf(least) * (range.least->isIncluded ? -1 : 1);
        sql = fmt::format("{} {} ?", field.on, range.least->isIncluded ? ">=" : ">");
        all.values.emplace_back(least + slack);
    }
    if (range.most) {
        const double most = number(*range.most);
        const double slack = toleranceOf(most) * (range.most->isIncluded ? 1 : -1);
        sql += fmt::format("{}{} {} ?", sql.empty() ? "" : " AND ", field.on,
                           range.most->isIncluded ? "<=" : "<");
        all.values.emplace_back(most + slack);
    }
    all.sql += sql;
}

// Quotes make a phrase of it for the text search, whatever is in it; a star at the end stands for
// the rest of a word.
std::string PhraseOf(std::string value) {
    const bool isBeginning = value.size() > 1 && value.back() == '*';
    if (isBeginning) {
        value.pop_back();
    }
    std::string phrase = "\"";
    for (const char c : value) {
        // The search ends its texts with a byte of zero.
        phrase += c == '"' ? std::string("\"\"") : std::string(1, c == '\0' ? ' ' : c);
    }
    return phrase + (isBeginning ? "\"*" : "\"");
}

void AddWords(const std::string& column, const std::string& value, Condition& all) {
    all.sql += "id IN (SELECT rowid FROM texts WHERE texts MATCH ?)";
    all.values.emplace_back(column.empty() ? PhraseOf(value)
                                           : "{" + column + "} : " + PhraseOf(value));
}

void AddYesNo(const Field& field, const std::string& value, Condition& all) {
    if (value != "yes" && value != "no") {
        Refuse(field, value, "is neither yes nor no");
    }
    all.sql += fmt::format("{} {}", field.on, value == "yes" ? "= 1" : "IS NOT TRUE");
}

void AddChoice(const Field& field, const std::string& value, Condition& all) {
    const std::string_view on = field.on;
    const std::size_t space = on.find(' ');
    const std::string known = fmt::format("{} ", on.substr(space));
    if (value.find(' ') != value.npos || known.find(" " + value + " ") == known.npos) {
        Refuse(field, value, fmt::format("is none of{}", on.substr(space)));
    }
    all.sql += fmt::format("{} = ?", on.substr(0, space));
    all.values.emplace_back(value);
}

// Hours, and what may follow them, with all places that they are shown with; empty for anything
// else. ';' counts as ':'. Frames of great rates have three places.
std::string TimecodeIn(std::string_view text) {
    constexpr std::size_t kParts = 4;
    std::string timecode;
    std::size_t part = 0;
    for (; !text.empty() && part < kParts; ++part) {
        const std::size_t size = std::min(text.find_first_not_of("0123456789"), text.size());
        const bool ends = size == text.size();
        if (size == 0 || size > (part + 1 < kParts ? 2u : 3u) ||
            (!ends && text[size] != ':' && text[size] != ';') || size + 1 == text.size()) {
            return {};
        }
        timecode += part == 0 ? "" : ":";
        timecode += (size == 1 ? "0" : "") + std::string(text.substr(0, size));
        text.remove_prefix(ends ? size : size + 1);
    }
    return text.empty() ? timecode : std::string();
}

// Timecodes compare as texts, since all have the same places.
void AddTimecode(const Field& field, const std::string& value, Condition& all) {
    const Range range = RangeIn(value);
    const auto text = [&](const Range::End& end) {
        std::string timecode = TimecodeIn(end.text);
        if (timecode.empty()) {
            Refuse(field, value, "is no timecode");
        }
        return timecode;
    };
    const std::string shown = fmt::format("replace({}, ';', ':')", field.on);
    // What begins with an included end is included, too.
    const auto bound = [&](const Range::End& end, bool isMost) {
        return text(end) + (isMost == end.isIncluded ? "~" : "");
    };
    std::string sql;
    if (range.least) {
        sql = shown + " >= ?";
        all.values.emplace_back(bound(*range.least, false));
    }
    if (range.most) {
        sql += (sql.empty() ? "" : " AND ") + shown + " < ?";
        all.values.emplace_back(bound(*range.most, true));
    }
    all.sql += sql;
}

// A star stands for any characters.
std::string PatternOf(const std::string& value) {
    std::string pattern;
    for (const char c : value) {
        if (c == '%' || c == '_' || c == '\\') {
            pattern += '\\';
        }
        pattern += c == '*' ? '%' : c;
    }
    return pattern;
}

void AddEither(const Field& field, const std::string& value, Condition& all) {
    const std::string_view on = field.on;
    const std::size_t space = on.find(' ');
    all.sql += fmt::format("{} LIKE ? ESCAPE '\\' OR {} LIKE ? ESCAPE '\\'", on.substr(0, space),
                           on.substr(space + 1));
    for (int i = 0; i < 2; ++i) {
        all.values.emplace_back("%" + PatternOf(value) + "%");
    }
}

void AddColumns(const Field& field, const std::string& value, Condition& all) {
    const bool isOfAnyName = *field.on == '\0';
    const std::size_t equal = value.find('=');
    if (isOfAnyName && (equal == value.npos || equal == 0)) {
        Refuse(field, value, "needs a column's name and what it holds");
    }
    all.sql += fmt::format(
        "id IN (SELECT movie FROM columns WHERE name COLLATE NOCASE IN ({}) AND value LIKE ? "
        "ESCAPE '\\')",
        isOfAnyName ? "?" : field.on);
    if (isOfAnyName) {
        all.values.emplace_back(value.substr(0, equal));
    }
    all.values.emplace_back(PatternOf(isOfAnyName ? value.substr(equal + 1) : value));
}

void AddTerm(const Term& term, Condition& all) {
    if (term.field.empty()) {
        AddWords("", term.value, all);
        return;
    }
    const Field* const field = Find(term.field);
    if (!field) {
        throw QueryError(fmt::format(
            "there is no field '{}'; the fields are {}; put a text with a colon into quotes",
            term.field, FieldNames()));
    }
    switch (field->kind) {
        case Kind::Words:
            return AddWords(field->on, term.value, all);
        case Kind::Either:
            return AddEither(*field, term.value, all);
        case Kind::Number:
            return AddRange(*field, term.value, NumberIn, NoTolerance, all);
        case Kind::Seconds:
            return AddRange(*field, term.value, NumberIn, SecondsTolerance, all);
        case Kind::Size:
            return AddRange(*field, term.value, SizeIn, NoTolerance, all);
        case Kind::Rate:
            return AddRange(*field, term.value, RateIn, RateTolerance, all);
        case Kind::YesNo:
            return AddYesNo(*field, term.value, all);
        case Kind::Choice:
            return AddChoice(*field, term.value, all);
        case Kind::Timecode:
            return AddTimecode(*field, term.value, all);
        case Kind::Columns:
            return AddColumns(*field, term.value, all);
    }
}

// Reads a query's terms one behind the other.
class Reader {
public:
    explicit Reader(std::string_view query) : rest_(query) {}

    std::optional<Term> Next() {
        SkipSpaces();
        if (rest_.empty()) {
            return std::nullopt;
        }
        Term term;
        if (rest_[0] == '-') {
            term.isNegated = true;
            rest_.remove_prefix(1);
        }
        bool isQuoted = false;
        term.value = Piece(true, isQuoted);
        if (!isQuoted && !rest_.empty() && rest_[0] == ':') {
            rest_.remove_prefix(1);
            term.field = std::move(term.value);
            term.value = Piece(false, isQuoted);
            if (term.field.empty()) {
                throw QueryError("no field stands before ':" + term.value +
                                 "'; put a text with a colon into quotes");
            }
        }
        if (term.value.empty()) {
            throw QueryError(term.field.empty() ? "a '-' or a pair of quotes stands for nothing"
                                                : "no value stands behind '" + term.field + ":'");
        }
        return term;
    }

private:
    static bool IsSpace(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

    void SkipSpaces() {
        while (!rest_.empty() && IsSpace(rest_[0])) {
            rest_.remove_prefix(1);
        }
    }

    // Up to a space outside of quotes; `endsAtColon`: or to a colon there.
    std::string Piece(bool endsAtColon, bool& isQuoted) {
        std::string piece;
        bool isOpen = false;
        while (!rest_.empty()) {
            const char c = rest_[0];
            if (!isOpen && (IsSpace(c) || (endsAtColon && c == ':' && !isQuoted))) {
                break;
            }
            rest_.remove_prefix(1);
            if (c == '"') {
                isOpen = !isOpen;
                isQuoted = true;
            } else {
                piece += c;
            }
        }
        if (isOpen) {
            throw QueryError("a quote is opened and not closed: \"" + piece);
        }
        return piece;
    }

    std::string_view rest_;
};

}  // namespace

std::vector<Term> TermsOf(std::string_view query) {
    std::vector<Term> terms;
    Reader reader(query);
    while (std::optional<Term> term = reader.Next()) {
        terms.push_back(std::move(*term));
    }
    return terms;
}

Condition ConditionOf(const std::vector<Term>& terms) {
    // A statement has so many values at most, and nobody has so many words.
    constexpr std::size_t kMostTerms = 500;
    if (terms.size() > kMostTerms) {
        throw QueryError(fmt::format("more than {} terms", kMostTerms));
    }
    Condition all;
    for (const Term& term : terms) {
        all.sql += all.sql.empty() ? "(" : " AND (";
        AddTerm(term, all);
        // What is not known fits no value, and so it fits what is negated.
        all.sql += term.isNegated ? ") IS NOT TRUE" : ")";
    }
    if (all.sql.empty()) {
        all.sql = "TRUE";
    }
    return all;
}

std::vector<FieldHelp> AllFields() {
    std::vector<FieldHelp> fields;
    for (const Field& field : kFields) {
        fields.push_back({field.name, field.example, field.meaning});
    }
    return fields;
}

}  // namespace catalog
