// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/CompactWriter.h"

#include <thrift/protocol/TCompactProtocol.h>
#include <thrift/transport/TBufferTransports.h>

namespace velmora {

using apache::thrift::protocol::TType;

struct CompactWriter::Protocol {
    std::shared_ptr<apache::thrift::transport::TMemoryBuffer> buffer =
        std::make_shared<apache::thrift::transport::TMemoryBuffer>();
    apache::thrift::protocol::TCompactProtocolT<apache::thrift::transport::TMemoryBuffer> out{buffer};

    void member(TType type, int number) { out.writeFieldBegin("", type, static_cast<std::int16_t>(number)); }
};

CompactWriter::CompactWriter() : _protocol(std::make_unique<Protocol>()) {}

CompactWriter::~CompactWriter() = default;

void CompactWriter::beginStructure() {
    _protocol->out.writeStructBegin("");
}

void CompactWriter::endStructure() {
    _protocol->out.writeFieldStop();
    _protocol->out.writeStructEnd();
}

void CompactWriter::integerMember(int number, std::int32_t value) {
    _protocol->member(TType::T_I32, number);
    integer(value);
}

void CompactWriter::longMember(int number, std::int64_t value) {
    _protocol->member(TType::T_I64, number);
    _protocol->out.writeI64(value);
}

void CompactWriter::flagMember(int number, bool value) {
    _protocol->member(TType::T_BOOL, number);
    _protocol->out.writeBool(value);
}

void CompactWriter::textMember(int number, std::string_view value) {
    _protocol->member(TType::T_STRING, number);
    text(value);
}

void CompactWriter::structureMember(int number) {
    _protocol->member(TType::T_STRUCT, number);
    beginStructure();
}

void CompactWriter::listMember(int number, Element element, std::size_t count) {
    const TType type = element == Element::Integer ? TType::T_I32
                       : element == Element::Text  ? TType::T_STRING
                                                   : TType::T_STRUCT;
    _protocol->member(TType::T_LIST, number);
    _protocol->out.writeListBegin(type, static_cast<std::uint32_t>(count));
}

void CompactWriter::integer(std::int32_t value) {
    _protocol->out.writeI32(value);
}

void CompactWriter::text(std::string_view value) {
    _protocol->out.writeString(std::string(value));
}

void CompactWriter::emptyMember(int number) {
    structureMember(number);
    endStructure();
}

std::string CompactWriter::result() const {
    return _protocol->buffer->getBufferAsString();
}

} // namespace velmora
