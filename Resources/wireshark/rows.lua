-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Values -----------------------------------------------------------------------------------------------------
--
-- What the decoders' tables say of records: which fields there are, where each value lies, and what makes it
-- physical. The build generates the tables from the decoders, so that a value here is that of velmora-log.

-- The texts of enumerations, by number.
local enumerations = {
@TEXTS@
}

-- Name, label, type, and the unit, the number of an enumeration's texts, or a flag's texts.
local valueTables = {
@FIELDS@
}

local makers = {
    i = function(name, label, unit)
        return unit and ProtoField.int32(name, label, base.DEC + base.UNIT_STRING, {unit}) or
                   ProtoField.int32(name, label, base.DEC)
    end,
    u = function(name, label, unit)
        return unit and ProtoField.uint32(name, label, base.DEC + base.UNIT_STRING, {unit}) or
                   ProtoField.uint32(name, label, base.DEC)
    end,
    x = function(name, label) return ProtoField.uint32(name, label, base.HEX) end,
    d = function(name, label, unit)
        -- Wireshark shows the unit of whole numbers alone.
        return ProtoField.double(name, unit and label .. " (" .. unit:match("%S.*") .. ")" or label)
    end,
    e = function(name, label, number)
        local texts = enumerations[number]
        local make = texts[-1] and ProtoField.int32 or ProtoField.uint32
        return make(name, label, base.DEC, next(texts) and texts or nil)
    end,
    f = function(name, label, set, clear)
        return ProtoField.bool(name, label, base.NONE, {set, clear})
    end,
    s = function(name, label) return ProtoField.string(name, label) end,
    b = function(name, label) return ProtoField.bytes(name, label) end,
    r = function(name, label) return ProtoField.uint32(name, label, base.DEC) end,
}

local valueFields = {}
for number, row in ipairs(valueTables) do
    valueFields[number] = makers[row[3]](row[1], row[2], row[4], row[5])
end

local byte = string.byte
local floor = math.floor
local extract = bit32.extract

-- The little-endian number of up to four bytes from `at` on, which counts from 1.
local function littleEndian(bytes, at, size)
    local a, b, c, d = byte(bytes, at, at + size - 1)
    if size == 4 then
        return a + b * 0x100 + c * 0x10000 + d * 0x1000000
    elseif size == 2 then
        return a + b * 0x100
    end
    return a + (b or 0) * 0x100 + (c or 0) * 0x10000
end

local function signed(number, width)
    return number >= 2 ^ (width - 1) and number - 2 ^ width or number
end

-- The bits of a record's bytes, as LogMessages/Record.h counts them.
local function bitsOf(bytes, offset, bit, width)
    return extract(littleEndian(bytes, offset + 1, floor((bit + width + 7) / 8)), bit, width)
end

-- What reads a row's raw number from a record's bytes, at an offset that counts from 0.
local function readerOf(row)
    local at, width, bit = row.o + 1, row.w, row.b or 0
    local size = floor((bit + width + 7) / 8)
    local read
    if row.big then
        read = function(bytes, base)
            local high, low = byte(bytes, base + at, base + at + 1)
            return high * 0x100 + low
        end
    elseif bit == 0 and width == 8 then
        read = function(bytes, base) return (byte(bytes, base + at)) end
    elseif bit == 0 and width == 16 then
        read = function(bytes, base)
            local low, high = byte(bytes, base + at, base + at + 1)
            return low + high * 0x100
        end
    elseif bit == 0 and width % 8 == 0 then
        read = function(bytes, base) return littleEndian(bytes, base + at, size) end
    elseif size == 1 then
        read = function(bytes, base) return extract(byte(bytes, base + at), bit, width) end
    elseif size == 2 then
        read = function(bytes, base)
            local low, high = byte(bytes, base + at, base + at + 1)
            return extract(low + high * 0x100, bit, width)
        end
    else
        read = function(bytes, base) return extract(littleEndian(bytes, base + at, size), bit, width) end
    end
    if row.s then
        return function(bytes, base) return signed(read(bytes, base), width) end, size
    end
    return read, size
end

local largestCode = 999

-- A mobile country or network code as text; none for a number that is none.
local function codeOf(row, number)
    if number < 0 or number > largestCode then
        return nil
    end
    return string.format("%0" .. row.digits .. "d", number)
end

-- What a raw number means; nil for nothing.
local function meaningOf(row)
    local scale, offset = row.a or 1, row.c or 0
    if row.k == "f" then
        return function(raw) return raw ~= 0 end
    elseif row.k == "t" then
        return row.digits and function(raw) return codeOf(row, raw) end or tostring
    elseif row.k or (scale == 1 and offset == 0) then
        return nil -- the number itself
    end
    return function(raw) return raw * scale + offset end
end

-- Prepares the rows of a view or list, and of the lists in it.
local function prepare(view)
    view.rows, view.lists, view.groups = {}, {}, {}
    for _, item in ipairs(view) do
        if item.list then
            item.fields = {}
            for _, number in ipairs(item.f) do
                item.fields[#item.fields + 1] = valueFields[number]
            end
            view.lists[item.list] = item
            prepare(item)
        else
            view.groups[#view.groups + 1] = item
            for _, row in ipairs(item) do
                row.fields = {}
                for _, number in ipairs(row.f) do
                    row.fields[#row.fields + 1] = valueFields[number]
                end
                if row.o then
                    row.read, row.size = readerOf(row)
                end
                row.mean = meaningOf(row)
                row.type = row.f[1] and valueTables[row.f[1]][3]
                -- Of most rows, which need no more than their number and one field.
                row.only = row.k ~= "-" and row.k ~= "t" and #row.fields == 1 and row.fields[1] or nil
                view.rows[row.l] = view.rows[row.l] or row
            end
        end
    end
    view.isEmpty = #view == 0
end

-- Adds a value that is physical, as it stands.
local function addValue(tree, row, range, value)
    local fields = row.fields
    for i = 1, #fields do
        tree:add(fields[i], range, value)
    end
end

-- Adds a raw number, unless it means that there is none.
local function addNumber(tree, row, range, raw)
    if raw == row.x or row.k == "-" then
        return
    end
    local value = raw
    if row.mean then
        value = row.mean(raw)
        if value == nil then
            return
        end
    end
    addValue(tree, row, range, value)
end

-- Adds a number that its format shows without scale and offset; none that is not finite.
local function addReal(tree, row, range, number)
    if number == number and number ~= math.huge and number ~= -math.huge then
        addValue(tree, row, range, row.mean and row.mean(number) or number)
    end
end

-- Adds the rows of a group, read from the entry that begins there.
local function addGroup(tree, group, record, base)
    local bytes, range, add = record.bytes, record.range, tree.add
    for i = 1, #group do
        local row = group[i]
        local raw = row.read(bytes, base)
        if row.only and raw ~= row.x then
            local mean = row.mean
            if mean then
                raw = mean(raw)
            end
            add(tree, row.only, range(base + row.o, row.size), raw)
        else
            addNumber(tree, row, range(base + row.o, row.size), raw)
        end
    end
end

-- Adds the item of a row in a list, and returns it. `number` is the row's index or, in a numbered list, its own.
local function addEntry(tree, list, range, number)
    local entry = tree
    for i = #list.fields, 1, -1 do
        entry = tree:add(list.fields[i], range, number)
    end
    return entry
end
