-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Texts ------------------------------------------------------------------------------------------------------
--
-- What a message says may not control a terminal, nor turn the order of what is shown around it. It is escaped as
-- velmora-log escapes it; filters compare the text itself.

-- The first and the last character of each run, in ascending order: those that are only shown escaped, and the
-- marks, which combine with the character before them. The build generates this table from Unicode's categories.
local characters = {
@CHARACTERS@
}
local maximumMarks = 8

local function isIn(ranges, character)
    local low, high = 1, #ranges / 2
    while low <= high do
        local middle = math.floor((low + high) / 2)
        if character < ranges[2 * middle - 1] then
            high = middle - 1
        elseif character > ranges[2 * middle] then
            low = middle + 1
        else
            return true
        end
    end
    return false
end

-- The character of UTF-8 that begins there, and its length; none where the bytes are no character.
local function characterAt(text, at)
    local lead = text:byte(at)
    if lead < 0x80 then
        return lead, 1
    end
    local length = lead >= 0xC2 and (lead < 0xE0 and 2 or lead < 0xF0 and 3 or lead < 0xF5 and 4) or nil
    if not length or at + length - 1 > #text then
        return nil
    end
    local character = lead % 2 ^ (7 - length)
    for i = 1, length - 1 do
        local byte = text:byte(at + i)
        if byte < 0x80 or byte > 0xBF then
            return nil
        end
        character = character * 64 + byte % 64
    end
    return character, length
end

local replacement = "\xEF\xBF\xBD" -- U+FFFD
local shortEscapes = {["\n"] = "\\n", ["\t"] = "\\t", ["\r"] = "\\r"}

-- The text as it is shown.
local function shown(text)
    if not text:find("[^ -~]") then
        return text
    end
    local out = {}
    local at, marks = 1, maximumMarks
    while at <= #text do
        local character, length = characterAt(text, at)
        local isMark = character and isIn(characters.marks, character)
        if not character then
            out[#out + 1], length = replacement, 1
        elseif character < 0x20 or isIn(characters.escaped, character) or (isMark and marks == maximumMarks) then
            out[#out + 1] = shortEscapes[text:sub(at, at)] or
                                string.format(character < 0x80 and "\\x%02X" or "\\u{%X}", character)
        else
            out[#out + 1] = text:sub(at, at + length - 1)
        end
        local isShown = character and out[#out] == text:sub(at, at + length - 1)
        marks = not isShown and maximumMarks or isMark and marks + 1 or 0
        at = at + length
    end
    return table.concat(out)
end
