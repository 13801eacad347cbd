// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Database/DatabaseLayout.h"

namespace velmora::databaseLayout {

const char* const tables = R"(
PRAGMA user_version = 1;
CREATE TABLE messages (
    number INTEGER PRIMARY KEY,
    time INTEGER NOT NULL,
    modem_time INTEGER,
    technology TEXT NOT NULL,
    code INTEGER,
    damage TEXT,
    serving_channel TEXT,
    serving_cell TEXT
);
CREATE TABLE samples (message INTEGER NOT NULL, leaf INTEGER NOT NULL, rows TEXT, key TEXT, value, text TEXT);
CREATE TABLE catalogue (
    leaf INTEGER PRIMARY KEY,
    technology TEXT NOT NULL,
    path TEXT NOT NULL,
    section TEXT,
    kind TEXT NOT NULL,
    unit TEXT,
    role TEXT,
    identity TEXT,
    clause TEXT
);
CREATE TABLE events (
    time INTEGER NOT NULL,
    end INTEGER,
    severity TEXT NOT NULL,
    kind TEXT NOT NULL,
    technology TEXT NOT NULL,
    text TEXT NOT NULL,
    "from",
    "to",
    value,
    unit TEXT,
    cause,
    duration,
    message INTEGER
);
CREATE TABLE positions (
    time INTEGER NOT NULL,
    latitude REAL NOT NULL,
    longitude REAL NOT NULL,
    altitude REAL,
    speed REAL,
    course REAL,
    hdop REAL,
    deviation REAL
);
)";

const char* const indexes = R"(
CREATE INDEX samples_by_leaf ON samples (leaf, message);
CREATE INDEX samples_by_message ON samples (message);
CREATE INDEX messages_by_time ON messages (time);
CREATE INDEX catalogue_by_path ON catalogue (path);
CREATE INDEX catalogue_by_role ON catalogue (role);
CREATE INDEX events_by_time ON events (time);
CREATE INDEX positions_by_time ON positions (time);
ANALYZE;
)";

// A position is that of a message up to 10 s later, as in a track.
const char* const views = R"(
CREATE VIEW readings AS
    SELECT message, time, messages.technology AS technology, code, path, rows, key, value, unit, text, role
    FROM samples JOIN catalogue USING (leaf) JOIN messages ON number = message
        AND messages.technology = catalogue.technology;
CREATE VIEW serving_levels AS
    SELECT message, m.time, m.technology, path, value AS level, serving_channel AS channel, serving_cell AS cell
    FROM catalogue AS c JOIN samples AS s USING (leaf) JOIN messages AS m ON m.number = s.message
    WHERE role = 'serving.level' AND unit = 'dBm' AND typeof(value) IN ('integer', 'real');
CREATE VIEW level_by_minute AS
    SELECT strftime('%Y-%m-%d %H:%M', time / 1000000000, 'unixepoch') AS minute, technology,
        count(*) AS samples, avg(level) AS mean, min(level) AS least
    FROM serving_levels GROUP BY minute, technology;
CREATE VIEW level_by_cell AS
    SELECT technology, channel, cell, count(*) AS samples, avg(level) AS mean, min(level) AS least
    FROM serving_levels WHERE cell IS NOT NULL GROUP BY technology, channel, cell;
CREATE VIEW events_by_kind AS
    SELECT severity, kind, count(*) AS events, sum(duration) AS seconds FROM events GROUP BY severity, kind;
CREATE VIEW level_by_place AS
    SELECT round(latitude, 3) AS latitude, round(longitude, 3) AS longitude, count(*) AS samples, avg(level) AS mean
    FROM serving_levels AS s JOIN positions AS p ON p.rowid = (
        SELECT rowid FROM positions WHERE time <= s.time AND time >= s.time - 10000000000 ORDER BY time DESC LIMIT 1)
    GROUP BY 1, 2;
CREATE VIEW damage_by_code AS
    SELECT technology, code, damage, count(*) AS messages FROM messages WHERE damage IS NOT NULL
    GROUP BY technology, code, damage;
)";

} // namespace velmora::databaseLayout
