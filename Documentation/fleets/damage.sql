-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Which recordings are not to be trusted? Losses of the file, messages that could not be decoded, malformed records, gaps.
WITH found AS (
    SELECT file, technology, count(*) FILTER (kind_text = 'malformed') AS malformed,
           count(*) FILTER (kind_text = 'gap') AS gaps
    FROM 'events/**/*.parquet' GROUP BY ALL)
SELECT name, technology, messages, losses, undecoded, coalesce(malformed, 0) AS malformed, coalesce(gaps, 0) AS gaps
FROM 'files/**/*.parquet' LEFT JOIN found USING (file, technology)
WHERE losses > 0 OR undecoded > 0 OR malformed > 0 OR gaps > 0
ORDER BY losses DESC, undecoded DESC, malformed DESC, name
LIMIT 20;
