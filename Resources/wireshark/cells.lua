-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Cells of a live modem --------------------------------------------------------------------------------------

local radios = {
    kVoxCellMonitorRadioAccessTechnologyGSM = 1,
    kVoxCellMonitorRadioAccessTechnologyUMTS = 2,
    kVoxCellMonitorRadioAccessTechnologyUTRAN = 3, -- TD-SCDMA
    kVoxCellMonitorRadioAccessTechnologyLTE = 4,
    kVoxCellMonitorRadioAccessTechnologyNR = 5,
    kVoxCellMonitorRadioAccessTechnologyCDMA = 6,
}
local GSM, UMTS, TDSCDMA, LTE, NR, CDMA2000 = 1, 2, 3, 4, 5, 6

-- The rows of a cell by label, which has ranges of the level, too.
local cellRows = {}
for _, row in ipairs(modem.rows) do
    cellRows[row.l] = row
end

local levelRows = {[GSM] = "RXLEV", [UMTS] = "RSCP", [TDSCDMA] = "RSCP", [LTE] = "RSRP", [NR] = "RSRP"}
local channelRows = {[GSM] = "ARFCN", [UMTS] = "UARFCN", [TDSCDMA] = "UARFCN", [LTE] = "EARFCN", [NR] = "NR-ARFCN"}
local noLevel = -1000 -- dBm

-- The number of a cell's row, within the row's range.
local function numberOfRow(cell, label, check)
    local row = cellRows[label]
    return row and (check or numberIn)(cell.node.value[row.key], row.least, row.most)
end

-- The serving cells and the neighbours of a message, the latter by falling level, and how many entries it has.
local function cellsOf(message)
    local serving, neighbors = {}, {}
    local all = arrayIn(message.value.kVoxCellMonitorCells)
    for _, each in ipairs(all) do
        local node = dictionaryIn(each)
        local radio = radios[textAt(node, "kVoxCellMonitorCellRadioAccessTechnology")]
        local kind = radio and textAt(node, "kVoxCellMonitorCellType")
        local place = node.value.kVoxCellMonitorIsPlace
        local cell = {node = node, radio = radio, isPlace = place and place.kind == "flag" and place.value or false}
        if kind == "kVoxCellMonitorCellTypeServing" then
            serving[#serving + 1] = cell
        elseif kind == "kVoxCellMonitorCellTypeNeighbor" then
            neighbors[#neighbors + 1] = cell
            cell.order = #neighbors
            cell.level = not cell.isPlace and numberOfRow(cell, levelRows[radio]) or noLevel
        end
    end
    table.sort(neighbors, function(a, b)
        if a.level ~= b.level then
            return a.level > b.level
        end
        return a.order < b.order
    end)
    return serving, neighbors, #all
end

-- The run of channels that the cell's own is in; none where it has no meaning. One is {first, last, bands,
-- overlapping bands, downlink, its step, uplink, its step}.
local function carrierOf(cell)
    local label = channelRows[cell.radio]
    local channel = label and numberOfRow(cell, label, wholeIn)
    local runs = channel and modem.carriers[cell.radio] or {}
    local low, high = 1, #runs
    while low <= high do
        local middle = floor((low + high) / 2)
        if channel < runs[middle][1] then
            high = middle - 1
        elseif channel > runs[middle][2] then
            low = middle + 1
        else
            return runs[middle], channel - runs[middle][1], cell.node.value[cellRows[label].key]
        end
    end
    return nil
end

local function bandsIn(column)
    return function(cell)
        local run, _, source = carrierOf(cell)
        if run and run[column] ~= "" then
            return run[column], source
        end
    end
end

-- In MHz: that of the channel, or of the message where no channel tells it.
local function frequencyIn(column)
    return function(cell, node)
        local run, distance, source = carrierOf(cell)
        if run and run[column] then
            return (run[column] + run[column + 1] * distance) / 1000, source
        end
        local kilohertz = numberIn(node, 1, 100000000)
        return kilohertz and kilohertz / 1000
    end
end

local identityLimits = {[GSM] = 0xFFFF, [CDMA2000] = 0xFFFF, [NR] = 0xFFFFFFFFF}

local function identityOf(cell, node)
    local identity = wholeIn(node, 0, identityLimits[cell.radio] or 0xFFFFFFF)
    -- Modems report an unknown one in 32 bits, even where more are possible.
    return identity ~= 0x7FFFFFFF and identity ~= 0xFFFFFFFF and identity or nil
end

-- The bits of the identity from `shift` on.
local function partOf(shift, width)
    return function(cell, node)
        local identity = identityOf(cell, node)
        return identity and floor(identity / 2 ^ shift) % 2 ^ width
    end
end

-- The same of one that has an RNC: some modems report 16 bits instead.
local function partWithRNC(shift, width)
    local part = partOf(shift, width)
    return function(cell, node)
        return (identityOf(cell, node) or 0) > 0xFFFF and part(cell, node) or nil
    end
end

local function countryCode(cell)
    local node = cell.node.value.kVoxCellMonitorMCC
    local number = wholeIn(node, 1, 999)
    return number and string.format("%03d", number), node
end

local function networkCode(cell)
    local node = cell.node.value.kVoxCellMonitorMNC
    local number = wholeIn(node, 0, 999)
    local digits = wholeIn(cell.node.value.kVoxCellMonitorMNCDigits, 2, 3) or 2
    return number and string.format("%0" .. floor(digits) .. "d", number), node
end

local advanceLimits = {[GSM] = 63, [LTE] = 1282, [NR] = 3846}

local function timingAdvance(cell, node)
    return wholeIn(node, 0, advanceLimits[cell.radio])
end

local speedOfLight = 299792458 -- m/s
-- There and back: a bit's period of 3GPP TS 45.010 5.1, and 16 time units of TS 36.211 4.
local metres = {[GSM] = speedOfLight / 2 * (48 / 13 * 1e-6), [LTE] = speedOfLight / 2 * 16 / (15000 * 2048)}

-- What is computed of a cell, by label: the value, and the node that it comes from if that is not under the row's key.
local computedRows = {
    ["Radio Technology"] = function(cell)
        return cell.radio, cell.node.value.kVoxCellMonitorCellRadioAccessTechnology
    end,
    ["Known by Identity Alone"] = function(cell) return cell.isPlace or nil end,
    ["PLMN"] = function(cell)
        local country, source = countryCode(cell)
        local network = networkCode(cell)
        return country and network and country .. "-" .. network, source
    end,
    ["MCC"] = countryCode,
    ["MNC"] = networkCode,
    ["Cell Identity"] = identityOf,
    ["RNC ID"] = partWithRNC(16, 12),
    ["Cell of RNC"] = partWithRNC(0, 16),
    ["eNB ID"] = partOf(8, 20),
    ["Sector"] = partOf(0, 8),
    ["gNB ID (if of 24 bits)"] = partOf(12, 24),
    ["Sector (if of 12 bits)"] = partOf(0, 12),
    ["TAC"] = function(cell, node)
        local area = wholeIn(node, 1, cell.radio == NR and 0xFFFFFD or 0xFFFD)
        return area ~= 0xFFFE and area ~= 0xFFFF and area or nil
    end,
    ["PCI"] = function(cell, node) return wholeIn(node, 0, cell.radio == NR and 1007 or 503) end,
    ["NCC-BCC"] = function(_, node)
        local code = wholeIn(node, 0, 63)
        return code and string.format("%d-%d", floor(code / 8), code % 8)
    end,
    ["Bands"] = bandsIn(3),
    ["Overlapping Bands"] = bandsIn(4),
    ["Downlink"] = frequencyIn(5),
    ["Uplink"] = frequencyIn(7),
    ["Bandwidth"] = function(_, node)
        local kilohertz = numberIn(node, 1, 2000000)
        return kilohertz and kilohertz / 1000
    end,
    ["Timing Advance"] = timingAdvance,
    ["Distance"] = function(cell, node)
        local steps = timingAdvance(cell, node)
        return steps and steps * metres[cell.radio]
    end,
}

local function addModemCell(tree, rows, cell)
    for _, row in ipairs(modem.rows) do
        if extract(row.radios, cell.radio) == 1 and (row.place or not cell.isPlace) then
            local shown, node = rows[row.l], cell.node.value[row.key or ""]
            local compute, value, source = computedRows[row.l], nil, nil
            if compute then
                value, source = compute(cell, node)
            else
                value = (shown.type == "d" and numberIn or wholeIn)(node, row.least, row.most)
            end
            if value then
                addValue(tree, shown, rangeOf(source or node or cell.node), value)
            end
        end
    end
end

local function cellTrouble(message)
    local report = statusIn(message, "kVoxModemCellReport")
    return report ~= 0 and statusText(modem.cellReports, report) or nil
end

modemStates["Serving Cell"] = function(message)
    local state = workingState(message)
    return cellTrouble(message) or (#cellsOf(message) == 0 and state .. ", no serving cell" or state)
end
modemStates["Secondary Cell"] = function(message)
    return cellTrouble(message) or (#cellsOf(message) < 2 and "None" or workingState(message))
end
modemStates["Neighbor Cells"] = function(message)
    local report = statusIn(message, "kVoxModemNeighborReport")
    if cellTrouble(message) or report ~= 0 then
        return cellTrouble(message) or statusText(modem.neighborReports, report)
    end
    local _, neighbors = cellsOf(message)
    return #neighbors == 0 and "None" or string.format(#neighbors == 1 and "%d cell" or "%d cells", #neighbors)
end

modemContents["Serving Cell"] = function(tree, view, record, message)
    local serving, neighbors, count = cellsOf(message)
    missingEntries(record, math.min(#serving, 2) + #neighbors, count) -- 5G non-standalone has two
    if serving[1] then
        addModemCell(tree, view.rows, serving[1])
    end
end
modemContents["Secondary Cell"] = function(tree, view, _, message)
    local serving = cellsOf(message)
    if serving[2] then
        addModemCell(tree, view.rows, serving[2])
    end
end
modemContents["Neighbor Cells"] = function(tree, view, _, message)
    local _, neighbors = cellsOf(message)
    local list = view.lists["Cells"]
    for index, cell in ipairs(neighbors) do
        addModemCell(addEntry(tree, list, rangeOf(cell.node), index - 1), list.rows, cell)
    end
end
