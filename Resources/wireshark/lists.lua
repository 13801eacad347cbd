-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Records ----------------------------------------------------------------------------------------------------
--
-- What the decoders' tables do not say: where the lists of a record begin, how many entries they have, and what
-- sections compute. Each has the name of its section and log code; a view without such a function is a table.

local views = {
@VIEWS@
}
local viewOrder = {"Ostrel_GSM", "Ostrel_CDMA", "Ostrel_LTE", "Ostrel_UTRAN2", "Modem"}
for _, codes in pairs(views) do
    for _, sectionViews in pairs(codes) do
        for _, view in ipairs(sectionViews) do
            prepare(view)
        end
    end
end

-- What decoders keep from record to record, by technology. Packets are looked at in order once, and then in any
-- order: what depends on earlier ones is kept by the packet's number.
local running = {}
local kept = {}

-- What `compute` returns of the technology's state, when this packet is looked at for the first time. A packet is
-- of one code, which has one such value; it may not be nil.
local function once(record, compute)
    local value = kept[record.number]
    if value == nil then
        local state = running[record.technology]
        if not state then
            state = {}
            running[record.technology] = state
        end
        value = compute(state)
        kept[record.number] = value
    end
    return value
end

local function damaged(record, expert, text)
    record.tree:add_proto_expert_info(expert, text)
end

local function missingEntries(record, complete, count)
    if complete < count then
        damaged(record, experts.missingEntries,
                string.format("Record 0x%04X: %d of %d entries", record.code, complete, count))
    end
end

-- How many entries, from the first on, lie completely inside the record.
local function completeCount(record, first, stride, length, count)
    if first + length > record.size then
        return 0
    end
    return math.min(count, 1 + floor((record.size - first - length) / stride))
end

-- Adds the rows of a list of such entries; `addMore(row, base)` adds what its groups do not.
local function addRows(tree, list, record, first, length, count, addMore)
    local complete = completeCount(record, first, length, length, count)
    missingEntries(record, complete, count)
    for i = 0, complete - 1 do
        local base = first + length * i
        local row = addEntry(tree, list, record.range(base, length), i)
        if addMore then
            addMore(row, base, record.range(base, length))
        else
            for _, group in ipairs(list.groups) do
                addGroup(row, group, record, base)
            end
        end
    end
end

local function addGroups(tree, view, record)
    for _, group in ipairs(view.groups) do
        addGroup(tree, group, record, 0)
    end
end

local shapes = {}

-- A list of rows and nothing else.
local function rowsAt(first, length, count)
    return function(tree, view, record)
        addRows(tree, view.lists[""], record, type(first) == "number" and first or first(record.bytes), length,
                count(record.bytes))
    end
end

local function u8(offset)
    return function(bytes) return (byte(bytes, offset + 1)) end
end

-- Ostrel LTE.
shapes["Measured Neighbor Cells B179"] = rowsAt(29, 6, u8(27))
shapes["Detected Cells B179"] = rowsAt(function(bytes) return 29 + 6 * byte(bytes, 28) end, 2, u8(28))
shapes["Neighbor Cells List B180"] = rowsAt(21, 20, function(bytes) return bitsOf(bytes, 19, 6, 5) + 1 end)

-- Which group has what belongs to a candidate's radio technology, and the candidate's length with it. The
-- entries overlap.
local candidateGroups = {[0] = {2, 8}, {3, 8}, {4, 8}, {5, 12}, {5, 12}}
shapes["Reselection Candidates List B186"] = function(tree, view, record)
    local list, bytes = view.lists[""], record.bytes
    local first, stride, count = 21, 4, byte(bytes, 20)
    local headers = completeCount(record, first, stride, stride, count)
    local complete = 0
    while complete < headers do
        local base = first + stride * complete
        local details = candidateGroups[littleEndian(bytes, base + 3, 2)]
        local length = details and details[2] or stride
        if base + length > record.size then
            break
        end
        local row = addEntry(tree, list, record.range(base, length), complete)
        addGroup(row, list.groups[1], record, base)
        if details then
            addGroup(row, list.groups[details[1]], record, base)
        end
        complete = complete + 1
    end
    missingEntries(record, complete, count)
end

-- Ostrel UTRAN.
local function transportChannels(bytes) return bitsOf(bytes, 14, 6, 6) end
shapes["TRCH BLER D00C"] = rowsAt(17, 2, transportChannels)
shapes["CCTRCH SIR D00C"] = function(tree, view, record)
    local list = view.lists[""]
    local ratios = list.lists["SIR"]
    addRows(tree, list, record, 289 + 34 * transportChannels(record.bytes), 8, bitsOf(record.bytes, 15, 4, 4),
            function(row, base)
        addGroup(row, list.groups[1], record, base)
        for i, ratio in ipairs(ratios.groups[1]) do
            local range = record.range(base + ratio.o, ratio.size)
            addNumber(addEntry(row, ratios, range, i - 1), ratio, range, ratio.read(record.bytes, base))
        end
    end)
end
shapes["GSM Neighbor Cell List D00E"] = function(_, _, record)
    local count = byte(record.bytes, 17)
    missingEntries(record, completeCount(record, 17, 8, 8, count), count)
end
local noSet = 3
shapes["Neighbor Cell List D00A"] = function(tree, view, record)
    local list = view.lists[""]
    addRows(tree, list, record, 168, 16, bitsOf(record.bytes, 16, 1, 7), function(row, base)
        addGroup(row, list.groups[1], record, base)
        if bitsOf(record.bytes, base + 3, 5, 2) ~= noSet then
            addGroup(row, list.groups[2], record, base)
        end
        addGroup(row, list.groups[3], record, base)
    end)
end
local knownVersion = 1
shapes["RRC Info D0E0"] = function(tree, view, record)
    if record.size < 15 then
        damaged(record, experts.shortRecord,
                string.format("Record 0x%04X: %d bytes, wanted at least 15", record.code, record.size))
    elseif byte(record.bytes, 14) == knownVersion then
        addGroups(tree, view, record)
    end
end
