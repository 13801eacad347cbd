// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/DLFWriter.h"

#include "LogMessages/DLFVersionReport.h"
#include "LogMessages/LogMessage.h"
#include "Recording/DLF/ImpliedType.h"
#include "Recording/Files/DescriptorFile.h"

#include <cerrno>
#include <cstddef>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t flushThreshold = std::size_t{64} << 10;

/// Why the message cannot be followed in a log; empty where it can.
std::string whyUnfit(Bytes message) {
    const std::optional<LogMessage> parsed = LogMessage::parse(message);
    if (!parsed || parsed->record.size() < LogMessage::headerLength)
        return "message of " + std::to_string(message.size()) + " bytes, wanted a record header of " +
               std::to_string(LogMessage::headerLength) + " at least";
    if (parsed->length() != parsed->record.size() - 1)
        return "record length " + std::to_string(parsed->length()) + " in a message whose record has " +
               std::to_string(parsed->record.size() - 1) + " bytes after its type";
    return {};
}

} // namespace

Result<std::unique_ptr<DLFWriter>> DLFWriter::create(const std::string& path, const Clock& clock) {
    if (path == "-")
        return start(std::make_unique<DescriptorFile>(STDOUT_FILENO, false), "standard output", clock);
    const int descriptor = ::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, S_IRUSR | S_IWUSR);
    if (descriptor < 0)
        return Failure{"cannot create " + path + ": " + std::generic_category().message(errno)};
    return adopt(descriptor, path, clock);
}

Result<std::unique_ptr<DLFWriter>> DLFWriter::adopt(int descriptor, std::string name, const Clock& clock) {
    return start(std::make_unique<DescriptorFile>(descriptor, true), std::move(name), clock);
}

Result<std::unique_ptr<DLFWriter>> DLFWriter::start(std::unique_ptr<OutputFile> file, std::string name,
                                                    const Clock& clock) {
    std::unique_ptr<DLFWriter> writer(new DLFWriter(std::move(file), std::move(name)));
    writer->_buffer.resize(dlfVersionReportSize);
    std::size_t written = 0;
    if (const int result = addOwnVersionReport(writer->_buffer, written, clock); result != 0)
        return Failure{"version report not written, result " + std::to_string(result) + ", wanted 0"};
    if (const Result<Done> flushed = writer->flush(); !flushed)
        return Failure{flushed.reason()};
    return writer;
}

DLFWriter::DLFWriter(std::unique_ptr<OutputFile> file, std::string name)
    : _file(std::move(file)), _name(std::move(name)) {}

DLFWriter::~DLFWriter() {
    const Result<Done> closed = close();
    static_cast<void>(closed); // callers that need the result call close themselves
}

Result<Done> DLFWriter::append(Bytes message) {
    if (_failure)
        return *_failure;
    if (std::string reason = whyUnfit(message); !reason.empty()) {
        ++_refused;
        return Failure{std::move(reason)};
    }
    const LogMessage parsed = *LogMessage::parse(message);
    const bool impliesType = !parsed.prefixed && parsed.type == impliedType(parsed.code);
    const Bytes kept = message.subspan(impliesType ? 1 : 0);
    _buffer.insert(_buffer.end(), kept.begin(), kept.end());
    ++_messages;
    return _buffer.size() < flushThreshold ? Done{} : flush();
}

Result<Done> DLFWriter::flush() {
    for (Bytes rest = _buffer; !rest.empty() && !_failure;) {
        const OutputFile::Written written = _file->write(rest);
        if (written.error != 0)
            _failure = failureOf("write", written.error);
        rest = rest.subspan(written.bytes);
    }
    _buffer.clear();
    if (_failure)
        return *_failure;
    return Done{};
}

Result<Done> DLFWriter::close() {
    if (_file) {
        const Result<Done> flushed = flush();
        // Some file systems have nothing to put anywhere, and say EINVAL.
        const int error = flushed && _file->isRegular() ? _file->sync() : 0;
        if (error != 0 && error != EINVAL)
            _failure = failureOf("write", error);
        if (const int closeError = _file->close(); closeError != 0 && !_failure)
            _failure = failureOf("close", closeError);
        _file.reset();
    }
    if (_failure)
        return *_failure;
    return Done{};
}

Failure DLFWriter::failureOf(const char* operation, int error) const {
    return Failure{"cannot " + std::string(operation) + " " + _name + ": " +
                   std::generic_category().message(error)};
}

} // namespace velmora
