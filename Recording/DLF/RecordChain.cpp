// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/RecordChain.h"

#include "LogMessages/DLFVersionReport.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"

#include <algorithm>
#include <iterator>
#include <vector>

namespace velmora {

bool RecordChain::mayHave(Lead lead) const {
    return _layout == Layout::DLF || (lead != Lead::Nothing && lead != Lead::CutPrefix);
}

bool RecordChain::beginsSurely() {
    // One of these bytes may be wrong: the report is damaged then, and the log after it need not be.
    constexpr std::uint8_t report[] = {dlfVersionReportSize, 0, dlfVersionReportCode & 0xFF,
                                       dlfVersionReportCode >> 8};
    std::size_t right = 0;
    if (_input.ensure(std::size(report)))
        for (std::size_t i = 0; i < std::size(report); ++i)
            right += _input.available()[i] == report[i];
    return right + 1 >= std::size(report) || isSureAt(0, _weights.sure);
}

std::optional<RecordChain::Record> RecordChain::next() {
    _input.skip(std::exchange(_present, 0));
    while (_input.ensure(1)) {
        const Survey here = survey();
        // Unless both ends of it are sure, one record may lead to another by chance: a damaged length hits a
        // record now and then, and after a message that was cut short one may end where its length says.
        if (here.linked && (std::min(here.linked->evidence, here.linked->onward) >= _weights.sure ||
                            !holdsBetter(*here.linked)))
            return take(*here.linked);
        // Either this record's length is wrong, or what follows it is damaged: a sure record that begins
        // within it shows which.
        if (!here.linked && here.plain && !holdsBetter(*here.plain))
            return take(*here.plain);
        skipDamage(here);
    }
    return std::nullopt;
}

RecordChain::Survey RecordChain::survey() {
    Survey found;
    const auto keepBetter = [](std::optional<RecordCandidate>& kept, const RecordCandidate& other) {
        if (!kept || other.total() > kept->total())
            kept = other;
    };
    for (const Lead lead : everyLead) {
        std::optional<RecordCandidate> candidate = candidateAt(0, lead, _timestamp);
        if (!candidate)
            continue;
        const bool isWhole = judge(0, *candidate);
        if (isWhole && candidate->onward >= _weights.goodEnd && candidate->total() >= _weights.expected)
            keepBetter(found.linked, *candidate);
        if (candidate->evidence >= _weights.expected && lead != Lead::OtherType)
            keepBetter(isWhole ? found.plain : found.cutOff, *candidate);
    }
    return found;
}

/// The record that the bytes at `at` are with that lead; see RecordCandidate::read.
std::optional<RecordCandidate> RecordChain::candidateAt(std::size_t at, Lead lead,
                                                        std::optional<std::uint64_t> nearby) {
    if (!mayHave(lead) || !_input.ensure(at + sizeOf(lead) + RecordCandidate::bareHeaderLength))
        return std::nullopt;
    return RecordCandidate::read(_input.available().subspan(at), lead, nearby, _weights);
}

/// The most evidence of any record that may begin at `at`.
int RecordChain::evidenceAt(std::size_t at, std::optional<std::uint64_t> nearby) {
    int most = 0;
    for (const Lead lead : everyLead) {
        if (const std::optional<RecordCandidate> candidate = candidateAt(at, lead, nearby))
            most = std::max(most, candidate->evidence);
    }
    return most;
}

/// Weighs what stands where the candidate at `at` ends. False if that is past the end of the input.
bool RecordChain::judge(std::size_t at, RecordCandidate& candidate) {
    const std::size_t end = at + candidate.size;
    if (!_input.ensure(end))
        return false;
    const bool hasTime = candidate.timestamp != 0 && isRecordTime(candidate.timestamp);
    candidate.onward = _input.ensure(end + 1) ? evidenceAt(end, hasTime ? candidate.timestamp : _timestamp)
                                              : _weights.endOfInput;
    return true;
}

/// Whether a record surely begins at `at`, where none is expected.
bool RecordChain::isSureAt(std::size_t at, int least) {
    for (const Lead lead : everyLead) {
        // Any byte before a record's type may be half a prefix, and any byte is a type of no stream.
        if (lead == Lead::CutPrefix || lead == Lead::OtherType)
            continue;
        std::optional<RecordCandidate> candidate = candidateAt(at, lead, _timestamp);
        // Any two bytes may be a length: what they lead to is looked at only with some evidence.
        if (!candidate || (lead == Lead::Nothing && candidate->evidence < 0))
            continue;
        if (judge(at, *candidate) && candidate->onward >= _weights.goodEnd && candidate->total() >= least)
            return true;
    }
    return false;
}

/// Whether a sure record with more evidence begins within the candidate.
bool RecordChain::holdsBetter(const RecordCandidate& candidate) {
    // Where another record follows, the candidate's last bytes may look like that record's lead.
    const std::size_t margin = candidate.onward >= _weights.goodEnd ? sizeOf(Lead::Prefix) : 0;
    const int least = std::max(_weights.sure, candidate.total() + 1);
    for (std::size_t at = 1; at + margin < candidate.size; ++at) {
        if (isSureAt(at, least))
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
    std::vector<std::uint8_t> bytes;
    bytes.reserve(candidate.size + 1);
    bytes.push_back(*missing);
    const Bytes rest = _input.available().first(candidate.size);
    bytes.insert(bytes.end(), rest.begin(), rest.end());
    record.message = Data(std::move(bytes));
    return record;
}

/// Skips what is no record, up to the next sure one.
void RecordChain::skipDamage(const Survey& survey) {
    Loss loss;
    loss.offset = _input.offset();
    const bool isShort = !survey.plain && !survey.cutOff &&
                         !_input.ensure(LogMessage::prefixLength + LogMessage::headerLength);
    bool found = false;
    while (!found && _input.ensure(1)) {
        _input.skip(1);
        found = _input.ensure(1) && isSureAt(0, _weights.sure);
    }
    loss.bytes = _input.offset() - loss.offset;
    const std::optional<RecordCandidate>& header = survey.plain ? survey.plain : survey.cutOff;
    if (isShort && !found)
        loss.reason = std::to_string(loss.bytes) + " bytes at the end, wanted a record of " +
                      std::to_string(_layout == Layout::DLF ? RecordCandidate::bareHeaderLength
                                                            : LogMessage::headerLength) +
                      " at least";
    else if (!found && survey.cutOff)
        loss.reason = "record cut off after " + std::to_string(loss.bytes) + " of " +
                      std::to_string(survey.cutOff->size) + " bytes";
    else if (header)
        loss.reason = "record length " + std::to_string(header->length) + " does not lead to another record";
    else
        loss.reason = "no log record";
    // Raw material is whole; a log's writer may have stopped in the middle of a record.
    loss.isTail = !found && (isShort || survey.cutOff) && _layout == Layout::DLF && !_input.failure();
    if (_loss) // two stretches of one damage
        _loss->bytes += loss.bytes;
    else
        _loss = std::move(loss);
}

} // namespace velmora
