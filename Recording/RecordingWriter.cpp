#include "Recording/RecordingWriter.h"

#include "Platform/TelephonyService.h"
#include "Recording/MessageReader.h"
#include "Recording/Pcapng.h"

#include <algorithm>
#include <cerrno>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

namespace velmora {

namespace {

namespace BlockType = pcapng::BlockType;
namespace Option = pcapng::Option;

constexpr std::size_t flushThreshold = std::size_t{64} << 10;
constexpr std::size_t maximumTechnology = 255;
constexpr std::size_t packetOverhead = 32;
constexpr std::uint8_t nanosecondResolution = 9;
constexpr std::string_view application = VELMORA_RECORDING_APPLICATION;

Bytes bytesOf(std::string_view text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

std::size_t optionSize(std::size_t length) {
    return 4 + pcapng::padded(length);
}

} // namespace

Result<std::unique_ptr<RecordingWriter>> RecordingWriter::create(const std::string& path,
                                                                 std::string_view technology) {
    if (path == "-")
        return start(
            std::unique_ptr<RecordingWriter>(new RecordingWriter(STDOUT_FILENO, false, "standard output")),
            technology);
    const int descriptor = ::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
    if (descriptor < 0)
        return Failure{"cannot create " + path + ": " + std::generic_category().message(errno)};
    return adopt(descriptor, path, technology);
}

Result<std::unique_ptr<RecordingWriter>> RecordingWriter::adopt(int descriptor, std::string name,
                                                                std::string_view technology) {
    return start(std::unique_ptr<RecordingWriter>(new RecordingWriter(descriptor, true, std::move(name))),
                 technology);
}

Result<std::unique_ptr<RecordingWriter>> RecordingWriter::start(std::unique_ptr<RecordingWriter> writer,
                                                                std::string_view technology) {
    const std::string_view name = shortTechnologyName(technology);
    if (name.size() > maximumTechnology)
        return Failure{"technology name of " + std::to_string(name.size()) + " bytes, wanted at most " +
                       std::to_string(maximumTechnology)};
    writer->putHead(name);
    if (const Result<Done> written = writer->flush(); !written)
        return Failure{written.reason()};
    return writer;
}

RecordingWriter::RecordingWriter(int descriptor, bool owned, std::string name)
    : _descriptor(descriptor), _owned(owned), _name(std::move(name)) {
    _buffer.reserve(2 * flushThreshold);
}

RecordingWriter::~RecordingWriter() {
    const Result<Done> closed = close();
    static_cast<void>(closed); // whoever wants to know has closed it before
}

Result<Done> RecordingWriter::append(Time time, Bytes message) {
    if (_failure)
        return *_failure;
    if (message.size() > maximumMessageSize)
        return Failure{"message of " + std::to_string(message.size()) + " bytes, wanted at most " +
                       std::to_string(maximumMessageSize)};
    const auto stamp = static_cast<std::uint64_t>(std::max<std::int64_t>(time.time_since_epoch().count(), 0));
    const auto size = static_cast<std::uint32_t>(message.size());
    const auto length = static_cast<std::uint32_t>(packetOverhead + pcapng::padded(message.size()));
    // What has been gathered goes out ahead of a long message, so that the buffer need not hold both.
    if (!_buffer.empty() && _buffer.size() + length > 2 * flushThreshold) {
        if (Result<Done> written = flush(); !written)
            return written;
    }
    put32(BlockType::EnhancedPacket);
    put32(length);
    put32(0); // the interface
    put32(static_cast<std::uint32_t>(stamp >> 32));
    put32(static_cast<std::uint32_t>(stamp));
    put32(size);
    put32(size);
    putPadded(message);
    put32(length);
    ++_messages;
    return _buffer.size() < flushThreshold ? Done{} : flush();
}

Result<Done> RecordingWriter::flush() {
    Bytes rest = _buffer;
    while (!rest.empty() && !_failure) {
        const ssize_t count = ::write(_descriptor, rest.data(), rest.size());
        if (count >= 0) {
            rest = rest.subspan(static_cast<std::size_t>(count));
        } else if (errno == EAGAIN || errno == EWOULDBLOCK) {
            pollfd writable{_descriptor, POLLOUT, 0};
            ::poll(&writable, 1, -1);
        } else if (errno != EINTR) {
            _failure = fail("write", errno);
        }
    }
    _buffer.clear();
    if (_failure)
        return *_failure;
    return Done{};
}

Result<Done> RecordingWriter::close() {
    if (_descriptor >= 0) {
        const Result<Done> written = flush();
        // Pipes and terminals have nothing to put anywhere, and say EINVAL or the like.
        if (written && ::fsync(_descriptor) != 0 && (errno == EIO || errno == ENOSPC || errno == EDQUOT))
            _failure = fail("write", errno);
        const int descriptor = std::exchange(_descriptor, -1);
        if (_owned && ::close(descriptor) != 0 && errno != EINTR && !_failure)
            _failure = fail("close", errno);
    }
    if (_failure)
        return *_failure;
    return Done{};
}

void RecordingWriter::putHead(std::string_view technology) {
    const auto sectionLength =
        static_cast<std::uint32_t>(24 + optionSize(application.size()) + optionSize(0) + 4);
    put32(BlockType::SectionHeader);
    put32(sectionLength);
    put32(pcapng::byteOrderMagic);
    put16(1); // format version 1.0
    put16(0);
    put32(0xFFFFFFFF); // the section's length is not known beforehand
    put32(0xFFFFFFFF);
    putOption(Option::SectionUserApplication, application);
    putOption(Option::End, std::string_view());
    put32(sectionLength);

    const auto interfaceLength =
        static_cast<std::uint32_t>(16 + optionSize(technology.size()) + optionSize(1) + optionSize(0) + 4);
    put32(BlockType::InterfaceDescription);
    put32(interfaceLength);
    put16(pcapng::logMessageLinkType);
    put16(0);
    put32(0); // messages of any length
    putOption(Option::InterfaceName, technology);
    putOption(Option::TimeResolution, Bytes(&nanosecondResolution, 1));
    putOption(Option::End, std::string_view());
    put32(interfaceLength);
}

void RecordingWriter::put16(std::uint16_t value) {
    _buffer.push_back(static_cast<std::uint8_t>(value));
    _buffer.push_back(static_cast<std::uint8_t>(value >> 8));
}

void RecordingWriter::put32(std::uint32_t value) {
    put16(static_cast<std::uint16_t>(value));
    put16(static_cast<std::uint16_t>(value >> 16));
}

void RecordingWriter::putPadded(Bytes bytes) {
    _buffer.insert(_buffer.end(), bytes.begin(), bytes.end());
    _buffer.resize(_buffer.size() + pcapng::padded(bytes.size()) - bytes.size());
}

void RecordingWriter::putOption(std::uint16_t code, Bytes value) {
    put16(code);
    put16(static_cast<std::uint16_t>(value.size()));
    putPadded(value);
}

void RecordingWriter::putOption(std::uint16_t code, std::string_view text) {
    putOption(code, bytesOf(text));
}

Failure RecordingWriter::fail(const char* operation, int error) {
    return Failure{"cannot " + std::string(operation) + " " + _name + ": " +
                   std::generic_category().message(error)};
}

} // namespace velmora
