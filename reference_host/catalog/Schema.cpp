// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/Schema.h"

namespace catalog {
namespace {

constexpr char kVersion1[] = R"sql(
CREATE TABLE movies (
    id INTEGER PRIMARY KEY,
    path TEXT NOT NULL UNIQUE,
    name TEXT NOT NULL,
    size INTEGER NOT NULL,
    date INTEGER NOT NULL,
    looked INTEGER NOT NULL,
    settings TEXT NOT NULL,
    failed INTEGER NOT NULL,
    route TEXT,
    route_reason TEXT,
    master_mob TEXT,
    file_mob TEXT,
    source_mob TEXT,
    rate_numerator INTEGER,
    rate_denominator INTEGER,
    length INTEGER,
    start TEXT,
    codec TEXT,
    codec_name TEXT,
    width INTEGER,
    height INTEGER,
    alpha INTEGER,
    sound_codec TEXT,
    sound_name TEXT,
    sound_rate INTEGER,
    channels INTEGER,
    rate REAL GENERATED ALWAYS AS (1.0 * rate_numerator / rate_denominator) VIRTUAL,
    seconds REAL GENERATED ALWAYS AS (1.0 * length * rate_denominator / rate_numerator) VIRTUAL
);
CREATE INDEX movies_by_content ON movies (master_mob);
CREATE INDEX movies_by_date ON movies (date);
CREATE INDEX movies_by_codec ON movies (codec_name, codec);
CREATE INDEX movies_by_rate ON movies (rate, width, height);
CREATE INDEX movies_by_alpha ON movies (alpha, rate);
CREATE INDEX movies_by_start ON movies (replace(start, ';', ':'));

CREATE TABLE tracks (
    movie INTEGER NOT NULL REFERENCES movies (id) ON DELETE CASCADE,
    number INTEGER NOT NULL,
    kind TEXT NOT NULL,
    codec TEXT,
    codec_name TEXT,
    rate_numerator INTEGER,
    rate_denominator INTEGER,
    length INTEGER,
    width INTEGER,
    height INTEGER,
    channels INTEGER,
    bits INTEGER,
    PRIMARY KEY (movie, number)
) WITHOUT ROWID;
CREATE INDEX tracks_by_codec ON tracks (codec, kind);

CREATE TABLE descriptors (
    movie INTEGER NOT NULL REFERENCES movies (id) ON DELETE CASCADE,
    number INTEGER NOT NULL,
    class TEXT NOT NULL,
    properties TEXT NOT NULL,
    PRIMARY KEY (movie, number)
) WITHOUT ROWID;

CREATE TABLE columns (
    movie INTEGER NOT NULL REFERENCES movies (id) ON DELETE CASCADE,
    place INTEGER NOT NULL,
    name TEXT NOT NULL,
    value TEXT NOT NULL,
    PRIMARY KEY (movie, place)
) WITHOUT ROWID;
CREATE INDEX columns_by_name ON columns (name COLLATE NOCASE, value COLLATE NOCASE);

CREATE TABLE warnings (
    movie INTEGER NOT NULL REFERENCES movies (id) ON DELETE CASCADE,
    place INTEGER NOT NULL,
    kind TEXT NOT NULL,
    reason TEXT NOT NULL,
    hint TEXT,
    code TEXT,
    PRIMARY KEY (movie, place)
) WITHOUT ROWID;

CREATE TABLE thumbnails (
    movie INTEGER PRIMARY KEY REFERENCES movies (id) ON DELETE CASCADE,
    type TEXT NOT NULL,
    width INTEGER NOT NULL,
    height INTEGER NOT NULL,
    picture BLOB NOT NULL
);

CREATE VIRTUAL TABLE texts USING fts5 (
    name, path, codec, sound, columns,
    tokenize = 'unicode61 remove_diacritics 2'
);
)sql";

constexpr Step kAllSteps[] = {
    {kVersion1},
};

}  // namespace

const Steps kSteps = {kAllSteps, std::size(kAllSteps)};

const Table kTables[] = {
    {"movies", "id",
     "path, name, size, date, looked, settings, failed, route, route_reason, master_mob, file_mob, "
     "source_mob, rate_numerator, rate_denominator, length, start, codec, codec_name, width, "
     "height, alpha, sound_codec, sound_name, sound_rate, channels",
     "id"},
    {"tracks", "movie",
     "number, kind, codec, codec_name, rate_numerator, rate_denominator, length, width, height, "
     "channels, bits",
     "number"},
    {"descriptors", "movie", "number, class, properties", "number"},
    {"columns", "movie", "place, name, value", "place"},
    {"warnings", "movie", "place, kind, reason, hint, code", "place"},
    {"thumbnails", "movie", "type, width, height, picture", "movie"},
};
const std::size_t kTableCount = std::size(kTables);

const char* const kRemoveTexts =
    "DELETE FROM texts WHERE rowid IN (SELECT id FROM movies WHERE path = ?1 OR id = ?2)";

// The file's name is what stands behind the last slash.
const char* const kFillTexts = R"sql(
INSERT INTO texts (rowid, name, path, codec, sound, columns)
SELECT id,
    name || char(10) || substr(path, length(rtrim(path, replace(path, '/', ''))) + 1),
    path,
    (SELECT group_concat(coalesce(codec, '') || char(10) || coalesce(codec_name, ''), char(10))
        FROM tracks WHERE movie = ?1 AND kind <> 'sound'),
    (SELECT group_concat(coalesce(codec, '') || char(10) || coalesce(codec_name, ''), char(10))
        FROM tracks WHERE movie = ?1 AND kind = 'sound'),
    (SELECT group_concat(value, char(10)) FROM columns WHERE movie = ?1)
FROM movies WHERE id = ?1
)sql";

void CheckStamp(const Stamp& stamp, const Steps& steps) {
    if (stamp.application != kApplicationId) {
        throw NoCatalog("is no catalog of this program");
    }
    if (stamp.version < 0 || stamp.version > static_cast<std::int64_t>(steps.count)) {
        throw NoCatalog("is a catalog of version " + std::to_string(stamp.version) +
                        ", and this program knows those up to " + std::to_string(steps.count));
    }
}

std::int64_t VersionOf(Database& database, const Steps& steps) {
    const Stamp stamp{database.Number("PRAGMA application_id"),
                      database.Number("PRAGMA user_version")};
    CheckStamp(stamp, steps);
    return stamp.version;
}

void BringUp(Database& database, const Steps& steps) {
    Transaction all(database);
    const bool isEmpty = database.Number("SELECT count(*) FROM sqlite_schema") == 0;
    if (isEmpty) {
        database.Run(("PRAGMA application_id = " + std::to_string(kApplicationId)).c_str());
    }
    const std::int64_t version = VersionOf(database, steps);
    for (auto step = static_cast<std::size_t>(version); step < steps.count; ++step) {
        database.Run(steps.first[step].sql);
        database.Run(("PRAGMA user_version = " + std::to_string(step + 1)).c_str());
    }
    all.Commit();
}

}  // namespace catalog
