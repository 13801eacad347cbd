-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Property lists ---------------------------------------------------------------------------------------------

local maximumDepth = 64
local maximumValues = 10000
local binaryMarker = "bplist00"
local trailerSize = 32

-- What goes wrong with a list's bytes is raised as such a table; whatever else is raised is a mistake here.
local function refuse(reason)
    error({reason = reason}, 0)
end

-- A reader of a binary property list; `bytes` is its TvbRange.
local function binaryList(bytes)
    local size = bytes:len()
    if size < #binaryMarker + trailerSize then
        refuse(string.format("%d bytes, wanted at least %d", size, #binaryMarker + trailerSize))
    end
    local raw = bytes:raw()
    local list = {bytes = bytes, size = size, values = 0, keys = {}}

    -- The big-endian number of up to eight bytes there.
    function list.number(offset, width)
        if offset + width > list.size then
            refuse(string.format("a number of %d bytes at %d passes the end", width, offset))
        end
        if width == 1 then
            return byte(raw, offset + 1)
        elseif width == 2 then
            local high, low = byte(raw, offset + 1, offset + 2)
            return high * 256 + low
        end
        local value = 0
        for i = 1, width do
            value = value * 256 + byte(raw, offset + i)
        end
        return value
    end

    local trailer = size - trailerSize
    list.offsetSize = list.number(trailer + 6, 1)
    list.referenceSize = list.number(trailer + 7, 1)
    list.count = list.number(trailer + 8, 8)
    list.top = list.number(trailer + 16, 8)
    list.table = list.number(trailer + 24, 8)
    local sizesAreGood = list.offsetSize >= 1 and list.offsetSize <= 8 and list.referenceSize >= 1 and
                             list.referenceSize <= 8
    if not sizesAreGood or list.count > size or list.table + list.count * list.offsetSize > trailer then
        refuse("its offset table is not inside it")
    end

    -- Where the object of that number begins.
    function list.object(reference)
        if reference >= list.count then
            refuse(string.format("object %.0f of %.0f", reference, list.count))
        end
        local offset = list.number(list.table + reference * list.offsetSize, list.offsetSize)
        if offset < #binaryMarker or offset >= list.table then
            refuse(string.format("object %.0f at %.0f is not inside it", reference, offset))
        end
        return offset
    end

    -- The window on `length` bytes of an object's content.
    function list.window(offset, length)
        if offset + length > list.table then
            refuse(string.format("%.0f bytes at %.0f pass the objects' end", length, offset))
        end
        return bytes(offset, length)
    end

    -- The object's kind, the count that its first byte gives, and where its content begins.
    function list.head(offset)
        local marker = list.number(offset, 1)
        local kind = math.floor(marker / 16)
        local count = marker % 16
        local content = offset + 1
        if count == 15 and kind >= 4 then
            local marked = list.number(content, 1)
            if math.floor(marked / 16) ~= 1 or marked % 16 > 3 then
                refuse(string.format("no count at %d", content))
            end
            local width = 2 ^ (marked % 16)
            count = list.number(content + 1, width)
            content = content + 1 + width
        end
        return kind, count, content
    end

    return list
end

local function utf8Of(character)
    if character < 0x80 then
        return string.char(character)
    elseif character < 0x800 then
        return string.char(0xC0 + math.floor(character / 64), 0x80 + character % 64)
    elseif character >= 0xD800 and character <= 0xDFFF then
        return replacement
    elseif character < 0x10000 then
        return string.char(0xE0 + math.floor(character / 4096), 0x80 + math.floor(character / 64) % 64,
                           0x80 + character % 64)
    end
    return string.char(0xF0 + math.floor(character / 262144), 0x80 + math.floor(character / 4096) % 64,
                       0x80 + math.floor(character / 64) % 64, 0x80 + character % 64)
end

-- The text of an ASCII or a UTF-16 string. Wireshark's own conversion gives as many bytes as the range has, which
-- is too few or too many where the text has another length.
-- What is no character is replaced, and is the list's `flaw`: the decoder refuses all of it.
local function textOfASCII(range, list)
    local text = range:raw()
    if not text:find("[\x80-\xFF]") then
        return text
    end
    list.flaw = list.flaw or "an ASCII string has other bytes"
    return (text:gsub("[\x80-\xFF]", replacement))
end

local function textOfUTF16(range, list)
    local bytes = range:raw()
    local out = {}
    local at = 1
    local function unit()
        local high, low = bytes:byte(at, at + 1)
        return high * 256 + low
    end
    while at < #bytes do
        local character = unit()
        at = at + 2
        if character >= 0xD800 and character <= 0xDBFF and at < #bytes then
            local low = unit()
            if low >= 0xDC00 and low <= 0xDFFF then
                character = 0x10000 + (character - 0xD800) * 1024 + low - 0xDC00
                at = at + 2
            end
        end
        if character >= 0xD800 and character <= 0xDFFF then
            list.flaw = list.flaw or "a UTF-16 string has half a surrogate pair"
        end
        out[#out + 1] = utf8Of(character)
    end
    return table.concat(out)
end

-- The fewest digits that read back as the number: -78.6, not -78.599999999999994.
local function realText(number)
    for digits = 15, 16 do
        local text = string.format("%." .. digits .. "g", number)
        if tonumber(text) == number then
            return text
        end
    end
    return string.format("%.17g", number)
end

-- How a value that is no array and no dictionary is shown, the bytes that it comes from, its kind, and what it is.
local function scalarText(list, kind, count, content, offset)
    if kind == 0 and (count == 8 or count == 9) then
        return count == 9 and "true" or "false", list.window(offset, 1), "flag", count == 9
    elseif kind == 1 and count <= 3 then
        local range = list.window(content, 2 ^ count)
        if count == 3 then
            local number = range:int64()
            return tostring(number), range, "integer", number:tonumber()
        end
        local number = list.number(content, 2 ^ count)
        return string.format("%d", number), range, "integer", number
    elseif kind == 2 and (count == 2 or count == 3) then
        local range = list.window(content, 2 ^ count)
        local number = range:float()
        return realText(number), range, "real", number
    elseif kind == 3 and count == 3 then
        local range = list.window(content, 8)
        return string.format("%.3f s since 2001-01-01", range:float()), range, "date", range:float()
    elseif kind == 4 then
        local range = list.window(content, count)
        local text = range:len() > 0 and range:bytes():tohex(true) or ""
        return text, range, "data", text
    elseif kind == 5 then
        local range = list.window(content, count)
        local text = count > 0 and textOfASCII(range, list) or ""
        return text, range, "text", text
    elseif kind == 6 then
        local range = list.window(content, count * 2)
        local text = count > 0 and textOfUTF16(range, list) or ""
        return text, range, "text", text
    end
    refuse(string.format("object of unknown kind 0x%x%x at %d", kind, count, offset))
end

-- The text and range of the key there.
local function keyOf(list, at)
    local kind, count, content = list.head(at)
    if kind ~= 5 and kind ~= 6 then
        refuse(string.format("a key at %d is no text", at))
    end
    local text, range = scalarText(list, kind, count, content, at)
    return {text, range}
end

-- Puts the object of that number into the tree, under its key where it has one, and returns it: its kind, range, and
-- value, which is a table of an array or a dictionary. A list whose values refer to each other in a circle ends at
-- the deepest level.
local function addObject(list, tree, reference, key, depth)
    if depth > maximumDepth then
        refuse(string.format("nested deeper than %d levels", maximumDepth))
    end
    list.values = list.values + 1
    if list.values > maximumValues then
        refuse(string.format("more than %d values", maximumValues))
    end
    local offset = list.object(reference)
    local kind, count, content = list.head(offset)
    local label = key and shown(key) .. ": " or ""
    if kind ~= 0xA and kind ~= 0xD then
        local text, range, form, value = scalarText(list, kind, count, content, offset)
        tree:add(fields.value, range, text):set_text(label .. shown(text))
        return {kind = form, range = range, value = value}
    end
    local width = list.referenceSize
    local isDictionary = kind == 0xD
    local range = list.window(content, count * width * (isDictionary and 2 or 1))
    local noun = isDictionary and (count == 1 and "entry" or "entries") or (count == 1 and "element" or "elements")
    local branch = tree:add(velmora, range, string.format("%s%d %s", label, count, noun))
    local values, order = {}, {}
    local first = content + (isDictionary and count * width or 0)
    for i = 0, count - 1 do
        local name = i + 1
        if isDictionary then
            local reference = list.number(content + i * width, width)
            local known = list.keys[reference]
            if not known then
                known = keyOf(list, list.object(reference))
                list.keys[reference] = known
            end
            name = known[1]
            branch:add(fields.key, known[2], name):set_hidden(true)
        end
        order[i + 1] = name
        values[name] = addObject(list, branch, list.number(first + i * width, width), isDictionary and name,
                                 depth + 1)
    end
    return {kind = isDictionary and "dictionary" or "array", range = range, value = values, order = order}
end

local function isBinaryList(range)
    return range:len() >= #binaryMarker and range(0, #binaryMarker):string() == binaryMarker
end

-- Whether the bytes are an XML document, as far as their beginning tells.
local function isXML(range)
    return range:len() >= 5 and range(0, 5):string() == "<?xml"
end
