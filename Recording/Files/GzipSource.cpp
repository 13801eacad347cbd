// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/GzipSource.h"

#include <algorithm>
#include <array>
#include <limits>
#include <new>
#include <utility>

#define ZLIB_CONST
#include <zlib.h>

namespace velmora {

namespace {

/// The signature, and the one method that there is.
constexpr std::array<std::uint8_t, 3> headerStart = {0x1F, 0x8B, 0x08};
/// The flags after it that have no meaning, and are 0.
constexpr std::uint8_t reservedFlags = 0xE0;
/// The largest window, and a header and trailer of gzip around the data.
constexpr int gzipWindow = 15 + 16;

uInt clampedSize(std::size_t size) {
    return static_cast<uInt>(std::min<std::size_t>(size, std::numeric_limits<uInt>::max()));
}

} // namespace

struct GzipSource::Inflater {
    Inflater() {
        if (::inflateInit2(&stream, gzipWindow) != Z_OK)
            throw std::bad_alloc(); // its only failure with these arguments
    }
    ~Inflater() { ::inflateEnd(&stream); }
    Inflater(const Inflater&) = delete;
    Inflater& operator=(const Inflater&) = delete;

    z_stream stream = {};
};

bool isGzip(Bytes begin) {
    return begin.size() > headerStart.size() &&
           std::equal(headerStart.begin(), headerStart.end(), begin.begin()) &&
           (begin[headerStart.size()] & reservedFlags) == 0;
}

GzipSource::GzipSource(ChunkedInput input)
    : _input(std::move(input)), _inflater(std::make_unique<Inflater>()) {}

GzipSource::~GzipSource() = default;

Result<std::size_t> GzipSource::read(std::span<std::uint8_t> buffer) {
    std::size_t count = 0;
    // A member may be empty.
    while (count == 0 && !_failure && (_inMember || beginMember()))
        count = inflateInto(buffer);
    if (count == 0 && _failure)
        return *_failure;
    return count;
}

bool GzipSource::beginMember() {
    while (!_isFirst && _input.ensure(1) && _input.available()[0] == 0)
        _input.skip(1);
    static_cast<void>(_input.ensure(headerStart.size() + 1));
    if (_input.failure())
        _failure = _input.failure();
    else if (!isGzip(_input.available()) && (_isFirst || !_input.available().empty()))
        fail(_isFirst ? "not gzip'd data" : "gzip'd data followed by something else");
    if (_failure || _input.available().empty())
        return false;
    ::inflateReset(&_inflater->stream);
    _isFirst = false;
    _inMember = true;
    return true;
}

/// Unpacks at least a byte, unless the member ends or fails before.
std::size_t GzipSource::inflateInto(std::span<std::uint8_t> buffer) {
    z_stream& stream = _inflater->stream;
    stream.next_out = buffer.data();
    stream.avail_out = clampedSize(buffer.size());
    const uInt room = stream.avail_out;
    while (_inMember && !_failure && stream.avail_out == room) {
        // At the end of the input there may be bytes left that had no room before.
        const bool hasMore = _input.ensure(1);
        const Bytes packed = _input.available();
        stream.next_in = packed.data();
        stream.avail_in = clampedSize(packed.size());
        const uInt offered = stream.avail_in;
        const int result = ::inflate(&stream, Z_NO_FLUSH);
        _input.skip(offered - stream.avail_in);
        if (result == Z_MEM_ERROR)
            throw std::bad_alloc();
        const bool hasProgress = stream.avail_out != room || stream.avail_in != offered;
        if (result == Z_DATA_ERROR || result == Z_NEED_DICT || (hasMore && !hasProgress))
            fail(std::string("damaged gzip'd data (") + (stream.msg ? stream.msg : "no progress") + ")",
                 "near");
        else if (!hasMore && !hasProgress && _input.failure())
            _failure = _input.failure();
        else if (!hasMore && !hasProgress && result != Z_STREAM_END)
            fail("gzip'd data that ends early");
        _inMember = result != Z_STREAM_END;
    }
    return room - stream.avail_out;
}

/// The reader of the unpacked bytes adds their offset. zlib notices damage a few bytes after it, how many
/// depends on the sizes in which it gets the data.
void GzipSource::fail(const std::string& what, const char* place) {
    _failure = Failure{what + ", " + place + " byte " + std::to_string(_input.offset()) +
                       " of the file; unpacked it ends"};
}

} // namespace velmora
