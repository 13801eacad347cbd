-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Live modems ------------------------------------------------------------------------------------------------
--
-- What the sections of a live modem show of its messages, each of which is a dictionary.

-- The texts of states, by number, and of masks, by key and bit; the rows of a cell, and which radio technologies, a
-- bit each, have them; the bands and frequencies of channel numbers. The build asks the decoder for all of it.
local modem = {
@MODEM@
}

local noneOf = {kind = "dictionary", value = {}}
local largestExact = 2 ^ 53
local largestNumber = 0x7FFFFFFE

-- The number there, checked; nil for none.
local function numberIn(node, least, most)
    local number = node and (node.kind == "integer" or node.kind == "real") and node.value
    if not number or number ~= number or number < (least or -math.huge) or number > (most or math.huge) or
        math.abs(number) == math.huge then
        return nil
    end
    return number
end

local function wholeIn(node, least, most)
    local number = numberIn(node, least, most)
    return number and number == floor(number) and math.abs(number) <= largestExact and number or nil
end

local function dictionaryIn(node)
    return node and node.kind == "dictionary" and node or noneOf
end

local function arrayIn(node)
    return node and node.kind == "array" and node.value or {}
end

-- The bytes of base64, as hexadecimal digits.
local function digitsOfBase64(text)
    local alphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/"
    local digits, bits, width = {}, 0, 0
    for character in text:gmatch("[%w+/]") do
        bits, width = bits * 64 + alphabet:find(character, 1, true) - 1, width + 6
        if width >= 8 then
            width = width - 8
            digits[#digits + 1] = string.format("%02X", floor(bits / 2 ^ width))
            bits = bits % 2 ^ width
        end
    end
    return table.concat(digits)
end

local cocoaEpoch = 978307200 -- 2001-01-01 in seconds since 1970

-- The text of a value that is one, of several, of a date, or of bytes; nil for another or an empty one.
local function typedText(node)
    local text
    if not node then
        return nil
    elseif node.kind == "text" then
        text = node.value
    elseif node.kind == "array" then
        local texts = {}
        for _, each in ipairs(node.value) do
            if each.kind == "text" and each.value ~= "" then
                texts[#texts + 1] = each.value
            end
        end
        text = table.concat(texts, ", ")
    elseif node.kind == "date" then
        text = type(node.value) == "number" and os.date("!%Y-%m-%d %H:%M:%S", cocoaEpoch + floor(node.value)) or
                   node.value:gsub("T", " "):gsub("Z$", "")
    elseif node.kind == "data" then
        text = node.whole and digitsOfBase64(node.value) or node.value:upper()
    end
    return text ~= "" and text or nil
end

-- The names of a mask's bits, the lowest first, and those without a name in hexadecimal.
local function maskText(node, names)
    local mask = wholeIn(node, 1, 0xFFFFFFFF)
    if not mask or mask == 0xFFFFFFFF then
        return mask and "any"
    end
    local texts, rest = {}, mask
    for bit = 0, 31 do
        if names[bit] and extract(mask, bit) == 1 then
            texts[#texts + 1] = names[bit]
            rest = rest - 2 ^ bit
        end
    end
    if rest ~= 0 then
        texts[#texts + 1] = string.format("0x%X", rest)
    end
    return table.concat(texts, ", ")
end

local function networkText(node)
    local text = node and node.kind == "text" and node.value or ""
    return text:find("^%d%d%d%d%d%d?$") and text:sub(1, 3) .. "-" .. text:sub(4) or nil
end

-- What makes the text of a value that is none by itself, or of another form.
local textForms = {
    kVoxRegistrationPLMN = networkText,
    kVoxSIMOperatorCode = networkText,
    kVoxPositionTime = function(node)
        local text = typedText(node)
        local hours, minutes, seconds = (text or ""):match("^(%d%d)(%d%d)(%d%d)")
        if hours and (#text == 6 or text:sub(7, 7) == ".") then
            return hours .. ":" .. minutes .. ":" .. seconds .. text:sub(7)
        end
        return text
    end,
}
for _, key in ipairs({"kVoxLinkAccessTechnologies", "kVoxModemCapabilities", "kVoxContextIPFamily"}) do
    textForms[key] = function(node) return maskText(node, modem[key]) end
end

-- Adds the value under the row's key, where it is one of the row's type and range.
local function addTyped(tree, row, dictionary)
    local node = dictionary.value[row.key]
    if not node then
        return
    elseif row.type == "d" then
        local number = numberIn(node, row.least, row.most)
        if number then
            addValue(tree, row, rangeOf(node), number / (row.divisor or 1))
        end
    elseif row.type == "f" then
        if node.kind == "flag" then
            addValue(tree, row, rangeOf(node), node.value)
        end
    elseif row.type == "s" then
        local text = (textForms[row.key] or typedText)(node)
        if text then
            addValue(tree, row, rangeOf(node), text)
        end
    else
        local number = wholeIn(node, row.least, row.most)
        if number then
            addValue(tree, row, rangeOf(node), number)
        end
    end
end

-- The dictionaries in a message or row, by the first word of the labels of what they hold.
local innerDictionaries = {
    [0xFF0004] = {
        NR = "kVoxLinkNR", LTE = "kVoxLinkLTE", UMTS = "kVoxLinkUMTS", GSM = "kVoxLinkGSM", CDMA = "kVoxLinkCDMA",
        ["EV-DO"] = "kVoxLinkEVDO",
    },
    [0xFF0002] = {IPv4 = "kVoxContextIPv4", IPv6 = "kVoxContextIPv6"},
}

local function addTypedGroups(tree, groups, dictionary, code)
    local inner = innerDictionaries[code] or {}
    for _, group in ipairs(groups) do
        for _, row in ipairs(group) do
            if row.key then
                local key = inner[row.l:match("^%S+")]
                addTyped(tree, row, key and dictionaryIn(dictionary.value[key]) or dictionary)
            end
        end
    end
end

local function statusText(texts, number)
    return texts[number] or string.format(texts.other, number)
end

-- The number of a state in the message, 0 where there is none.
local function statusIn(message, key, least)
    return wholeIn(message.value[key], least or 1, largestNumber) or 0
end

-- Why there is nothing to report of a modem; nil of one that works.
local function troubleOf(message)
    local presence = statusIn(message, "kVoxModemPresence")
    if presence ~= 0 then
        return statusText(modem.presences, presence)
    elseif statusIn(message, "kVoxModemState", -1) == -1 then
        return statusText(modem.failures, statusIn(message, "kVoxModemFailedReason"))
    end
    local lock = wholeIn(message.value.kVoxModemLock, 2, largestNumber)
    return lock and statusText(modem.locks, lock)
end

local function workingState(message)
    return statusText(modem.states, statusIn(message, "kVoxModemState", -1))
end

-- The state that a section says where the array has nothing.
local function stateUnlessEmpty(key, text)
    return function(message) return #arrayIn(message.value[key]) == 0 and text or workingState(message) end
end

-- What sections show as the state of a modem that works, by section.
local modemStates = {
    ["Packet Data Contexts"] = stateUnlessEmpty("kVoxContexts", "None"),
    ["Traffic"] = stateUnlessEmpty("kVoxTraffic", "None"),
    ["SIM Slots"] = stateUnlessEmpty("kVoxSIMSlots", "One slot"),
    ["Position"] = function(message)
        return numberIn(message.value.kVoxPositionLatitude, -90, 90) and
                   numberIn(message.value.kVoxPositionLongitude, -180, 180) and workingState(message) or "No position"
    end,
}

-- Whether a modem roams, by its registration; nil of one that is not registered.
local roaming = {[1] = false, [5] = true, [6] = false, [7] = true, [9] = false, [10] = true}

-- What sections show of a message beside its state and its rows.
local modemContents = {
    Registration = function(tree, view, _, message)
        local node = message.value.kVoxRegistrationState
        local state = wholeIn(node, 0, largestNumber)
        if state then
            addValue(tree, view.rows["Registration State"], rangeOf(node), state)
        end
        if state and roaming[state] ~= nil then
            addValue(tree, view.rows.Roaming, rangeOf(node), roaming[state])
        end
    end,
}

-- The array of the rows of a section's list, by the list's label.
local modemLists = {
    Contexts = "kVoxContexts",
    Bearers = "kVoxTraffic",
    Slots = "kVoxSIMSlots",
    ["Preferred Networks"] = "kVoxSIMPreferredNetworks",
}

-- Adds what a section shows of a message; `list`: its property list, nil where it cannot be read.
local function addModemView(tree, view, record, list)
    local isRead = list and list.kind == "dictionary"
    local message = dictionaryIn(list)
    local range = list and rangeOf(list) or record.range
    local state = "Unreadable message"
    if isRead then
        state = troubleOf(message) or (modemStates[view.section] or workingState)(message)
    end
    addValue(tree, view.rows.State, range, state)
    local reason = message.value.kVoxModemReason
    if typedText(reason) then
        addValue(tree, view.rows.Reason, rangeOf(reason), typedText(reason))
    end
    if statusIn(message, "kVoxModemPresence") ~= 0 then
        message = noneOf
    end
    addTypedGroups(tree, view.groups, message, record.code)
    for label, rows in pairs(view.lists) do
        for index, each in ipairs(arrayIn(message.value[modemLists[label]])) do
            local row = addEntry(tree, rows, rangeOf(each), index - 1)
            addTypedGroups(row, rows.groups, dictionaryIn(each), record.code)
        end
    end
    local contents = modemContents[view.section]
    if contents then
        contents(tree, view, record, message)
    end
end
