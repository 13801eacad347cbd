-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Which LTE cells are weak where they serve? The median, and how much lies below -110 dBm, of at least 20 measurements.
SELECT e_arfcn AS channel, physical_cell_id AS cell, count(*) AS measurements,
       median(measured_rsrp_dbm) AS median_dbm,
       count(*) FILTER (measured_rsrp_dbm < -110) / count(*) AS weak_share
FROM 'serving_cell_serving_cell_measurements/technology=Ostrel_LTE/**/*.parquet'
WHERE measured_rsrp_dbm IS NOT NULL
GROUP BY ALL
HAVING count(*) >= 20
ORDER BY weak_share DESC, median_dbm, channel, cell
LIMIT 20;
