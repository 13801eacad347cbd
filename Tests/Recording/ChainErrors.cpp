// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/ChainErrors.h"

#include "Recording/DLF/ImpliedType.h"
#include "Recording/Files/DataSource.h"

#include <algorithm>
#include <map>
#include <memory>
#include <optional>
#include <set>

namespace velmora {

namespace {

constexpr std::size_t runLength = 40;
constexpr std::size_t bufferLength = 8; ///< messages of one of the application's buffers

/// A record and the offset of its bytes.
struct Placed {
    std::size_t begin;
    std::size_t end;
    Data message;
};

struct Chain {
    std::vector<std::uint8_t> bytes;
    std::vector<Placed> records;
};

/// Evenly enough for this: the ranges are far smaller than the engine's.
std::size_t below(std::size_t bound, std::mt19937_64& random) {
    return static_cast<std::size_t>(random() % bound);
}

bool isFollowable(const Data& message) {
    const auto parsed = LogMessage::parse(message.bytes());
    return parsed && parsed->record.size() >= LogMessage::headerLength &&
           parsed->length() == parsed->record.size() - 1;
}

bool lacksFirstByte(const Data& message, std::size_t index, ChainForm form) {
    const auto parsed = LogMessage::parse(message.bytes());
    switch (form) {
    case ChainForm::RawMessages: return false;
    // A type that a reader cannot put back is damage, which is not to be counted here.
    case ChainForm::ApplicationLog:
        return index % bufferLength == 0 && (parsed->prefixed || parsed->type == impliedType(parsed->code));
    case ChainForm::CompactLog: return !parsed->prefixed && parsed->type == impliedType(parsed->code);
    }
    return false;
}

Chain chainOf(std::span<const Data> messages, ChainForm form) {
    Chain chain;
    for (std::size_t i = 0; i < messages.size(); ++i) {
        const Bytes kept = messages[i].bytes().subspan(lacksFirstByte(messages[i], i, form) ? 1 : 0);
        const std::size_t begin = chain.bytes.size();
        chain.bytes.insert(chain.bytes.end(), kept.begin(), kept.end());
        chain.records.push_back({begin, chain.bytes.size(), messages[i]});
    }
    return chain;
}

/// Bytes [at, at + removed) are replaced by `inserted` others.
struct Edit {
    std::size_t at = 0;
    std::size_t removed = 0;
    std::vector<std::uint8_t> inserted;
};

Edit editOf(ChainDamage damage, const Chain& chain, std::mt19937_64& random) {
    constexpr std::size_t longest = 64;
    Edit edit;
    edit.at = below(chain.bytes.size(), random);
    const std::size_t length = std::min(1 + below(longest, random), chain.bytes.size() - edit.at);
    switch (damage) {
    case ChainDamage::None: return edit;
    case ChainDamage::Bit:
        edit.removed = 1;
        edit.inserted = {static_cast<std::uint8_t>(chain.bytes[edit.at] ^ 1U << below(8, random))};
        return edit;
    case ChainDamage::Deleted: edit.removed = length; return edit;
    case ChainDamage::Zeroed:
        edit.removed = length;
        edit.inserted.resize(length);
        return edit;
    case ChainDamage::Overwritten: edit.removed = length; [[fallthrough]];
    case ChainDamage::Inserted:
        for (std::size_t i = 0; i < length; ++i)
            edit.inserted.push_back(static_cast<std::uint8_t>(random()));
        return edit;
    }
    return edit;
}

bool touches(const Edit& edit, const Placed& record) {
    if (edit.removed == 0 && edit.inserted.empty())
        return false;
    return edit.removed == 0 ? record.begin < edit.at && edit.at < record.end
                             : record.begin < edit.at + edit.removed && edit.at < record.end;
}

std::size_t after(const Edit& edit, std::size_t place) {
    return place < edit.at + edit.removed || place == 0 ? place : place - edit.removed + edit.inserted.size();
}

} // namespace

ChainErrors& ChainErrors::operator+=(const ChainErrors& other) {
    damages += other.damages;
    untouched += other.untouched;
    lost += other.lost;
    invented += other.invented;
    return *this;
}

static ChainErrors measureOne(Chain chain, ChainForm form, ChainDamage damage, const RecordWeights& weights,
                              std::mt19937_64& random) {
    const Edit edit = editOf(damage, chain, random);
    const auto at = chain.bytes.begin() + static_cast<std::ptrdiff_t>(edit.at);
    chain.bytes.insert(chain.bytes.erase(at, at + static_cast<std::ptrdiff_t>(edit.removed)),
                       edit.inserted.begin(), edit.inserted.end());

    std::map<std::uint64_t, Data> untouched;
    std::set<std::uint64_t> touched; // where the beginning of a damaged record still is
    for (const Placed& record : chain.records) {
        if (!touches(edit, record))
            untouched.emplace(after(edit, record.begin), record.message);
        else if (record.begin <= edit.at)
            touched.insert(record.begin);
    }
    ChainErrors errors;
    errors.damages = damage == ChainDamage::None ? 0 : 1;
    errors.untouched = untouched.size();
    const auto layout =
        form == ChainForm::RawMessages ? RecordChain::Layout::RawMessages : RecordChain::Layout::DLF;
    RecordChain reader(ChunkedInput(std::make_unique<DataSource>(Data(std::move(chain.bytes)))), layout,
                       weights);
    while (const std::optional<RecordChain::Record> record = reader.next()) {
        const auto written = untouched.find(record->offset);
        if (written != untouched.end() && written->second == record->message)
            untouched.erase(written);
        else if (!touched.contains(record->offset))
            ++errors.invented;
    }
    errors.lost = untouched.size();
    return errors;
}

ChainErrors measureChain(std::span<const Data> messages, ChainForm form, ChainDamage damage,
                         std::size_t count, const RecordWeights& weights, std::mt19937_64& random) {
    std::vector<Data> followable;
    std::copy_if(messages.begin(), messages.end(), std::back_inserter(followable), isFollowable);
    ChainErrors errors;
    for (std::size_t i = 0; i < count && followable.size() >= runLength; ++i) {
        const std::size_t first = below(followable.size() - runLength + 1, random);
        errors += measureOne(chainOf(std::span(followable).subspan(first, runLength), form), form, damage,
                             weights, random);
    }
    return errors;
}

ChainErrors measureNoise(std::size_t bytes, RecordChain::Layout layout, const RecordWeights& weights,
                         std::mt19937_64& random) {
    std::vector<std::uint8_t> noise(bytes);
    std::generate(noise.begin(), noise.end(), [&] { return static_cast<std::uint8_t>(random()); });
    RecordChain reader(ChunkedInput(std::make_unique<DataSource>(Data(std::move(noise)))), layout, weights);
    ChainErrors errors;
    while (reader.next())
        ++errors.invented;
    return errors;
}

} // namespace velmora
