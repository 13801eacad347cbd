-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Which cells do we lose service or calls in? The serving cell is the one of the latest move before.
WITH moves AS (
    SELECT file, technology, time, to_text FROM 'events/**/*.parquet'
    WHERE kind_text IN ('handover', 'cell-reselection', 'cell-change')),
losses AS (
    SELECT file, technology, time, kind_text FROM 'events/**/*.parquet' WHERE severity_text = 'critical')
SELECT losses.technology, kind_text AS kind, coalesce(to_text, 'unknown') AS cell, count(*) AS losses,
       count(DISTINCT losses.file) AS files
FROM losses ASOF LEFT JOIN moves
     ON losses.file = moves.file AND losses.technology = moves.technology AND losses.time >= moves.time
GROUP BY ALL
ORDER BY losses DESC, losses.technology, kind, cell
LIMIT 20;
