// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/RecordChain.h"

#include "LogMessages/DLFVersionReport.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"

#include <algorithm>
#include <iterator>
#include <limits>
#include <utility>

namespace velmora {

bool RecordChain::allows(Framing framing) const {
    return _layout == Layout::DLF || (framing != Framing::Nothing && framing != Framing::PartialPrefix);
}

bool RecordChain::looksLikeRecords() {
    // One of these bytes may be wrong: the report is damaged then, and the log after it need not be.
    constexpr std::uint8_t report[] = {dlfVersionReportSize, 0, dlfVersionReportCode & 0xFF,
                                       dlfVersionReportCode >> 8};
    std::size_t right = 0;
    if (_input.ensure(std::size(report)))
        for (std::size_t i = 0; i < std::size(report); ++i)
            right += _input.available()[i] == report[i];
    return right + 1 >= std::size(report) || isConvincingAt(0, _weights.sure, _timestamp);
}

std::optional<RecordChain::Record> RecordChain::next() {
    _input.skip(std::exchange(_present, 0));
    while (_input.ensure(1)) {
        if (const std::optional<RecordCandidate> record = evident())
            return take(*record);
        const Survey here = survey();
        // Unless both ends of it are sure, one record may lead to another by chance: a damaged length hits
        // a record now and then, and after a message that was cut short one may end where its length says.
        if (here.linked && (std::min(here.linked->score, here.linked->followerScore) >= _weights.sure ||
                            !containsBetterRecord(*here.linked)))
            return take(*here.linked);
        // Either this record's length is wrong, or what follows it is damaged: a sure record that begins
        // within it shows which.
        if (!here.linked && here.plain && !containsBetterRecord(*here.plain))
            return take(*here.plain);
        skipDamage(here);
    }
    return std::nullopt;
}

/// The candidates at `at`, compared by what they score themselves. Absent near the input's end too.
std::optional<RecordChain::Ranking> RecordChain::rankAt(std::size_t at, std::optional<std::uint64_t> nearby) {
    if (!_input.ensure(at + sizeOf(Framing::Prefix) + RecordCandidate::bareHeaderLength))
        return std::nullopt;
    const Bytes bytes = _input.available().subspan(at);
    std::optional<Ranking> ranking;
    int others = std::numeric_limits<int>::min() / 2;
    for (const Framing framing : allFramings) {
        if (!allows(framing))
            continue;
        const std::optional<RecordCandidate> candidate =
            RecordCandidate::read(bytes, framing, nearby, _weights);
        if (candidate && ranking && candidate->score <= ranking->best.score) {
            others = std::max(others, candidate->score);
        } else if (candidate) {
            others = ranking ? ranking->best.score : others;
            ranking = Ranking{*candidate, others};
        }
    }
    if (ranking)
        ranking->others = others;
    return ranking;
}

/// The record that `survey` would find and `next` take as it is, at a fraction of the cost: it is sure and so
/// is what follows it, and no other candidate could score as much with whatever follows that. Absent where it
/// takes more to say.
std::optional<RecordCandidate> RecordChain::evident() {
    std::optional<Ranking> here = std::exchange(_follower, std::nullopt);
    if (!here)
        here = rankAt(0, _timestamp);
    if (!here || here->best.score < _weights.sure)
        return std::nullopt;
    RecordCandidate& record = here->best;
    const std::optional<Ranking> follower =
        rankAt(record.size, record.hasTime() ? record.timestamp : _timestamp);
    if (!follower || follower->best.score < std::max(_weights.sure, _weights.goodFollower))
        return std::nullopt;
    record.followerScore = follower->best.score;
    if (record.total() < _weights.expected || here->others + _weights.mostOfFollower() >= record.total())
        return std::nullopt;
    _follower = follower;
    return record;
}

RecordChain::Survey RecordChain::survey() {
    Survey found;
    const auto keepBetter = [](std::optional<RecordCandidate>& kept, const RecordCandidate& other) {
        if (!kept || other.total() > kept->total())
            kept = other;
    };
    for (const Framing framing : allFramings) {
        std::optional<RecordCandidate> candidate = candidateAt(0, framing, _timestamp);
        if (!candidate)
            continue;
        const bool isWhole = scoreFollower(0, *candidate);
        if (isWhole && candidate->followerScore >= _weights.goodFollower &&
            candidate->total() >= _weights.expected)
            keepBetter(found.linked, *candidate);
        if (candidate->score >= _weights.expected && framing != Framing::OtherType)
            keepBetter(isWhole ? found.plain : found.truncated, *candidate);
    }
    return found;
}

/// The record that the bytes at `at` are with that framing; see RecordCandidate::read.
std::optional<RecordCandidate> RecordChain::candidateAt(std::size_t at, Framing framing,
                                                        std::optional<std::uint64_t> nearby) {
    if (!allows(framing) || !_input.ensure(at + sizeOf(framing) + RecordCandidate::bareHeaderLength))
        return std::nullopt;
    return RecordCandidate::read(_input.available().subspan(at), framing, nearby, _weights);
}

/// The most score of any record that may begin at `at`.
int RecordChain::scoreAt(std::size_t at, std::optional<std::uint64_t> nearby) {
    int most = 0;
    for (const Framing framing : allFramings) {
        if (const std::optional<RecordCandidate> candidate = candidateAt(at, framing, nearby))
            most = std::max(most, candidate->score);
    }
    return most;
}

/// Scores what follows the candidate at `at`. False if that is past the end of the input.
bool RecordChain::scoreFollower(std::size_t at, RecordCandidate& candidate) {
    const std::size_t end = at + candidate.size;
    if (!_input.ensure(end))
        return false;
    candidate.followerScore = _input.ensure(end + 1)
                                  ? scoreAt(end, candidate.hasTime() ? candidate.timestamp : _timestamp)
                                  : _weights.endOfInput;
    return true;
}

/// Whether a record surely begins at `at`, where none is expected.
bool RecordChain::isConvincingAt(std::size_t at, int least, std::optional<std::uint64_t> nearby) {
    for (const Framing framing : allFramings) {
        // Any byte before a record's type may be half a prefix, and any byte is a type of no stream.
        if (framing == Framing::PartialPrefix || framing == Framing::OtherType)
            continue;
        std::optional<RecordCandidate> candidate = candidateAt(at, framing, nearby);
        // Any two bytes may be a length: what they lead to is read only with some score.
        if (!candidate || (framing == Framing::Nothing && candidate->score < 0))
            continue;
        if (scoreFollower(at, *candidate) && candidate->followerScore >= _weights.goodFollower &&
            candidate->total() >= least)
            return true;
    }
    return false;
}

/// Whether a sure record with more score begins within the candidate.
bool RecordChain::containsBetterRecord(const RecordCandidate& candidate) {
    // Where another record follows, the candidate's last bytes may look like that record's framing.
    const std::size_t margin = candidate.followerScore >= _weights.goodFollower ? sizeOf(Framing::Prefix) : 0;
    const int least = std::max(_weights.sure, candidate.total() + 1);
    // Where no record has had a time yet, the candidate's counts for what has bytes of its own for a time:
    // zeros in a payload would otherwise be more likely a record's stamp than the time of the record that
    // they are in.
    const bool isFirstTime =
        _timestamp.value_or(0) == 0 && candidate.hasTime() && candidate.score >= _weights.goodFollower;
    const std::size_t ownTime = sizeOf(candidate.framing) + sizeof candidate.timestamp;
    // The last byte of a time stamp of these years looks like a type, which is no evidence there: two
    // payloads that begin alike would otherwise be records whose times support each other.
    const std::size_t typeOfTime = sizeOf(candidate.framing) + RecordCandidate::bareHeaderLength - 1;
    for (std::size_t at = 1; at + margin < candidate.size; ++at) {
        const int leastHere = least + (isFirstTime && at == typeOfTime ? _weights.type : 0);
        if (isConvincingAt(at, leastHere, isFirstTime && at >= ownTime ? candidate.timestamp : _timestamp))
            return true;
    }
    return false;
}

RecordChain::Record RecordChain::take(const RecordCandidate& candidate) {
    _present = candidate.size;
    if (isRecordTime(candidate.timestamp) && (candidate.timestamp != 0 || !_timestamp))
        _timestamp = candidate.timestamp;
    Record record;
    record.offset = _input.offset();
    record.timestamp = candidate.timestamp;
    record.isVersionReport = candidate.isVersionReport();
    const std::optional<std::uint8_t> missing = candidate.missingByte();
    if (!missing) {
        record.message = _input.part(0, candidate.size);
        return record;
    }
    record.message = _restored.add(*missing, _input.available().first(candidate.size));
    return record;
}

/// Skips what is no record, up to the next sure one.
void RecordChain::skipDamage(const Survey& survey) {
    Loss loss;
    loss.offset = _input.offset();
    const bool isShort = !survey.plain && !survey.truncated &&
                         !_input.ensure(LogMessage::prefixLength + LogMessage::headerLength);
    bool found = false;
    while (!found && _input.ensure(1)) {
        _input.skip(1);
        found = _input.ensure(1) && isConvincingAt(0, _weights.sure, _timestamp);
    }
    loss.bytes = _input.offset() - loss.offset;
    const std::optional<RecordCandidate>& header = survey.plain ? survey.plain : survey.truncated;
    if (isShort && !found)
        loss.reason = std::to_string(loss.bytes) + " bytes at the end, wanted a record of " +
                      std::to_string(_layout == Layout::DLF ? RecordCandidate::bareHeaderLength
                                                            : LogMessage::headerLength) +
                      " at least";
    else if (!found && survey.truncated)
        loss.reason = "record cut off after " + std::to_string(loss.bytes) + " of " +
                      std::to_string(survey.truncated->size) + " bytes";
    else if (header)
        loss.reason = "record length " + std::to_string(header->length) + " does not lead to another record";
    else
        loss.reason = "no log record";
    // Raw messages are complete; a log's writer may have stopped in the middle of a record.
    loss.isTruncation =
        !found && (isShort || survey.truncated) && _layout == Layout::DLF && !_input.failure();
    if (_loss) // two segments of the same damage
        _loss->bytes += loss.bytes;
    else
        _loss = std::move(loss);
}

} // namespace velmora
