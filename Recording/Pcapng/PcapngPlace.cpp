// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngReader.h"

namespace velmora {

PcapngReader::Place PcapngReader::place() const {
    return {_waiting ? _waiting->offset : _blocks.nextOffset(),
            _blocks.isBigEndian(),
            _interfaces,
            _technologies,
            _packets,
            _sectionCount,
            _interfaceCount,
            _lastTime};
}

std::unique_ptr<PcapngReader> PcapngReader::resume(ChunkedInput input, const Place& place) {
    std::unique_ptr<PcapngReader> reader(new PcapngReader(std::move(input), place.bigEndian));
    reader->_interfaces = place.interfaces;
    reader->_technologies = place.technologies;
    reader->_packets = place.packets;
    reader->_sectionCount = place.sections;
    reader->_interfaceCount = place.interfaceCount;
    reader->_lastTime = place.lastTime;
    reader->_isOpening = false;
    return reader;
}

} // namespace velmora
