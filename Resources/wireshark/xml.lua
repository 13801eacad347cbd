-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Property lists in XML, whose text Wireshark's own dissector shows.

local entities = {lt = "<", gt = ">", amp = "&", quot = '"', apos = "'"}

local function unescaped(text)
    if not text:find("&", 1, true) then
        return text
    end
    return (text:gsub("&(#?x?)(%w+);", function(kind, name)
        local number = kind == "#" and tonumber(name) or kind == "#x" and tonumber(name, 16)
        if number then
            return number < 0x110000 and utf8Of(number) or replacement
        end
        return kind == "" and entities[name] or nil
    end))
end

-- Numbers that are not finite.
local specialReals = {}
for name, number in pairs({nan = 0 / 0, inf = math.huge, infinity = math.huge}) do
    specialReals[name], specialReals["+" .. name], specialReals["-" .. name] = number, number, -number
end

-- What each element that is no array and no dictionary holds.
local xmlScalars = {
    string = function(text) return "text", unescaped(text) end,
    integer = function(text) return "integer", tonumber(text) or refuse("no integer") end,
    real = function(text) return "real", tonumber(text) or specialReals[text:lower()] or refuse("no real number") end,
    date = function(text) return "date", text end,
    data = function(text) return "data", text end,
    ["true"] = function() return "flag", true end,
    ["false"] = function() return "flag", false end,
}

local slash = byte("/")
local closings = {key = "/key>"}
for name in pairs(xmlScalars) do
    closings[name] = "/" .. name .. ">"
end

-- A reader of the elements of an XML list; `range` is its TvbRange.
local function xmlReader(range)
    local text = range:raw()
    local reader = {at = 1, values = 0}

    -- The next tag: its name, "/" of a closing one, "/" of an empty one, and where it begins.
    function reader.tag()
        while true do
            local first, last, closing, name, rest = text:find("^%s*<(/?)(%a*)([^>]*)>", reader.at)
            if not first then
                refuse(string.format("no element at %d", reader.at - 1))
            end
            if name ~= "" then
                reader.at = last + 1
                return name, closing == "/", byte(text, last - 1) == slash, first
            end
            if rest:find("^!%-%-") and not rest:find("%-%-$") then
                last = select(2, text:find("-->", first, true)) or refuse("a comment without an end")
            end
            reader.at = last + 1
        end
    end
    -- The text up to the closing tag of that name.
    function reader.content(name)
        local last = text:find("<", reader.at, true)
        if not last or text:sub(last + 1, last + #name + 2) ~= closings[name] then
            refuse(string.format("no text at %d", reader.at - 1))
        end
        local content, first = text:sub(reader.at, last - 1), reader.at
        reader.at = last + #name + 3
        return content, first
    end
    -- The node of the text from `first` to before `last`. Few are looked at, so that its range is made then.
    function reader.node(kind, value, first, last)
        return {kind = kind, value = value, whole = range, first = first - 1, length = last - first}
    end
    return reader
end

-- The element whose tag has been read.
local function xmlValue(reader, name, isEmpty, first, depth)
    reader.values = reader.values + 1
    if depth > maximumDepth or reader.values > maximumValues then
        refuse("too deep or too many values")
    end
    if xmlScalars[name] then
        local content, at = "", first
        if not isEmpty then
            content, at = reader.content(name)
        end
        local kind, value = xmlScalars[name](content)
        return reader.node(kind, value, at, isEmpty and reader.at or at + #content)
    elseif name ~= "dict" and name ~= "array" then
        refuse("an element " .. name)
    end
    local values, order = {}, {}
    while not isEmpty do
        local tag, isClosing, isEmptyTag, at = reader.tag()
        if isClosing then
            if tag ~= name then
                refuse(string.format("%s ends with %s", name, tag))
            end
            break
        end
        local key = #order + 1
        if name == "dict" then
            if tag ~= "key" then
                refuse("a value without a key")
            end
            key = isEmptyTag and "" or unescaped((reader.content("key")))
            tag, isClosing, isEmptyTag, at = reader.tag()
            if isClosing then
                refuse("a key without a value")
            end
        end
        order[#order + 1] = key
        values[key] = xmlValue(reader, tag, isEmptyTag, at, depth + 1)
    end
    local node = reader.node(name == "dict" and "dictionary" or "array", values, first, reader.at)
    node.order = order
    return node
end

-- The list's value.
local function xmlList(range)
    local reader = xmlReader(range)
    local name, isClosing, isEmpty, first = reader.tag()
    while name ~= "plist" do -- the declaration and the document type have no such name
        refuse("no property list but " .. name)
    end
    name, isClosing, isEmpty, first = reader.tag()
    if isClosing then
        refuse("a list without a value")
    end
    return xmlValue(reader, name, isEmpty, first, 1)
end
