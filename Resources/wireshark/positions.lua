-- SPDX-FileCopyrightText: 2026 Velmora contributors
-- SPDX-License-Identifier: MIT
-- Positions --------------------------------------------------------------------------------------------------
--
-- The second interface of a recording has link type USER1: a receiver's NMEA 0183 sentences, one a packet.

local position = Proto("velmora_position", "Position Sentence")

local positionFields = {
    sentence = ProtoField.string("velmora_position.sentence", "Sentence"),
    kind = ProtoField.string("velmora_position.kind", "Kind"),
    latitude = ProtoField.double("velmora_position.latitude", "Latitude"),
    longitude = ProtoField.double("velmora_position.longitude", "Longitude"),
    hasFix = ProtoField.bool("velmora_position.fix", "Fix"),
}
position.fields = positionFields
local positionExperts = {
    checksum = ProtoExpert.new("velmora_position.checksum.bad", "Sentence has no checksum or a wrong one",
                               expert.group.CHECKSUM, expert.severity.WARN),
}
position.experts = {positionExperts.checksum}

-- Where a kind of sentence has its place, counted from 1 after the address, and whether it states a fix.
local placeOf = {
    GGA = {2, function(values) return values[6] ~= "" and values[6] ~= "0" end},
    GNS = {2, function(values) return values[6] and values[6]:find("[^N]") ~= nil end},
    RMC = {3, function(values) return values[2] == "A" and values[12] ~= "N" end},
    GLL = {1, function(values) return values[6] == "A" and values[7] ~= "N" end},
}

-- "4807.038" and "N" in degrees; none where they are not.
local function degreesOf(angle, hemisphere, width)
    local degrees = tonumber(angle and angle:match("^%d+%.?%d*$") and angle:sub(1, width))
    local minutes = tonumber(angle and angle:sub(width + 1))
    if not degrees or not minutes or not hemisphere or not hemisphere:match("^[NSEW]$") then
        return nil
    end
    local value = degrees + minutes / 60
    return hemisphere:match("[SW]") and -value or value
end

local function isChecked(text)
    local content, digits = text:match("^%$([^*]*)%*(%x%x)$")
    if not content then
        return false
    end
    local sum = 0
    for at = 1, #content do
        sum = bit.bxor(sum, content:byte(at))
    end
    return sum == tonumber(digits, 16)
end

function position.dissector(tvb, pinfo, root)
    local text = tvb:len() > 0 and tvb():string():gsub("%s+$", "") or ""
    local tree = root:add(position, tvb())
    tree:add(positionFields.sentence, tvb(), text):set_text("Sentence: " .. shown(text))
    pinfo.cols.protocol = "NMEA"
    pinfo.cols.info = shown(text)
    if not isChecked(text) then
        tree:add_proto_expert_info(positionExperts.checksum)
        return tvb:len()
    end
    local values = {}
    for value in ((text:match(",(.*)%*%x%x$") or "") .. ","):gmatch("([^,]*),") do
        values[#values + 1] = value
    end
    local kind = text:match("^%$%u%w(%u%u%u),") or ""
    tree:add(positionFields.kind, kind)
    local place = placeOf[kind]
    if not place then
        return tvb:len()
    end
    local at, states = place[1], place[2]
    local latitude = degreesOf(values[at], values[at + 1], 2)
    local longitude = degreesOf(values[at + 2], values[at + 3], 3)
    local hasFix = states(values) and latitude ~= nil and longitude ~= nil
    tree:add(positionFields.hasFix, hasFix)
    if hasFix then
        tree:add(positionFields.latitude, latitude)
        tree:add(positionFields.longitude, longitude)
        pinfo.cols.info = string.format("%s  %.6f, %.6f", kind, latitude, longitude)
    else
        pinfo.cols.info = kind .. "  no fix"
    end
    return tvb:len()
end
