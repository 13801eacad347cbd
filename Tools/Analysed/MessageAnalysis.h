// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string_view>

namespace velmora {

/// A message that its decoder could not decode.
struct UndecodedReport {
    MessageNumber message;
    Time time; ///< by the clock of the analysis
    Time arrival;
    std::string_view reason;
};

/// A part of an input that gave no messages: a damaged or truncated one.
struct InputLoss {
    MessageNumber at; ///< the lost record, or the next one where its number is unknown
    std::string_view reason;
};

/// A comment on a message, which is the latest one.
struct InputNote {
    MessageNumber at;
    std::string_view text;
};

/// What the messages of one technology are passed to, in their order and from file to file.
class MessageAnalysis {
public:
    virtual ~MessageAnalysis() = default;

    virtual void report(const MessageReport& report) = 0;
    /// Whether it uses what messages report of the leaf, and the row keys of lists: what it does not use is
    /// not observed. It uses all by default.
    [[nodiscard]] virtual bool wants(const CatalogueField& /*leaf*/) const { return true; }
    [[nodiscard]] virtual bool wantsRowKeys() const { return true; }
    virtual void reportUndecoded(const UndecodedReport& /*report*/) {}
    /// Messages may be missing between the latest one and the next. Passed to the analysis of every
    /// technology, since a lost record's is unknown.
    virtual void reportLoss(const InputLoss& /*loss*/) {}
    virtual void reportNote(const InputNote& /*note*/) {}
    /// Messages may be missing as well: the connection that they come by was lost.
    virtual void interrupt() {}
    /// There are no more messages.
    virtual void finish() {}
};

/// Makes the analysis of a technology when its first message comes. The catalogue is the decoder's and
/// outlives the analysis.
using MakeAnalysis = std::function<std::unique_ptr<MessageAnalysis>(const Catalogue&)>;

} // namespace velmora
