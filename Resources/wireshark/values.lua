-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- What a message reports ---------------------------------------------------------------------------------------

-- Shows a property list of either form, and returns its value; none where it cannot be read. What a binary one held
-- before it went wrong stays shown.
local function addList(range, pinfo, tree)
    local isText = isXML(range)
    local branch = tree:add(fields.plist, range, isText and "XML" or "binary")
    branch:set_text(isText and "Property list (XML)" or "Property list (binary)")
    if isText then
        xml:call(range:tvb(), pinfo, tree)
    end
    local fine, result = pcall(function()
        if isText then
            return xmlList(range)
        end
        local list = binaryList(range)
        local value = addObject(list, branch, list.top, nil, 1)
        if list.flaw then
            refuse(list.flaw)
        end
        return value
    end)
    if fine then
        return result
    elseif type(result) ~= "table" then
        error(result, 0)
    end
    branch:add_proto_expert_info(experts.badList, "Property list cannot be read: " .. result.reason)
    return nil
end

-- The bytes of a property list's value.
local function rangeOf(node)
    return node.range or node.whole(node.first, node.length)
end

local least32, most32 = -2 ^ 31, 2 ^ 31 - 1

-- The part of a cell's number that is shown; none of what is no whole number of 32 bits.
local function cellNumber(row, node)
    local number = node and (node.kind == "integer" or node.kind == "real") and node.value
    if not number or number ~= floor(number) or number < least32 or number > most32 then
        return nil
    end
    if row.low then
        number = number % 2 ^ row.low
        return row.signed and signed(number, row.low) or number
    end
    return number
end

local function addCell(tree, groups, cell)
    for _, group in ipairs(groups) do
        for _, row in ipairs(group) do
            local node = cell.value[row.key]
            local number = cellNumber(row, node)
            if number then
                addNumber(tree, row, rangeOf(node), number)
            end
        end
    end
end

local function textAt(cell, key)
    local node = cell.value[key]
    return node and node.kind == "text" and node.value or ""
end

-- The cells of the cell information array that the section shows.
local function addCells(tree, view, cells)
    local list = view.lists[""]
    local index = 0
    for _, cell in ipairs(cells.value) do
        local kind = cell.kind == "dictionary" and textAt(cell, "kVoxCellMonitorCellRadioAccessTechnology") .. " " ..
                         textAt(cell, "kVoxCellMonitorCellType")
        if kind and view.kinds[kind] then
            if view.cells == "rows" then
                addCell(addEntry(tree, list, rangeOf(cell), index), list.groups, cell)
                index = index + 1
            else
                addCell(tree, view.groups, cell)
                if view.cells == "first" then
                    return
                end
            end
        end
    end
end

-- What a value that is supplied ready to be shown is as text; none of an array or a dictionary.
local function suppliedText(node)
    if node.kind == "text" or node.kind == "data" or node.kind == "date" then
        return node.value
    elseif node.kind == "array" or node.kind == "dictionary" then
        return nil
    end
    return node.kind == "real" and realText(node.value) or tostring(node.value)
end

-- The values of a dictionary under the rows' keys or, where they have none, their labels.
local function addSupplied(tree, groups, dictionary)
    for _, group in ipairs(groups) do
        for _, row in ipairs(group) do
            local node = dictionary.value[row.key or row.l]
            local text = node and suppliedText(node)
            if text then
                addValue(tree, row, rangeOf(node), text)
            end
        end
    end
end

-- What sections show of property lists, by log code; true for what they can read.
local listForms = {
    [0xFF0000] = function(tree, view, list)
        if list.kind == "dictionary" then
            addSupplied(tree, view.groups, list)
        end
        return true
    end,
    [0xFF0001] = function(tree, view, list)
        if list.kind == "array" then
            addCells(tree, view, list)
        end
        return list.kind == "array"
    end,
    [0xFF0002] = function(tree, view, list)
        local rows = view.lists[""]
        for index, each in ipairs(list.kind == "array" and list.value or {}) do
            local entry = addEntry(tree, rows, rangeOf(each), index - 1)
            if each.kind == "dictionary" then
                addSupplied(entry, rows.groups, each)
            elseif rows.rows[""] and suppliedText(each) then
                addValue(entry, rows.rows[""], rangeOf(each), suppliedText(each))
            end
        end
        return list.kind == "array"
    end,
}

-- In a function of its own, since one cannot have more than 200 local variables.
local addModemView = (function()
@PART modem.lua@

@PART cells.lua@

return addModemView
end)()

-- Adds what a section shows of a record; `list`: its property list, where it is one.
local function addView(tree, view, record, list, technology)
    if technology == "Modem" then
        -- Without the interface's name, what all messages of a live modem hold tells that it is one.
        if record.technology == technology or (list and list.kind == "dictionary" and list.value.kVoxModemPresence) then
            addModemView(tree, view, record, list)
        end
    elseif record.code >= extraCodes then
        local form = listForms[record.code]
        if list and form and not form(tree, view, list) then
            damaged(record, experts.badList, "Property list cannot be read: a root of kind " .. list.kind)
        end
    elseif record.size < view.least then
        damaged(record, experts.shortRecord, string.format("Record 0x%04X: %d bytes, wanted at least %d", record.code,
                                                           record.size, view.least))
    elseif view.shape then
        view.shape(tree, view, record)
    else
        addGroups(tree, view, record)
    end
end

for _, codes in pairs(views) do
    for code, sectionViews in pairs(codes) do
        for _, view in ipairs(sectionViews) do
            view.shape = shapes[string.format("%s %04X", view.section, code)] or
                             shapes[string.format("%04X", code)]
        end
    end
end

-- The technology whose decoder reads messages: that of the interface, or all.
local ownOrder = {}
for _, technology in ipairs(viewOrder) do
    ownOrder[technology] = {technology}
end
local function technologiesOf(technology)
    return ownOrder[technology] or viewOrder
end

-- Adds all values that the decoder's sections show of a record, below the items that name the sections.
local function addViews(record, list)
    for _, technology in ipairs(technologiesOf(record.technology)) do
        for _, view in ipairs(views[technology][record.code] or {}) do
            addView(record.branches[view.section] or record.tree, view, record, list, technology)
        end
    end
end

-- Displays ---------------------------------------------------------------------------------------------------
--
-- Messages of the serialized-object technology are displays. Their numbers are texts.

-- Number of the field and, of a number, its unit; by path. With a "#" after it the number of a row's field.
local displayPaths = {
@PATHS@
}

-- The number of a text that is in the unit and nothing more; none of another.
local function textNumber(text, unit)
    local number, found = text:match("^([+-]?%d[%d.]*)(.*)$")
    local digits = number and number:match("%d.*$")
    if not digits or found ~= (unit == "" and "" or " " .. unit) or digits:find("^0%d") or digits:find("%.$") or
        digits:find("%..*%.") then
        return nil
    end
    return tonumber((number:gsub("^%+", "")))
end

-- A dictionary of one entry is shown as that entry, wherever it is in another value.
local function collapsed(node)
    while node.kind == "dictionary" do
        local key, only = next(node.value)
        if key == nil or next(node.value, key) ~= nil then
            break
        end
        node = only
    end
    return node
end

local function addDisplay(tree, node, path)
    if node.kind == "dictionary" then
        for _, key in ipairs(node.order) do
            addDisplay(tree, collapsed(node.value[key]), path .. "/" .. key)
        end
    elseif node.kind == "array" then
        local number = displayPaths[path .. "/*#"]
        for index, each in ipairs(node.value) do
            addDisplay(number and tree:add(valueFields[number], rangeOf(each), index - 1) or tree, collapsed(each),
                       path .. "/*")
        end
    elseif displayPaths[path] and node.kind == "text" then
        local row = displayPaths[path]
        local value = node.value
        if row[2] then
            value = textNumber(value, row[2])
        end
        if value then
            tree:add(valueFields[row[1]], rangeOf(node), value)
        end
    end
end
