// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/RecordChain.h"

#include "LogMessages/DLFVersionReport.h"
#include "LogMessages/FieldReader.h"
#include "LogMessages/LogCodes.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"

#include <algorithm>
#include <iterator>
#include <vector>

namespace velmora {

namespace {

/// A record less its type byte: length, code, time stamp.
constexpr std::size_t bareHeader = LogMessage::headerLength - 1;
constexpr std::uint16_t lastExtraCode = 2;
constexpr std::uint32_t extraStream = 0xFF0000;

/// How much speaks for a place being a record, roughly in bits: how much rarer it is among other bytes.
namespace Evidence {
constexpr int type = 7;
constexpr int prefix = 8;
constexpr int wantedCode = 8;
constexpr int versionReport = 30;
constexpr int nearTimestamp = 20;
/// Ten zeros in a row are not that rare; among zeros they are what is to be expected.
constexpr int zeroAmongZeros = 10;
constexpr int zeroAmongTimes = 0;
constexpr int farTimestamp = -4;
constexpr int badTimestamp = -4;
constexpr int endOfInput = 12;
/// What the end of a record must show for it to be believed at once, where one is expected.
constexpr int goodEnd = 4;
constexpr int expected = 8;
/// What it takes where none is expected.
constexpr int sure = 20;
} // namespace Evidence

bool isStream(std::uint8_t type) {
    return type == LogMessage::basebandType || type == LogMessage::extraType;
}

/// `nearby`: the time stamp of a record close to it.
int evidenceOfTimestamp(std::uint64_t timestamp, std::optional<std::uint64_t> nearby) {
    constexpr std::uint64_t day = std::uint64_t{86'400} * 800; // in units of 1.25 ms
    if (timestamp == 0)
        return nearby.value_or(0) == 0 ? Evidence::zeroAmongZeros : Evidence::zeroAmongTimes;
    if (!isRecordTime(timestamp))
        return Evidence::badTimestamp;
    if (nearby.value_or(0) == 0)
        return 0;
    const auto [less, more] = std::minmax({timestamp >> 16, *nearby >> 16}); // by value: both are temporaries
    return more - less <= day ? Evidence::nearTimestamp : Evidence::farTimestamp;
}

} // namespace

bool RecordChain::Candidate::isVersionReport() const {
    return lead == Lead::Nothing && code == dlfVersionReportCode && length == dlfVersionReportSize;
}

std::size_t RecordChain::sizeOf(Lead lead) {
    switch (lead) {
    case Lead::Nothing: return 0;
    case Lead::Type:
    case Lead::OtherType: return 1;
    case Lead::CutPrefix: return LogMessage::prefixLength;
    case Lead::Prefix: return LogMessage::prefixLength + 1;
    }
    return 0;
}

bool RecordChain::mayHave(Lead lead) const {
    return _layout == Layout::DLF || (lead != Lead::Nothing && lead != Lead::CutPrefix);
}

bool RecordChain::beginsSurely() {
    // A report with one byte of these wrong is damaged, and the log behind it need not be.
    constexpr std::uint8_t report[] = {dlfVersionReportSize, 0, dlfVersionReportCode & 0xFF,
                                       dlfVersionReportCode >> 8};
    std::size_t right = 0;
    if (_input.ensure(std::size(report)))
        for (std::size_t i = 0; i < std::size(report); ++i)
            right += _input.available()[i] == report[i];
    return right + 1 >= std::size(report) || isSureAt(0, Evidence::sure);
}

std::optional<RecordChain::Record> RecordChain::next() {
    _input.skip(std::exchange(_present, 0));
    while (_input.ensure(1)) {
        const Survey here = survey();
        // Unless both ends of it are sure, it may be by chance that one record leads to another: a damaged
        // length has its hits, and behind a message that was cut short a record may end where its length
        // says.
        if (here.linked && (std::min(here.linked->evidence, here.linked->onward) >= Evidence::sure ||
                            !holdsBetter(*here.linked)))
            return take(*here.linked);
        // Either this record's length does not hold, or something is wrong with what follows it: a sure
        // record that begins within it shows which.
        if (!here.linked && here.plain && !holdsBetter(*here.plain))
            return take(*here.plain);
        passDamage(here);
    }
    return std::nullopt;
}

RecordChain::Survey RecordChain::survey() {
    Survey found;
    const auto keepBetter = [](std::optional<Candidate>& kept, const Candidate& other) {
        if (!kept || other.total() > kept->total())
            kept = other;
    };
    for (const Lead lead : everyLead) {
        std::optional<Candidate> candidate = candidateAt(0, lead, _timestamp);
        if (!candidate)
            continue;
        const bool isWhole = judge(0, *candidate);
        if (isWhole && candidate->onward >= Evidence::goodEnd && candidate->total() >= Evidence::expected)
            keepBetter(found.linked, *candidate);
        if (candidate->evidence >= Evidence::expected && lead != Lead::OtherType)
            keepBetter(isWhole ? found.plain : found.cutOff, *candidate);
    }
    return found;
}

/// The record that the bytes at `at` are with that lead; none where the header does not fit into the input or
/// cannot be one.
std::optional<RecordChain::Candidate> RecordChain::candidateAt(std::size_t at, Lead lead,
                                                               std::optional<std::uint64_t> nearby) {
    const std::size_t leadSize = sizeOf(lead);
    if (!mayHave(lead) || !_input.ensure(at + leadSize + bareHeader))
        return std::nullopt;
    const Bytes bytes = _input.available().subspan(at);
    const std::uint8_t type = leadSize == 0 ? LogMessage::basebandType : bytes[leadSize - 1];
    Candidate candidate;
    candidate.lead = lead;
    switch (lead) {
    case Lead::Nothing: break;
    case Lead::Prefix:
        if (bytes[0] != LogMessage::prefixMarker)
            return std::nullopt;
        candidate.evidence = Evidence::prefix + (isStream(type) ? Evidence::type : 0);
        break;
    case Lead::OtherType:
        if (isStream(type))
            return std::nullopt;
        break;
    case Lead::Type:
    case Lead::CutPrefix:
        if (!isStream(type))
            return std::nullopt;
        candidate.evidence = Evidence::type;
        break;
    }
    FieldReader fields(bytes.subspan(leadSize, bareHeader), false);
    candidate.length = fields.u16(0);
    if (candidate.length < bareHeader)
        return std::nullopt;
    candidate.size = leadSize + candidate.length;
    candidate.code = fields.u16(2);
    candidate.timestamp = fields.u64(4);
    candidate.evidence += evidenceOfTimestamp(candidate.timestamp, nearby);
    const std::uint32_t stream = type == LogMessage::extraType ? extraStream : 0;
    if (candidate.isVersionReport())
        candidate.evidence += Evidence::versionReport;
    // Zeros that count as no time do not count as a code of the extra stream besides.
    else if (technologiesOfCode(stream + candidate.code) != 0 && (candidate.code | candidate.timestamp) != 0)
        candidate.evidence += Evidence::wantedCode;
    return candidate;
}

/// How much speaks for any record beginning at `at`.
int RecordChain::evidenceAt(std::size_t at, std::optional<std::uint64_t> nearby) {
    int most = 0;
    for (const Lead lead : everyLead) {
        if (const std::optional<Candidate> candidate = candidateAt(at, lead, nearby))
            most = std::max(most, candidate->evidence);
    }
    return most;
}

/// Looks at where the candidate at `at` ends. False when that is past the end of the input.
bool RecordChain::judge(std::size_t at, Candidate& candidate) {
    const std::size_t end = at + candidate.size;
    if (!_input.ensure(end))
        return false;
    const bool hasTime = candidate.timestamp != 0 && isRecordTime(candidate.timestamp);
    candidate.onward = _input.ensure(end + 1) ? evidenceAt(end, hasTime ? candidate.timestamp : _timestamp)
                                              : Evidence::endOfInput;
    return true;
}

/// Whether a record begins at `at` though none is to be expected there.
bool RecordChain::isSureAt(std::size_t at, int least) {
    for (const Lead lead : everyLead) {
        // A byte before any record's type may be half a prefix, and any byte a type that is none.
        if (lead == Lead::CutPrefix || lead == Lead::OtherType)
            continue;
        std::optional<Candidate> candidate = candidateAt(at, lead, _timestamp);
        // Where any two bytes may be a length, a look at what they lead to needs some ground.
        if (!candidate || (lead == Lead::Nothing && candidate->evidence < 0))
            continue;
        if (judge(at, *candidate) && candidate->onward >= Evidence::goodEnd && candidate->total() >= least)
            return true;
    }
    return false;
}

/// Whether a sure record begins within the candidate, which begins here, and for which less speaks.
bool RecordChain::holdsBetter(const Candidate& candidate) {
    // Where another record follows, the candidate's last bytes may look as what stands before its length.
    const std::size_t margin = candidate.onward >= Evidence::goodEnd ? sizeOf(Lead::Prefix) : 0;
    const int least = std::max(Evidence::sure, candidate.total() + 1);
    for (std::size_t at = 1; at + margin < candidate.size; ++at) {
        if (isSureAt(at, least))
            return true;
    }
    return false;
}

RecordChain::Record RecordChain::take(const Candidate& candidate) {
    _present = candidate.size;
    if (isRecordTime(candidate.timestamp) && (candidate.timestamp != 0 || !_timestamp))
        _timestamp = candidate.timestamp;
    Record record;
    record.offset = _input.offset();
    record.timestamp = candidate.timestamp;
    record.isVersionReport = candidate.isVersionReport();
    std::optional<std::uint8_t> missing;
    if (candidate.lead == Lead::Nothing)
        missing = candidate.code <= lastExtraCode ? LogMessage::extraType : LogMessage::basebandType;
    else if (candidate.lead == Lead::CutPrefix)
        missing = LogMessage::prefixMarker;
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

/// Passes over what is no record, up to the next sure one.
void RecordChain::passDamage(const Survey& survey) {
    Loss loss;
    loss.offset = _input.offset();
    const bool isShort = !survey.plain && !survey.cutOff &&
                         !_input.ensure(LogMessage::prefixLength + LogMessage::headerLength);
    bool found = false;
    while (!found && _input.ensure(1)) {
        _input.skip(1);
        found = _input.ensure(1) && isSureAt(0, Evidence::sure);
    }
    loss.bytes = _input.offset() - loss.offset;
    const std::optional<Candidate>& header = survey.plain ? survey.plain : survey.cutOff;
    if (isShort && !found)
        loss.reason = std::to_string(loss.bytes) + " bytes at the end, wanted a record of " +
                      std::to_string(_layout == Layout::DLF ? bareHeader : LogMessage::headerLength) +
                      " at least";
    else if (!found && survey.cutOff)
        loss.reason = "record cut off after " + std::to_string(loss.bytes) + " of " +
                      std::to_string(survey.cutOff->size) + " bytes";
    else if (header)
        loss.reason = "record length " + std::to_string(header->length) + " does not lead to another record";
    else
        loss.reason = "no log record";
    // Raw material is whole; a log may have been left off by its writer.
    loss.isTail = !found && (isShort || survey.cutOff) && _layout == Layout::DLF && !_input.failure();
    if (_loss) // two stretches of one damage
        _loss->bytes += loss.bytes;
    else
        _loss = std::move(loss);
}

} // namespace velmora
