-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Ostrel GSM.
shapes["GSM Set 4005"] = rowsAt(15, 7, u8(14))
shapes["UMTS Set 4005"] = rowsAt(15, 10, u8(13))
shapes["BLER 4116"] = function(tree, view, record)
    addGroups(tree, view, record)
    addRows(tree, view.lists["Transport Channels"], record, 16, 9, byte(record.bytes, 14))
end
shapes["Mobile Allocation 51F8"] = function(tree, view, record)
    addGroups(tree, view, record)
    local list = view.lists["ARFCNs"]
    addRows(tree, list, record, 15, 2, byte(record.bytes, 15))
end
shapes["HSDPA Info 4221"] = function(tree, view, record)
    addGroups(tree, view, record)
    local primary, secondary = byte(record.bytes, 17, 18)
    addRows(tree, view.lists["Primary HARQ Process"], record, 18, 9, primary)
    addRows(tree, view.lists["Secondary HARQ Process"], record, 18 + 162 * primary, 9, secondary)
end

-- The BSICs of ARFCNs, which are shown with the cells of another record.
shapes["Neighboring Cells 51FF"] = function(_, _, record)
    local count = byte(record.bytes, 15)
    local complete = completeCount(record, 15, 4, 4, count)
    missingEntries(record, complete, count)
    once(record, function(state)
        state.bsics = {}
        for i = 0, complete - 1 do
            local low, high, bsic = byte(record.bytes, 16 + 4 * i, 18 + 4 * i)
            state.bsics[low + high * 0x100] = bsic
        end
        return true
    end)
end
shapes["Neighboring Cells 5137"] = function(tree, view, record)
    local list = view.lists[""]
    local bsics = once(record, function(state) return state.bsics or false end)
    addRows(tree, list, record, 29, 14, byte(record.bytes, 29), function(row, base, range)
        addGroup(row, list.groups[1], record, base)
        local bsic = bsics and bsics[littleEndian(record.bytes, base + 1, 2)]
        if bsic then
            addNumber(row, list.rows["BSIC"], range, bsic)
        end
    end)
end

shapes["Equivalent PLMN List 7150"] = function(tree, view, record)
    local list = view.lists[""]
    local count = byte(record.bytes, 17)
    local complete = completeCount(record, 17, 3, 6, count)
    missingEntries(record, complete, count)
    for i = 0, complete - 1 do
        local base = 17 + 3 * i
        local range = record.range(base, 6)
        local c1, n1, c2, n2, c3, n3 = byte(record.bytes, base + 1, base + 6)
        local row = addEntry(tree, list, range, i)
        addNumber(row, list.rows["Mobile Country Code"], range, c1 * 100 + c2 * 10 + c3)
        addNumber(row, list.rows["Mobile Network Code"], range, n1 * 100 + n2 * 10 + n3)
    end
end

-- A code of BCD digits, between which fillers may lie; none where it is none.
local function addCode(tree, row, range, ...)
    local text = ""
    for _, digit in ipairs({...}) do
        text = text .. (digit < 10 and digit or " ")
    end
    text = text:match("^ *(.-) *$")
    if #text >= row.digits and text:find("^%d+$") then
        addValue(tree, row, range, text)
    end
end
shapes["Serving PLMN 7135"] = function(tree, view, record)
    local a, b, c = byte(record.bytes, 16, 18)
    addCode(tree, view.rows["Mobile Country Code"], record.range(15, 2), a % 16, floor(a / 16), b % 16)
    addCode(tree, view.rows["Mobile Network Code"], record.range(16, 2), c % 16, floor(c / 16), floor(b / 16))
    addGroup(tree, view.groups[3], record, 0)
end

-- The mean of the transmit powers; a term of zero counts as none.
shapes["UMTS RR Info 4031"] = function(tree, view, record)
    local count = byte(record.bytes, 15)
    local complete = completeCount(record, 16, 14, 14, count)
    missingEntries(record, complete, count)
    local sum, terms = 0, 0
    for i = 0, complete - 1 do
        local term = signed(littleEndian(record.bytes, 16 + 14 * i + 5, 2), 16)
        if term ~= 0 then
            local tenths = (term + 512) / 10
            sum = sum + (tenths < 0 and math.ceil(tenths) or floor(tenths)) - 70
            terms = terms + 1
        end
    end
    if terms > 0 then
        addReal(tree, view.rows["Transmit Power"], record.range(16, 14 * complete), sum / terms)
    end
end

-- Thresholds of the modem's table of Ec/No, by whole dB.
local energyThresholds = {
    417647, 331808, 263624, 209463, 166441, 132268, 105123, 83562, 66435, 52830, 42023, 33440, 26621, 21205, 16903,
    13486, 10771, 8615, 6902, 5542, 4461, 3603, 2921, 2240, 1949, 1607, 1336, 1120, 949, 813, 756, 705,
}
local function decibelsOfEnergy(energy)
    if energy < 524288 then
        for i, threshold in ipairs(energyThresholds) do
            if energy > threshold then
                return -math.min(i, 31)
            end
        end
    end
    return 0
end
local activeSet = 0
shapes["Active Set 417A"] = function(tree, view, record)
    local list, bytes = view.lists[""], record.bytes
    local count = byte(bytes, 16)
    local first = 16 + 15 * count
    local complete = completeCount(record, first, 44, 44, count)
    missingEntries(record, complete, count)
    local tenths = (signed(littleEndian(bytes, 14, 2), 16) + 512) / 10
    local level = (tenths < 0 and math.ceil(tenths) or floor(tenths)) - 106
    local index = 0
    for i = 0, complete - 1 do
        local cell, measured = 16 + 15 * i, first + 44 * i
        if bitsOf(bytes, cell + 8, 5, 3) == activeSet then
            local energy = 0
            for at = measured + 33, measured + 41, 4 do
                energy = energy == 0 and littleEndian(bytes, at, 4) or energy
            end
            local ecNo = decibelsOfEnergy(energy)
            local range = record.range(measured, 44)
            local row = addEntry(tree, list, record.range(cell, 15), index)
            addNumber(row, list.rows["Scrambling Code"], record.range(cell + 7, 2), bitsOf(bytes, cell + 7, 0, 13))
            addNumber(row, list.rows["RSCP"], range, level + ecNo)
            addNumber(row, list.rows["Energy Per Chip"], range, ecNo)
            index = index + 1
        end
    end
end
for _, name in ipairs({"Monitored Set", "Detected Set", "Virtual Active Set"}) do
    shapes[name .. " 417A"] = function(_, _, record)
        local count = byte(record.bytes, 16)
        missingEntries(record, completeCount(record, 16, 15, 15, count), count)
    end
end
