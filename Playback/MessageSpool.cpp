// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/MessageSpool.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstddef>
#include <functional>
#include <type_traits>
#include <utility>

namespace velmora {

namespace {

constexpr std::size_t bufferSize = std::size_t{1} << 16;

/// What precedes the bytes of each message. Only this process reads it.
struct Head {
    std::int64_t time = 0;
    std::int64_t refresh = 0;
    std::uint64_t number = 0;
    std::uint64_t offset = 0;
    std::uint32_t length = 0;
    std::uint16_t technology = 0;
    std::uint16_t hasRefresh = 0;
};
using HeadBytes = std::array<std::uint8_t, sizeof(Head)>;
static_assert(std::has_unique_object_representations_v<Head>);

Time timeOf(std::int64_t nanoseconds) {
    return Time(std::chrono::nanoseconds(nanoseconds));
}

using Refill = std::function<Result<ChunkedInput>(std::uint64_t offset)>;

class SpoolReader final : public MessageReader {
public:
    SpoolReader(ChunkedInput input, Refill refill) : _input(std::move(input)), _refill(std::move(refill)) {}

    std::optional<LoggedMessage> next() override {
        std::optional<LoggedMessage> message = read();
        if (message || _failure)
            return message;
        // More may have been appended since what there was has been read.
        Result<ChunkedInput> rest = _refill(_input.offset());
        if (!rest) {
            _failure = Failure{rest.reason()};
            return std::nullopt;
        }
        _input = *std::move(rest);
        return read();
    }
    const std::string& technology() const override { return _technology; }
    const std::optional<Failure>& failure() const override { return _failure ? _failure : _input.failure(); }

private:
    std::optional<LoggedMessage> read() {
        if (!_input.ensure(sizeof(Head)))
            return std::nullopt;
        HeadBytes bytes{};
        std::copy_n(_input.available().begin(), bytes.size(), bytes.begin());
        const Head head = std::bit_cast<Head>(bytes);
        if (!_input.ensure(sizeof(Head) + head.length))
            return std::nullopt;
        LoggedMessage message{timeOf(head.time), _input.part(sizeof(Head), head.length), head.number,
                              head.offset};
        if (head.hasRefresh != 0)
            message.refresh = timeOf(head.refresh);
        message.technology = head.technology;
        _input.skip(sizeof(Head) + head.length);
        return message;
    }

    ChunkedInput _input;
    Refill _refill;
    std::string _technology;
    std::optional<Failure> _failure;
};

} // namespace

Result<std::unique_ptr<MessageSpool>> MessageSpool::create() {
    Result<std::shared_ptr<SharedFile>> file = SharedFile::createNameless();
    if (!file)
        return Failure{file.reason()};
    return std::unique_ptr<MessageSpool>(new MessageSpool(*std::move(file)));
}

Result<Done> MessageSpool::append(const LoggedMessage& message) {
    const Bytes content = message.message.bytes();
    Head head;
    head.time = message.time.time_since_epoch().count();
    head.refresh = message.refresh.value_or(Time()).time_since_epoch().count();
    head.number = message.number;
    head.offset = message.offset;
    head.length = static_cast<std::uint32_t>(content.size());
    head.technology = static_cast<std::uint16_t>(message.technology);
    head.hasRefresh = message.refresh ? 1 : 0;
    const auto bytes = std::bit_cast<HeadBytes>(head);
    _buffer.insert(_buffer.end(), bytes.begin(), bytes.end());
    _buffer.insert(_buffer.end(), content.begin(), content.end());
    return _buffer.size() < bufferSize ? Done{} : flush();
}

Result<Done> MessageSpool::flush() {
    if (const Result<Done> written = _file->writeAt(_written, _buffer); !written)
        return Failure{written.reason()};
    _written += _buffer.size();
    _buffer.clear();
    return Done{};
}

Result<ChunkedInput> MessageSpool::inputFrom(std::uint64_t offset) {
    if (const Result<Done> flushed = flush(); !flushed)
        return Failure{flushed.reason()};
    return ChunkedInput(SharedFile::from(_file, offset), ChunkedInput::defaultChunkSize, offset);
}

Result<std::unique_ptr<MessageReader>> MessageSpool::from(std::uint64_t begin) {
    Result<ChunkedInput> input = inputFrom(begin);
    if (!input)
        return Failure{input.reason()};
    return std::unique_ptr<MessageReader>(std::make_unique<SpoolReader>(
        *std::move(input), [this](std::uint64_t offset) { return inputFrom(offset); }));
}

} // namespace velmora
