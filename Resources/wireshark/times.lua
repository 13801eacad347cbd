-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Time stamps ------------------------------------------------------------------------------------------------
--
-- The upper 48 bits count units of 1.25 ms since 1980-01-06 without leap seconds, the lower 16 bits the 1/32
-- chips since the unit began. All of it is exact in the 53 bits of a Lua number.

local epoch = 315964800 -- 1980-01-06 in seconds since 1970
local unitsPerSecond = 800
local unit = 1250000 -- nanoseconds
local partsPerUnit = 49152
local unitsOfTime = 7125925789483 -- from here on nanoseconds since 1970 leave 64 bits

-- The moments, in seconds since 1970, from which the time stamps' time has been one second further ahead of
-- UTC.
local leaps = {
    362793600, 394329600, 425865600, 489024000, 567993600, 631152000, 662688000, 709948800, 741484800,
    773020800, 820454400, 867715200, 915148800, 1136073600, 1230768000, 1341100800, 1435708800, 1483228800,
}

-- Seconds and nanoseconds since 1970; none where the stamp means no moment.
local function timeOf(units, parts)
    if parts >= partsPerUnit or units >= unitsOfTime then
        return nil
    end
    local rest = math.floor((parts * unit + partsPerUnit / 2) / partsPerUnit)
    local seconds = epoch + math.floor(units / unitsPerSecond)
    local nanoseconds = units % unitsPerSecond * unit + rest
    if nanoseconds >= 1000000000 then
        seconds = seconds + 1
        nanoseconds = nanoseconds - 1000000000
    end
    for ahead = #leaps, 1, -1 do
        -- Within the inserted second itself UTC stands at the leap.
        if seconds >= leaps[ahead] + ahead - 1 then
            return seconds - (seconds >= leaps[ahead] + ahead and ahead or ahead - 1), nanoseconds
        end
    end
    return seconds, nanoseconds
end
