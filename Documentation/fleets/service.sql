-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- How long were phones without service, of the time that was recorded? By day and technology; what had not ended when
-- the recording did is not counted.
WITH recorded AS (
    SELECT date, technology, count(*) AS files, sum(epoch(last_time) - epoch(first_time)) AS seconds
    FROM 'files/**/*.parquet' GROUP BY ALL),
lost AS (
    SELECT date, technology, sum(duration_s) FILTER (kind_text = 'out-of-service') AS out_s,
           sum(duration_s) FILTER (kind_text = 'limited-service') AS limited_s
    FROM 'events/**/*.parquet' GROUP BY ALL)
SELECT date, technology, files, round(seconds) AS recorded_s, coalesce(out_s, 0) AS out_s,
       coalesce(limited_s, 0) AS limited_s
FROM recorded LEFT JOIN lost USING (date, technology)
ORDER BY date, technology;
