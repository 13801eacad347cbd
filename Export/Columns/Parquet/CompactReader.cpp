// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/CompactReader.h"

#include <thrift/protocol/TCompactProtocol.h>
#include <thrift/transport/TBufferTransports.h>

#include <algorithm>

namespace velmora {

using apache::thrift::TException;
using apache::thrift::protocol::TType;
using apache::thrift::transport::TMemoryBuffer;

struct CompactReader::Protocol {
    std::shared_ptr<TMemoryBuffer> buffer;
    apache::thrift::protocol::TCompactProtocolT<TMemoryBuffer> in;
    TType type = TType::T_STOP; ///< of what follows

    Protocol(std::uint8_t* bytes, std::uint32_t size)
        : buffer(std::make_shared<TMemoryBuffer>(bytes, size, TMemoryBuffer::OBSERVE)),
          in(buffer, static_cast<std::int32_t>(size), static_cast<std::int32_t>(size)) {}

    void expect(TType wanted) const {
        if (type != wanted)
            throw MalformedStructure("got a member of type " + std::to_string(type) + ", wanted " +
                                     std::to_string(wanted));
    }

    /// What the library throws is of many kinds.
    template <class Read>
    auto guarded(Read read) {
        try {
            return read();
        } catch (const TException& error) {
            throw MalformedStructure(error.what());
        }
    }
};

// The buffer only observes the bytes, though it takes them as if it might write.
CompactReader::CompactReader(Bytes bytes)
    : _protocol(std::make_unique<Protocol>(const_cast<std::uint8_t*>(bytes.data()),
                                           static_cast<std::uint32_t>(bytes.size()))) {
    _protocol->type = TType::T_STRUCT;
}

CompactReader::~CompactReader() = default;

void CompactReader::structure(const std::function<bool(int number)>& member) {
    _protocol->expect(TType::T_STRUCT);
    std::string name;
    std::int16_t number = 0;
    _protocol->guarded([&] { _protocol->in.readStructBegin(name); });
    for (;;) {
        _protocol->guarded([&] { _protocol->in.readFieldBegin(name, _protocol->type, number); });
        if (_protocol->type == TType::T_STOP)
            break;
        const TType type = _protocol->type;
        if (!member(number))
            _protocol->guarded([&] { _protocol->in.skip(type); });
    }
    _protocol->guarded([&] { _protocol->in.readStructEnd(); });
}

void CompactReader::list(const std::function<void()>& element) {
    _protocol->expect(TType::T_LIST);
    std::uint32_t count = 0;
    TType type = TType::T_STOP;
    _protocol->guarded([&] { _protocol->in.readListBegin(type, count); });
    // Each element has a byte at least.
    if (count > _protocol->buffer->available_read())
        throw MalformedStructure("a list of " + std::to_string(count) + " elements, which is too long");
    for (std::uint32_t i = 0; i < count; ++i) {
        _protocol->type = type;
        element();
    }
}

std::int32_t CompactReader::integer() {
    _protocol->expect(TType::T_I32);
    std::int32_t value = 0;
    _protocol->guarded([&] { _protocol->in.readI32(value); });
    return value;
}

std::int64_t CompactReader::longInteger() {
    _protocol->expect(TType::T_I64);
    std::int64_t value = 0;
    _protocol->guarded([&] { _protocol->in.readI64(value); });
    return value;
}

bool CompactReader::flag() {
    _protocol->expect(TType::T_BOOL);
    bool value = false;
    _protocol->guarded([&] { _protocol->in.readBool(value); });
    return value;
}

std::string CompactReader::text() {
    _protocol->expect(TType::T_STRING);
    std::string value;
    _protocol->guarded([&] { _protocol->in.readString(value); });
    return value;
}

} // namespace velmora
