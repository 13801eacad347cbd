-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Wireshark dissector for Velmora's recordings: the log messages of a cellular modem, one a packet, on link
-- type USER0. Loaded from Wireshark's directory of Lua plugins, or with -X lua_script:velmora.lua.
--
-- A message of the binary technologies is one record: type, length, log code and time stamp in 13 bytes, and
-- then the payload. One of the serialized-object technology (IFX) is a whole property list. Which of them it
-- is, and which sections of the display want a log code, depends on the technology, and that is the name of
-- the interface that the packet came from. Where an interface has none, the sections of all technologies count.

local velmora = Proto("velmora", "Modem Log Message")

local headerSize = 13
local prefixSize = 2
local prefixMarker = 0x81
local basebandType = 1
local extraType = 0xFF
local extraCodes = 0xFF0000
local serializedTechnology = "IFX"

-- For each technology the sections that want a log code, in the order in which they are given its records.
-- A test holds this table against the decoders.
local sections = {
    order = {"Ostrel_GSM", "Ostrel_LTE", "Ostrel_UTRAN2", "Ostrel_CDMA"},
    Ostrel_GSM = {
        [0x4005] = {"GSM Set", "UMTS Set"},
        [0x4031] = {"UMTS RR Info"},
        [0x4116] = {"BLER"},
        [0x4125] = {"UMTS RR Info"},
        [0x4127] = {"UMTS RR Info"},
        [0x4157] = {"UMTS RR Info"},
        [0x417A] = {"Active Set", "Detected Set", "Monitored Set", "Virtual Active Set"},
        [0x4221] = {"HSDPA Info"},
        [0x5072] = {"GSM RR Info"},
        [0x5076] = {"GSM Serving Cell"},
        [0x512C] = {"GSM RR Info"},
        [0x5134] = {"GSM Serving Cell"},
        [0x5137] = {"GPRS Information", "GSM Serving Cell", "Neighboring Cells", "GSM RR Info"},
        [0x51F4] = {"GPRS Information"},
        [0x51F5] = {"GPRS Information"},
        [0x51F6] = {"GPRS Information", "GSM RR Info"},
        [0x51F8] = {"Mobile Allocation"},
        [0x51FB] = {"GPRS Information"},
        [0x51FD] = {"GPRS Information"},
        [0x51FF] = {"Neighboring Cells"},
        [0x7130] = {"Process PS"},
        [0x7131] = {"Process CO", "Process CS"},
        [0x7132] = {"Process PS", "Process CO", "Serving PLMN", "Process CS"},
        [0x7135] = {"GPRS Information", "Serving PLMN"},
        [0x7150] = {"Equivalent PLMN List"},
        [0xFF0000] = {"SIM Info"},
        [0xFF0001] = {"GSM Serving Cell", "Neighboring Cells", "Serving PLMN", "UMTS Set", "UMTS RR Info"},
        [0xFF0002] = {"PDP Context Info"},
    },
    Ostrel_LTE = {
        [0xB0C1] = {"Serving Cell Info"},
        [0xB0C2] = {"Serving Cell Info"},
        [0xB179] = {"Connected mode LTE Intra-frequency Measurement", "Measured Neighbor Cells", "Detected Cells"},
        [0xB17F] = {"Serving Cell Measurements"},
        [0xB180] = {"Neighbor Measurements", "Neighbor Cells List"},
        [0xB186] = {"Reselection Candidates", "Reselection Candidates List"},
        [0xFF0000] = {"SIM Info"},
        [0xFF0001] = {"Serving Cell Info"},
        [0xFF0002] = {"PDP Context Info"},
    },
    Ostrel_UTRAN2 = {
        [0xD00A] = {"Neighbor Cell List"},
        [0xD00C] = {"TRCH BLER", "CCTRCH SIR"},
        [0xD00E] = {"GSM Neighbor Cell List"},
        [0xD0E0] = {"RRC Info"},
        [0xD0E2] = {"Serving Cell Info"},
        [0xFF0000] = {"SIM Info"},
        [0xFF0001] = {"Serving Cell Info"},
        [0xFF0002] = {"PDP Context Info"},
    },
    Ostrel_CDMA = {
    },
}

-- The technology without sections: its decoder knows records by their log codes alone, and takes them whatever
-- their type. What they are called is held against the decoder by a test, too.
local recordTechnology = "Ostrel_CDMA"
local records = {
    [0x108A] = "Finger C/I",
    [0x1183] = "EV-DO status",
    [0x1192] = "Forward-link data rate",
    [0x119C] = "1x status",
    [0x119D] = "Traffic FER",
    [0x127E] = "Reverse-link data rate",
    [0x12B6] = "Active-set pilots",
    [0x134F] = "System identification",
}

local types = {[basebandType] = "baseband", [extraType] = "telephony service"}

local fields = {
    technology = ProtoField.string("velmora.technology", "Technology"),
    prefix = ProtoField.bytes("velmora.prefix", "Prefix"),
    type = ProtoField.uint8("velmora.type", "Type", base.HEX, types),
    length = ProtoField.uint16("velmora.length", "Length", base.DEC),
    code = ProtoField.uint24("velmora.code", "Log code", base.HEX),
    record = ProtoField.string("velmora.record", "Record"),
    sections = ProtoField.string("velmora.sections", "Section"),
    time = ProtoField.absolute_time("velmora.time", "Time stamp", base.UTC),
    payload = ProtoField.bytes("velmora.payload", "Payload"),
    plist = ProtoField.string("velmora.plist", "Property list"),
    key = ProtoField.string("velmora.plist.key", "Key"),
    value = ProtoField.string("velmora.plist.value", "Value"),
}
velmora.fields = fields

local experts = {
    tooShort = ProtoExpert.new("velmora.too_short", "Message is too short", expert.group.MALFORMED,
                               expert.severity.ERROR),
    wrongType = ProtoExpert.new("velmora.wrong_type", "Type is neither stream's", expert.group.MALFORMED,
                                expert.severity.ERROR),
    cutTime = ProtoExpert.new("velmora.time.cut", "Record ends within its time stamp", expert.group.MALFORMED,
                              expert.severity.WARN),
    badTime = ProtoExpert.new("velmora.time.bad", "Time stamp is out of range", expert.group.PROTOCOL,
                              expert.severity.WARN),
    wrongLength = ProtoExpert.new("velmora.length.wrong", "Length is not the record's", expert.group.PROTOCOL,
                                  expert.severity.NOTE),
    badList = ProtoExpert.new("velmora.plist.bad", "Property list cannot be read", expert.group.MALFORMED,
                              expert.severity.ERROR),
    cutCapture = ProtoExpert.new("velmora.cut", "Message was cut when it was captured",
                                 expert.group.UNDECODED, expert.severity.WARN),
}
velmora.experts = {
    experts.tooShort, experts.wrongType, experts.cutTime, experts.badTime, experts.wrongLength,
    experts.badList, experts.cutCapture,
}

local interfaceName = Field.new("frame.interface_name")
local xml = Dissector.get("xml")

-- Time stamps ------------------------------------------------------------------------------------------------
--
-- The upper 48 bits count units of 1.25 ms since 1980-01-06 without leap seconds, the lower 16 bits the 1/32
-- chips since the unit began. All of it is exact in the 53 bits of a Lua number.

local epoch = 315964800 -- 1980-01-06 in seconds since 1970
local unitsPerSecond = 800
local unit = 1250000 -- nanoseconds
local partsPerUnit = 49152
local unitsOfTime = 7125925789483 -- from here on nanoseconds since 1970 leave 64 bits

-- The moments, in seconds since 1970, from which the time stamps' time has been one second further ahead of
-- UTC.
local leaps = {
    362793600, 394329600, 425865600, 489024000, 567993600, 631152000, 662688000, 709948800, 741484800,
    773020800, 820454400, 867715200, 915148800, 1136073600, 1230768000, 1341100800, 1435708800, 1483228800,
}

-- Seconds and nanoseconds since 1970; none where the stamp means no moment.
local function timeOf(units, parts)
    if parts >= partsPerUnit or units >= unitsOfTime then
        return nil
    end
    local rest = math.floor((parts * unit + partsPerUnit / 2) / partsPerUnit)
    local seconds = epoch + math.floor(units / unitsPerSecond)
    local nanoseconds = units % unitsPerSecond * unit + rest
    if nanoseconds >= 1000000000 then
        seconds = seconds + 1
        nanoseconds = nanoseconds - 1000000000
    end
    for ahead = #leaps, 1, -1 do
        -- Within the inserted second itself UTC stands at the leap.
        if seconds >= leaps[ahead] + ahead - 1 then
            return seconds - (seconds >= leaps[ahead] + ahead and ahead or ahead - 1), nanoseconds
        end
    end
    return seconds, nanoseconds
end

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
    local list = {bytes = bytes, size = size, values = 0}

    -- The big-endian number of up to eight bytes there.
    function list.number(offset, width)
        if offset + width > list.size then
            refuse(string.format("a number of %d bytes at %d passes the end", width, offset))
        end
        local value = 0
        for i = 0, width - 1 do
            value = value * 256 + bytes(offset + i, 1):uint()
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

-- How a value that is no array and no dictionary is shown, and the bytes that it comes from.
local function scalarText(list, kind, count, content, offset)
    if kind == 0 and count == 8 then
        return "false", list.window(offset, 1)
    elseif kind == 0 and count == 9 then
        return "true", list.window(offset, 1)
    elseif kind == 1 and count <= 3 then
        local range = list.window(content, 2 ^ count)
        if count == 3 then
            return tostring(range:int64()), range
        end
        return string.format("%d", range:uint()), range
    elseif kind == 2 and (count == 2 or count == 3) then
        local range = list.window(content, 2 ^ count)
        return string.format("%.17g", range:float()), range
    elseif kind == 3 and count == 3 then
        local range = list.window(content, 8)
        return string.format("%.3f s since 2001-01-01", range:float()), range
    elseif kind == 4 then
        local range = list.window(content, count)
        return range:len() > 0 and range:bytes():tohex(true) or "", range
    elseif kind == 5 then
        local range = list.window(content, count)
        return count > 0 and range:string(ENC_ASCII) or "", range
    elseif kind == 6 then
        local range = list.window(content, count * 2)
        return count > 0 and range:string(ENC_UTF_16 + ENC_BIG_ENDIAN) or "", range
    end
    refuse(string.format("object of unknown kind 0x%x%x at %d", kind, count, offset))
end

-- Puts the object of that number into the tree, under its key where it has one. A list whose values refer to
-- each other in a circle ends at the deepest level.
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
    local label = key and key .. ": " or ""
    if kind ~= 0xA and kind ~= 0xD then
        local text, range = scalarText(list, kind, count, content, offset)
        tree:add(fields.value, range, text):set_text(label .. text)
        return
    end
    local width = list.referenceSize
    local isDictionary = kind == 0xD
    local range = list.window(content, count * width * (isDictionary and 2 or 1))
    local noun = isDictionary and (count == 1 and "entry" or "entries") or (count == 1 and "element" or "elements")
    local branch = tree:add(velmora, range, string.format("%s%d %s", label, count, noun))
    for i = 0, count - 1 do
        local name = nil
        if isDictionary then
            local at = list.object(list.number(content + i * width, width))
            local keyKind, keyCount, keyContent = list.head(at)
            if keyKind ~= 5 and keyKind ~= 6 then
                refuse(string.format("a key at %d is no text", at))
            end
            local keyRange
            name, keyRange = scalarText(list, keyKind, keyCount, keyContent, at)
            branch:add(fields.key, keyRange, name):set_hidden(true)
        end
        local values = content + (isDictionary and count * width or 0)
        addObject(list, branch, list.number(values + i * width, width), name, depth + 1)
    end
end

local function isBinaryList(range)
    return range:len() >= #binaryMarker and range(0, #binaryMarker):string() == binaryMarker
end

-- Whether the bytes are an XML document, as far as their beginning tells.
local function isXML(range)
    return range:len() >= 5 and range(0, 5):string() == "<?xml"
end

-- Shows a property list of either form. What a binary one held before it went wrong stays shown.
local function addList(range, pinfo, tree)
    if isXML(range) then
        tree:add(fields.plist, range, "XML"):set_text("Property list (XML)")
        xml:call(range:tvb(), pinfo, tree)
        return
    end
    local branch = tree:add(fields.plist, range, "binary")
    branch:set_text("Property list (binary)")
    local fine, problem = pcall(function()
        local list = binaryList(range)
        addObject(list, branch, list.top, nil, 1)
    end)
    if not fine then
        if type(problem) ~= "table" then
            error(problem, 0)
        end
        branch:add_proto_expert_info(experts.badList, "Property list cannot be read: " .. problem.reason)
    end
end

-- Messages ---------------------------------------------------------------------------------------------------

-- The names of the sections that want the code, each once.
local function sectionsOf(technology, code)
    local names, seen = {}, {}
    for _, name in ipairs(sections[technology] and {technology} or sections.order) do
        for _, section in ipairs(sections[name][code] or {}) do
            if not seen[section] then
                seen[section] = true
                names[#names + 1] = section
            end
        end
    end
    return names
end

local function codeText(code)
    return string.format(code > 0xFFFF and "0x%06X" or "0x%04X", code)
end

local function addTime(record, tree)
    if record:len() < headerSize then
        tree:add_proto_expert_info(experts.cutTime, string.format(
            "Record ends within its time stamp: %d bytes, wanted at least %d", record:len(), headerSize))
        return
    end
    local range = record(5, 8)
    local parts = record(5, 2):le_uint()
    local units = record(7, 2):le_uint() + record(9, 4):le_uint() * 0x10000
    local seconds, nanoseconds = timeOf(units, parts)
    if seconds then
        tree:add(fields.time, range, NSTime.new(seconds, nanoseconds))
    else
        tree:add_proto_expert_info(experts.badTime, string.format(
            "Time stamp is out of range: %.0f units of 1.25 ms and %d of %d parts", units, parts, partsPerUnit))
    end
end

local function dissectRecord(message, pinfo, tree, technology)
    if message:len() < headerSize then
        local text = string.format("%d bytes, wanted at least %d", message:len(), headerSize)
        tree:add_proto_expert_info(experts.tooShort, "Message is too short: " .. text)
        pinfo.cols.info = "Too short: " .. text
        return
    end
    local record = message
    if message(0, 1):uint() == prefixMarker then
        tree:add(fields.prefix, message(0, prefixSize))
        record = message(prefixSize)
    end

    local recordType = record(0, 1):uint()
    local typeItem = tree:add(fields.type, record(0, 1))
    local length = record(1, 2):le_uint()
    local lengthItem = tree:add_le(fields.length, record(1, 2))
    -- It counts all that follows the type, up to what 16 bits hold.
    local present = math.min(record:len() - 1, 0xFFFF)
    if length ~= present then
        lengthItem:add_proto_expert_info(experts.wrongLength, string.format(
            "Length is not the record's: %d, %d bytes follow the type", length, present))
    end
    local code = record(3, 2):le_uint() + (recordType == extraType and extraCodes or 0)
    local info = codeText(code)
    local names = {}
    if types[recordType] then
        names = sectionsOf(technology, code)
    else
        typeItem:add_proto_expert_info(experts.wrongType, string.format(
            "Type is neither stream's: 0x%02x, wanted 0x%02x or 0x%02x", recordType, basebandType, extraType))
        info = info .. string.format("  [type 0x%02x]", recordType)
    end
    if types[recordType] or technology == recordTechnology then
        local codeItem = tree:add(fields.code, record(3, 2), code)
        for _, name in ipairs(names) do
            tree:add(fields.sections, record(3, 2), name):set_generated(true)
        end
        if (technology == recordTechnology or not sections[technology]) and records[code] then
            tree:add(fields.record, record(3, 2), records[code]):set_generated(true)
            names[#names + 1] = records[code]
        end
        if #names > 0 then
            local text = table.concat(names, ", ")
            codeItem:append_text(" (" .. text .. ")")
            info = info .. "  " .. text
        end
    else
        -- No decoder looks at it, so that no filter for the code is to find it.
        tree:add(record(3, 2), "Log code: " .. codeText(code) .. " (dropped)")
    end
    addTime(record, tree)
    if record:len() > headerSize then
        local payload = record(headerSize)
        tree:add(fields.payload, payload)
        if recordType == extraType and (isXML(payload) or isBinaryList(payload)) then
            addList(payload, pinfo, tree)
        end
    end
    pinfo.cols.info = string.format("%s  %d bytes%s", info, math.max(record:len() - headerSize, 0),
                                    record:len() < message:len() and ", prefixed" or "")
end

local function dissectList(message, pinfo, tree)
    tree:add(fields.payload, message)
    if isXML(message) or isBinaryList(message) then
        addList(message, pinfo, tree)
        pinfo.cols.info = string.format("Property list (%s)  %d bytes", isXML(message) and "XML" or "binary",
                                        message:len())
    else
        tree:add_proto_expert_info(experts.badList, string.format(
            "Property list cannot be read: %d bytes that begin neither <?xml nor %s", message:len(),
            binaryMarker))
        pinfo.cols.info = string.format("No property list  %d bytes", message:len())
    end
end

function velmora.dissector(tvb, pinfo, root)
    local name = interfaceName()
    local technology = name and name.value or ""
    local tree = root:add(velmora, tvb())
    tree:add(fields.technology, technology):set_generated(true)
    if tvb:reported_len() > tvb:len() then
        tree:add_proto_expert_info(experts.cutCapture, string.format(
            "Message was cut when it was captured: %d of %d bytes", tvb:len(), tvb:reported_len()))
    end
    if tvb:len() == 0 then
        tree:add_proto_expert_info(experts.tooShort, string.format(
            "Message is too short: 0 bytes, wanted at least %d", headerSize))
        pinfo.cols.info = "Empty"
    elseif technology == serializedTechnology then
        dissectList(tvb(), pinfo, tree)
    else
        dissectRecord(tvb(), pinfo, tree, technology)
    end
    -- Last, since the dissector of XML names itself here.
    pinfo.cols.protocol = technology ~= "" and technology or "Velmora"
    return tvb:len()
end

DissectorTable.get("wtap_encap"):add(wtap.USER0, velmora)
