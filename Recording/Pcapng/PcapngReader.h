// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/ChunkedInput.h"
#include "Recording/MessageReader.h"
#include "Recording/Pcapng/BlockReader.h"
#include "Recording/Pcapng/InterfaceDescription.h"
#include "Recording/Pcapng/JoinedMessage.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// Reads a recording: a pcapng file whose packets, on interfaces of link type 147, are log messages.
///
/// Reads recordings also after capture tools have cut and merged them: both byte orders, several sections and
/// interfaces, any time resolution, all three kinds of packet blocks; other blocks are skipped. An
/// interface's name is its technology. The first one named is the recording's; messages of interfaces without
/// a name belong to it as well, those of another technology are losses unless all technologies are read.
/// Packets of interfaces of link type 148 with the name "NMEA" are a receiver's sentences. Interfaces of
/// other link types are counted and otherwise ignored.
///
/// Where a block is damaged, reading resumes at the next block that is not. Memory is bounded for any
/// content; a message is a window on the reader's chunk and keeps that alive: copy messages that are kept for
/// long. A message's number is the packet's in the file, as capture tools count. Main thread only.
///
/// For a copy of the file, `setOtherBlocks` gives what is neither a message nor lost, and `block` the block
/// of a message.
class PcapngReader final : public MessageReader {
    struct Interface {
        enum class Use : std::uint8_t { Messages, OtherTechnology, Positions, OtherLinkType, Unreadable };
        Use use = Use::Messages;
        std::uint32_t technology = 0; ///< its index; of messages
        InterfaceDescription description;
    };

public:
    /// What was skipped because it is not a log message.
    struct PassedOver {
        std::uint64_t interfaces = 0; ///< of another link type
        std::uint64_t packets = 0;    ///< on such interfaces
    };

    /// How many technologies of a file are read; messages of further ones are losses.
    static constexpr std::size_t maximumTechnologies = 16;

    /// Opens a file, "-" being standard input, and reads up to its first interface of log messages, or its
    /// first packet. Fails when it cannot be read or is no pcapng file; the reason does not repeat the path.
    static Result<std::unique_ptr<PcapngReader>> open(const std::string& path);
    /// As above, for an input of which nothing has been skipped.
    static Result<std::unique_ptr<PcapngReader>> open(ChunkedInput input);

    [[nodiscard]] std::optional<LoggedMessage> next() override;
    [[nodiscard]] const std::string& technology() const override { return _technologies.front(); }
    [[nodiscard]] std::vector<std::string> technologies() const override;
    void setReadsAllTechnologies(bool all) override { _readsAllTechnologies = all; }
    void setSentences(PositionSentences sentences) override { _sentences = std::move(sentences); }
    [[nodiscard]] const std::optional<Failure>& failure() const override { return _blocks.failure(); }
    [[nodiscard]] const PassedOver& passedOver() const { return _passedOver; }

    /// Where a reader stands between two messages, and what it knows of the file by then.
    struct Place {
        std::uint64_t offset = 0; ///< of the next block
        bool bigEndian = false;
        std::vector<Interface> interfaces;
        std::vector<std::string> technologies;
        std::uint64_t packets = 0;
        std::uint64_t sections = 0;
        std::uint64_t interfaceCount = 0;
        Time lastTime{};
    };
    [[nodiscard]] Place place() const;
    /// A reader of the same file that begins at the place, which is where the input begins. It reports the
    /// losses and comments from there on.
    [[nodiscard]] static std::unique_ptr<PcapngReader> resume(ChunkedInput input, const Place& place);

    using Block = BlockReader::Block;
    /// Passes on all blocks that hold no message and are not damaged, in the file's order between the
    /// messages: section headers, interface descriptions, blocks that are not known here, packets of other
    /// link types and technologies. What `setSentences` gives is a sentence of the next of these. Call it
    /// before the first `next`; it gets those that have been read to open the file at once.
    void setOtherBlocks(std::function<void(const Block&)> otherBlocks);
    /// The block of the message that `next` last returned, with the bytes of all where it has several, until
    /// the next call. Precondition: it returned one.
    [[nodiscard]] const Block& block() const { return *_messageBlock; }

private:
    /// A packet block's fields, whichever of the three kinds it is.
    struct Packet {
        std::uint32_t interface = 0;
        bool hasStamp = false; ///< simple packets have none
        std::uint64_t stamp = 0;
        std::size_t offset = 0;     ///< where in the block its bytes begin
        std::uint32_t captured = 0; ///< bytes in the block
        std::uint32_t original = 0; ///< bytes of the message
    };

    explicit PcapngReader(ChunkedInput input, bool bigEndian = false)
        : _blocks(std::move(input), bigEndian) {}

    [[nodiscard]] const Block* nextBlock();
    /// The index of the technology, which is added where it is new; none above the most that are read.
    [[nodiscard]] std::optional<std::uint32_t> technologyIndex(std::string_view name);
    void readBlock(const Block& block);
    void addInterface(const Block& block);
    /// Adds the comments among the block's options, which begin at that offset of it.
    void readComments(const Block& block, std::size_t options, Comment::About about, std::uint64_t number);
    void passOn(const Block& block);
    /// Passes on a packet's sentence, unless it is damaged: that is no lost message.
    void readSentence(const Block& block, const Packet& packet, const InterfaceDescription& interface);
    /// Reads a packet's message, unless the packet is ignored or a loss.
    void readMessage(const Block& block, std::optional<LoggedMessage>& message);
    [[nodiscard]] bool join(const Block& block, const Packet& packet);
    [[nodiscard]] Packet packetOf(const Block& block) const;
    [[nodiscard]] std::string packetProblem(const Packet& packet, const Block& block) const;
    void addLossOf(const Block& block, std::uint64_t number, std::string reason);

    BlockReader _blocks;
    const Block* _waiting = nullptr; ///< the packet that `open` stopped at
    const Block* _messageBlock = nullptr;
    std::optional<JoinedMessage> _joined; ///< the last one of several blocks
    /// Copies of the blocks that `open` read, until there is somewhere to pass them on to.
    std::vector<std::pair<Block, std::vector<std::uint8_t>>> _head;
    std::size_t _headSize = 0;
    bool _isOpening = true;
    std::function<void(const Block&)> _otherBlocks;
    PositionSentences _sentences;
    std::uint64_t _sectionCount = 0;
    std::uint64_t _interfaceCount = 0;                     ///< in all sections
    std::vector<Interface> _interfaces;                    ///< of the present section
    bool _foundInterface = false;                          ///< an interface of log messages has been read
    std::vector<std::string> _technologies{std::string()}; ///< the first is empty while none has been named
    bool _readsAllTechnologies = false;
    std::uint64_t _packets = 0; ///< packet blocks read
    Time _lastTime{};
    PassedOver _passedOver;
};

} // namespace velmora
