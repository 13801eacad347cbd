-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Ostrel CDMA: records that are shown completely or not at all. Several depend on earlier ones.

local function rejected(record, text)
    damaged(record, experts.shortRecord, string.format("Record 0x%04X: %s", record.code, text))
end

-- Whether the record has that length; a damage where it has not.
local function hasLength(record, least)
    if record.size >= least then
        return true
    end
    rejected(record, string.format("%d bytes, wanted at least %d", record.size, least))
    return false
end

-- Adds groups from there on; what is valid in a connection alone shows nothing outside of one.
local notValid = "N/A"
local function addValid(tree, groups, record, base, isConnected, subPacket)
    for _, group in ipairs(groups) do
        if group.sub == subPacket then
            for _, row in ipairs(group) do
                if row.o and (isConnected or row.n ~= notValid) then
                    addNumber(tree, row, record.range(base + row.o, row.size), row.read(record.bytes, base))
                end
            end
        end
    end
end

local function decibels(ratio)
    return 10 * math.log(ratio, 10)
end

-- Adds pilots or fingers of a fixed length: the PN offset, then the energy in units of 1/512.
local function addPilots(tree, list, record, first, length, count, energyAt, unassigned)
    local row = list.groups[1][1]
    for i = 0, count - 1 do
        local at = first + length * i
        local offset = littleEndian(record.bytes, at + 1, 2)
        if offset ~= unassigned then
            local range = record.range(at, length)
            local energy = littleEndian(record.bytes, at + energyAt + 1, 2)
            addReal(addEntry(tree, list, range, offset), row, record.range(at + energyAt, 2),
                    decibels(energy / 512))
        end
    end
end

shapes["108A"] = function(tree, view, record)
    if hasLength(record, 23) then
        local count = byte(record.bytes, 23)
        if record.size ~= 23 + 14 * count then
            rejected(record, string.format("%d bytes, wanted %d", record.size, 23 + 14 * count))
        else
            addPilots(tree, view.lists["kFingerC2I"], record, 23, 14, count, 6, 0xFFFF)
        end
    end
end

shapes["12B6"] = function(tree, view, record)
    if hasLength(record, 25) then
        local count = byte(record.bytes, 16)
        if hasLength(record, 25 + 12 * count) then
            addPilots(tree, view.lists["kActiveSetPilots"], record, 25, 12, count, 2)
        end
    end
end

local accessState = 4
shapes["1183"] = function(tree, view, record)
    if record.size ~= 50 then
        rejected(record, string.format("%d bytes, wanted 50", record.size))
    else
        addValid(tree, view.groups, record, 0, byte(record.bytes, 37) >= accessState)
    end
end

-- The data rate since the earlier record, by its sequence number and the bits that were sent until now.
local function addRate(tree, view, record, what, at, sequence, sent)
    local rate = once(record, function(state)
        local earlier = state[what]
        state[what] = {sequence, sent}
        if earlier then
            local steps = signed((sequence - earlier[1]) % 2 ^ 32, 32)
            if steps >= 1 then
                return (sent - earlier[2]) / (steps * 1024)
            end
        end
        return false
    end)
    if rate then
        addReal(tree, view.groups[1][1], record.range(at, 4), rate)
    end
end

-- What a packet of each counter adds, in bits.
local forwardWeights = {
    128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0, 128, 256, 512,
    1024, 0, 512, 1024, 2048, 0, 128, 256, 512, 1024, 0, 512, 1024, 2048, 0, 1024, 3072, 0, 512, 1024, 2048, 0,
    4096, 0, 1024, 3072, 0, 4096, 0, 5120, 0, 5120, 0,
}
shapes["1192"] = function(tree, view, record)
    if hasLength(record, 241) then
        local sent = 0
        for i, weight in ipairs(forwardWeights) do
            if weight ~= 0 then
                sent = sent + littleEndian(record.bytes, 14 + 4 * i, 4) * weight
            end
        end
        addRate(tree, view, record, "forward", 13, littleEndian(record.bytes, 14, 4), sent)
    end
end

-- The sum of four counters, which is what takes the time here.
local function sumOfFour(bytes, offset)
    local a, b, c, d, e, f, g, h, i, j, k, l, m, n, o, p = byte(bytes, offset + 1, offset + 16)
    return a + e + i + m + (b + f + j + n) * 0x100 + (c + g + k + o) * 0x10000 + (d + h + l + p) * 0x1000000
end

-- Of each size: two groups of four counters in each of three blocks.
local reverseWeights = {128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288}
shapes["127E"] = function(tree, view, record)
    if hasLength(record, 1750) then
        local sent = 0
        for size, weight in ipairs(reverseWeights) do
            local packets = 0
            for at = 24 * size - 6, 24 * size + 1146, 576 do
                packets = packets + sumOfFour(record.bytes, at) + sumOfFour(record.bytes, at + 288)
            end
            sent = sent + packets * weight
        end
        addRate(tree, view, record, "reverse", 14, littleEndian(record.bytes, 15, 4), sent)
    end
end

local cdmaSystem = 2
shapes["134F"] = function(tree, view, record)
    if not hasLength(record, 171) then
        return
    elseif byte(record.bytes, 14) < 2 then
        rejected(record, "version below 2")
        return
    end
    local isOurs = littleEndian(record.bytes, 47, 4) == cdmaSystem
    for _, group in ipairs(view.groups) do
        for _, row in ipairs(group) do
            local isIdentity = row.l == "kSystemId" or row.l == "kNetworkId"
            if (isOurs or not isIdentity) and record.size >= row.o + row.size then
                addNumber(tree, row, record.range(row.o, row.size), row.read(record.bytes, 0))
            end
        end
    end
    hasLength(record, 186)
end

-- Where each sub-packet begins; what is looked for past the record's end is missing, and says so.
local function subPackets(record)
    local found = {}
    local at = 17
    for _ = 1, byte(record.bytes, 15) do
        if at + 4 > record.size then
            found.isCut = true
            break
        end
        local id = byte(record.bytes, at + 1)
        local size = littleEndian(record.bytes, at + 3, 2)
        if at + size >= 17 + record.size then
            break
        end
        found[id] = found[id] or at
        if size == 0 then
            break -- all that follow are this one
        end
        at = at + size
    end
    return found
end

-- A number of single precision.
local function single(number)
    if number == 0 then
        return 0
    end
    local mantissa, exponent = math.frexp(number)
    local scaled = mantissa * 2 ^ 24
    local whole = floor(scaled + 0.5)
    if whole - scaled == 0.5 and whole % 2 ~= 0 then
        whole = whole - 1
    end
    return math.ldexp(whole / 2 ^ 24, exponent)
end

shapes["119D"] = function(tree, view, record)
    if not hasLength(record, 17) then
        return
    end
    local at = subPackets(record)[11]
    if not at then
        rejected(record, "no sub-packet 11")
        return
    elseif not hasLength(record, at + 25) then
        return
    end
    local erased = byte(record.bytes, at + 25) ~= 0
    local average = once(record, function(state)
        local new = erased and 0.015625 or 0
        if state.errors then
            new = single(new + single(state.errors * 0.984375))
        end
        state.errors = new
        return new
    end)
    addReal(tree, view.groups[1][1], record.range(at + 24, 1), single(average * 100))
end

local function addActiveSet(tree, list, record, base)
    local bytes = record.bytes
    local n = littleEndian(bytes, base + 5, 2)
    local g, s, count, long = byte(bytes, base + 7, base + 10)
    local energyAt = 24 + 4 * long
    local stride = floor((6 * long + 15) / 4) % 1024 * 4
    return count == 0 and 12 or stride * (count - 1) + energyAt + 2, function()
        for i = 0, count - 1 do
            local at = base + stride * i
            local offset = littleEndian(bytes, at + 13, 2)
            local energy = littleEndian(bytes, at + energyAt + 1, 2)
            local ratio = energy * 2 ^ (2 * s - 3) / (9 * n * n * g) - 1 / n
            ratio = ratio > 0.00001 and ratio or 0.00001
            local entry = addEntry(tree, list, record.range(at + 12, 2), offset)
            addReal(entry, list.groups[1][1],
                    record.range(at + energyAt, 2), decibels(ratio))
        end
    end
end

local trafficState = 8
shapes["119C"] = function(tree, view, record)
    if not hasLength(record, 17) then
        return
    end
    local found = subPackets(record)
    local system, radio, active = found[1], found[2], found[3]
    if not (system and radio and active and found[4]) then
        rejected(record, "a sub-packet is missing")
        return
    elseif not hasLength(record, system + 5) then
        return
    end
    local isTraffic = byte(record.bytes, system + 5) == trafficState
    local list = view.lists["k1xActiveSetInfo"]
    if not hasLength(record, radio + (isTraffic and 14 or 11)) or not hasLength(record, active + 12) then
        return
    end
    local length, addAll = addActiveSet(tree, list, record, active)
    if not hasLength(record, active + length) then
        return
    end
    addValid(tree, view.groups, record, system, isTraffic, 1)
    addValid(tree, view.groups, record, radio, isTraffic, 2)
    addAll()
    local last = once(record, function(state)
        local errors = state.errors
        if not isTraffic then
            state.errors = nil
        end
        return not isTraffic and errors or false
    end)
    if last then
        addReal(tree, view.rows["k1xTrafficFER"], record.range(system + 4, 1), single(last * 100))
    end
end
