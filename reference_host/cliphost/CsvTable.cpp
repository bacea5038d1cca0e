// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/CsvTable.h"

#include <csv.h>
#include <fmt/format.h>

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <system_error>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Words.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

constexpr std::size_t kMostBytes = std::size_t{256} << 20;

[[noreturn]] void Refuse(const std::filesystem::path& file, std::uint64_t row,
                         const std::string& reason, const std::string& hint = {}) {
    throw Failure(kExitCaller, file, fmt::format("row {}: {}", row, reason), hint);
}

char SeparatorOf(std::string_view bytes) {
    constexpr std::string_view kSeparators = ",;\t";
    std::size_t counts[kSeparators.size()] = {};
    bool isQuoted = false;
    for (const char c : bytes) {
        if (!isQuoted && (c == '\n' || c == '\r')) {
            break;
        }
        isQuoted = isQuoted != (c == '"');
        const std::size_t which = kSeparators.find(c);
        counts[which < kSeparators.size() ? which : 0] +=
            which < kSeparators.size() && !isQuoted ? 1 : 0;
    }
    return kSeparators[static_cast<std::size_t>(std::max_element(counts, std::end(counts)) -
                                                counts)];
}

// The parser calls it from C, which nothing may be thrown through: a problem is kept.
class TableReader {
public:
    explicit TableReader(const std::filesystem::path& file) : file_(file) {
        csv_init(&parser_, CSV_STRICT | CSV_STRICT_FINI | CSV_REPALL_NL);
    }
    TableReader(const TableReader&) = delete;
    TableReader& operator=(const TableReader&) = delete;
    ~TableReader() { csv_free(&parser_); }

    CsvTable Read(std::string_view bytes) {
        csv_set_delim(&parser_, static_cast<unsigned char>(SeparatorOf(bytes)));
        const bool isWhole = csv_parse(&parser_, bytes.data(), bytes.size(), TakeCell, EndRow,
                                       this) == bytes.size() &&
                             csv_fini(&parser_, TakeCell, EndRow, this) == 0;
        if (!problem_.empty()) {
            Refuse(file_, problemRow_, problem_);
        }
        if (!isWhole) {
            Refuse(
                file_, row_,
                "a quote stands where none may: " + std::string(csv_strerror(csv_error(&parser_))),
                "a cell with quotes in it stands between quotes, with each of them doubled");
        }
        if (table_.header.empty()) {
            throw Failure(kExitCaller, file_, "the table is empty",
                          "its first row names the columns");
        }
        return std::move(table_);
    }

private:
    static void TakeCell(void* bytes, std::size_t size, void* self) {
        auto& reader = *static_cast<TableReader*>(self);
        reader.afterReturn_ = false;
        if (reader.problem_.empty()) {
            reader.Take({static_cast<const char*>(bytes), size});
        }
    }

    static void EndRow(int end, void* self) {
        auto& reader = *static_cast<TableReader*>(self);
        if (end == '\n' && std::exchange(reader.afterReturn_, false)) {
            return;  // of the same line end
        }
        reader.afterReturn_ = end == '\r';
        reader.End();
    }

    void Take(std::string_view cell) {
        if (cells_.size() >= kMostCells) {
            Keep(fmt::format("it has more than {} cells", kMostCells));
        } else if (cell.size() > kLongestCell) {
            Keep(fmt::format("cell {} is longer than {} bytes", cells_.size() + 1, kLongestCell));
        } else if (cell.find('\0') != std::string_view::npos ||
                   encodings::HoldsSurrogate(encodings::FromUtf8(cell))) {
            Keep(
                fmt::format("cell {} is not in UTF-8; save the table as UTF-8", cells_.size() + 1));
        } else {
            cells_.emplace_back(cell);
        }
    }

    void Keep(std::string problem) {
        problem_ = std::move(problem);
        problemRow_ = row_;
    }

    void End() {
        std::vector<std::string> cells = std::exchange(cells_, {});
        const std::uint64_t number = row_++;
        const bool isEmpty = std::all_of(cells.begin(), cells.end(),
                                         [](const std::string& cell) { return cell.empty(); });
        if (isEmpty || !problem_.empty()) {
            return;
        }
        if (table_.header.empty()) {
            table_.header = std::move(cells);
            return;
        }
        while (cells.size() > table_.header.size() && cells.back().empty()) {
            cells.pop_back();
        }
        if (cells.size() > table_.header.size()) {
            problem_ = fmt::format("it has {} cells, and the first row names {} columns",
                                   cells.size(), table_.header.size());
            problemRow_ = number;
            return;
        }
        cells.resize(table_.header.size());
        table_.rows.push_back({number, std::move(cells)});
    }

    const std::filesystem::path& file_;
    csv_parser parser_;
    CsvTable table_;
    std::vector<std::string> cells_;
    std::uint64_t row_ = 1;
    bool afterReturn_ = false;
    std::string problem_;
    std::uint64_t problemRow_ = 0;
};

}  // namespace

CsvTable ParseCsv(const std::filesystem::path& file, std::string_view bytes) {
    if (bytes.substr(0, 2) == "\xFF\xFE" || bytes.substr(0, 2) == "\xFE\xFF") {
        throw Failure(kExitCaller, file, "the table is in UTF-16", "save it as UTF-8");
    }
    if (bytes.substr(0, kByteOrderMark.size()) == kByteOrderMark) {
        bytes.remove_prefix(kByteOrderMark.size());
    }
    return TableReader(file).Read(bytes);
}

CsvTable ReadCsvFile(const std::filesystem::path& file) {
    std::error_code error;
    // Every process of the program reads it.
    if (std::filesystem::exists(file, error) && !std::filesystem::is_regular_file(file, error)) {
        throw Failure(kExitCaller, file, "the table is no regular file", "save it as one");
    }
    errno = 0;
    std::ifstream stream(file, std::ios::binary);
    std::string bytes;
    char piece[65536];
    while (stream && bytes.size() <= kMostBytes) {
        stream.read(piece, sizeof piece);
        bytes.append(piece, static_cast<std::size_t>(stream.gcount()));
    }
    if (!stream.is_open() || stream.bad()) {
        throw Failure(kExitCaller, file,
                      "the table can't be read: " +
                          std::generic_category().message(errno != 0 ? errno : EIO));
    }
    if (bytes.size() > kMostBytes) {
        throw Failure(kExitCaller, file, "the table is larger than 256 MiB", "split it");
    }
    return ParseCsv(file, bytes);
}

std::string CsvLine(const std::vector<std::string>& cells) {
    std::string line;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        const std::string& cell = cells[i];
        line += i == 0 ? "" : ",";
        const bool isPlain = cell.find_first_of(",;\t\r\n\"") == std::string::npos &&
                             (cell.empty() || (cell.front() != ' ' && cell.back() != ' '));
        if (isPlain) {
            line += cell;
            continue;
        }
        const std::size_t start = line.size();
        line.resize(start + csv_write(nullptr, 0, cell.data(), cell.size()));
        csv_write(line.data() + start, line.size() - start, cell.data(), cell.size());
    }
    return line + "\r\n";
}

}  // namespace cliphost
