-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Between which cells do phones move back and forth? Moves in either direction, and how many of them were ping-pongs.
SELECT technology, least(from_text, to_text) AS one, greatest(from_text, to_text) AS other,
       count(*) FILTER (kind_text <> 'ping-pong') AS moves, count(*) FILTER (kind_text = 'ping-pong') AS ping_pongs
FROM 'events/**/*.parquet'
WHERE kind_text IN ('handover', 'cell-reselection', 'cell-change', 'ping-pong')
GROUP BY ALL
ORDER BY ping_pongs DESC, moves DESC, technology, one, other
LIMIT 20;
