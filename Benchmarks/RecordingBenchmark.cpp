// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/DescriptorFile.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/PcapngWriter.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <cstring>
#include <deque>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <benchmark/benchmark.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

namespace velmora {
namespace {

constexpr std::size_t messageSize = 64;
constexpr std::size_t messageCount = 1'000'000;

/// Reads memory, so that the disk is not what is measured.
class MemorySource final : public ByteSource {
public:
    explicit MemorySource(Bytes bytes) : _rest(bytes) {}
    Result<std::size_t> read(std::span<std::uint8_t> buffer) override {
        const std::size_t count = std::min(buffer.size(), _rest.size());
        if (count != 0)
            std::memcpy(buffer.data(), _rest.data(), count);
        _rest = _rest.subspan(count);
        return count;
    }

private:
    Bytes _rest;
};

/// A benchmark of something that fails would measure nothing.
void require(bool good) {
    if (!good)
        std::abort();
}

void write(PcapngWriter& writer, std::size_t count) {
    const std::vector<std::uint8_t> message(messageSize, 0x5A);
    for (std::size_t i = 0; i < count; ++i)
        require(bool(writer.append(Time(std::chrono::nanoseconds(i)), message)));
}

const std::vector<std::uint8_t>& recording() {
    static const std::vector<std::uint8_t> bytes = [] {
        const int file = ::memfd_create("recording", 0);
        auto writer = PcapngWriter::adopt(::dup(file), "memory", "Ostrel_LTE");
        write(**writer, messageCount);
        require(bool((*writer)->close()));
        std::vector<std::uint8_t> content(static_cast<std::size_t>(::lseek(file, 0, SEEK_END)));
        require(::pread(file, content.data(), content.size(), 0) == std::ssize(content));
        ::close(file);
        return content;
    }();
    return bytes;
}

void countMessages(benchmark::State& state, std::size_t count) {
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * static_cast<std::int64_t>(count));
}

void BM_Write(benchmark::State& state) {
    for (auto _ : state) {
        auto writer = PcapngWriter::create("/dev/null", "Ostrel_LTE");
        write(**writer, messageCount);
    }
    countMessages(state, messageCount);
}
BENCHMARK(BM_Write)->Unit(benchmark::kMillisecond);

/// Reads all messages, handing each to `use`.
template <class Use>
void read(benchmark::State& state, Use use) {
    for (auto _ : state) {
        auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(recording())));
        while (std::optional<LoggedMessage> message = (*reader)->next())
            use(*std::move(message));
    }
    countMessages(state, messageCount);
}

void BM_Read(benchmark::State& state) {
    read(state, [](LoggedMessage&& message) { benchmark::DoNotOptimize(message.message.bytes()[0]); });
}
BENCHMARK(BM_Read)->Unit(benchmark::kMillisecond);

/// A reader whose messages each get memory of their own, for comparison.
void BM_ReadCopying(benchmark::State& state) {
    read(state, [](LoggedMessage&& message) {
        const Data copy = Data::copyOf(message.message.bytes());
        benchmark::DoNotOptimize(copy.bytes()[0]);
    });
}
BENCHMARK(BM_ReadCopying)->Unit(benchmark::kMillisecond);

/// The latest messages are held, so that chunks cannot be used again at once.
void BM_ReadHolding(benchmark::State& state) {
    std::deque<LoggedMessage> held;
    read(state, [&held](LoggedMessage&& message) {
        held.push_back(std::move(message));
        if (held.size() > 100)
            held.pop_front();
    });
}
BENCHMARK(BM_ReadHolding)->Unit(benchmark::kMillisecond);

/// How long syncing 64 KiB to the disk of the working directory blocks a recorder's event loop.
template <class Save>
void save(benchmark::State& state, Save save) {
    const std::string path = "recording-benchmark-" + std::to_string(::getpid());
    const int descriptor = ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0600);
    require(descriptor >= 0);
    ::unlink(path.c_str());
    DescriptorFile file(descriptor, true);
    const std::vector<std::uint8_t> blocks(std::size_t{64} << 10, 0x5A);
    for (auto _ : state) {
        state.PauseTiming();
        require(file.write(blocks).bytes == blocks.size());
        state.ResumeTiming();
        save(file);
        state.PauseTiming();
        require(file.sync() == 0); // so that every round finds the disk at rest
        state.ResumeTiming();
    }
}

void BM_SaveStarting(benchmark::State& state) {
    save(state, [](DescriptorFile& file) { file.startSync(); });
}
BENCHMARK(BM_SaveStarting)->Unit(benchmark::kMicrosecond)->UseRealTime()->Iterations(100);

void BM_SaveWaiting(benchmark::State& state) {
    save(state, [](DescriptorFile& file) { require(file.sync() == 0); });
}
BENCHMARK(BM_SaveWaiting)->Unit(benchmark::kMicrosecond)->UseRealTime()->Iterations(100);

} // namespace
} // namespace velmora
