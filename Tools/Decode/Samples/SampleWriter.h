// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Tools/Decode/Samples/LeafTexts.h"
#include "Tools/Decode/Samples/SelectedLeaves.h"
#include "Tools/Text/LineWriter.h"

#include <optional>
#include <string>
#include <utility>

namespace velmora {

/// A writer of the values that each message reported, not of the display. Its lines are in the order of the
/// messages.
class SampleWriter : public LineWriter, private ObservationSink {
public:
    void didMakeDecoder(LogGenerator& decoder) override;
    void willDecode(const LoggedMessage& message) override;
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    void didRefresh(Time, const Decoded&) override {}
    void didDecode(const LoggedMessage& message, LogGenerator& decoder, Dictionary& state) override;

protected:
    SampleWriter(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);

    /// A message's observations.
    virtual void write(const ObservedMessage& message) = 0;

    [[nodiscard]] const DecodeOptions& options() const { return _options; }
    [[nodiscard]] SelectedLeaves& selected() { return _selected; }
    /// Empty where there is one file.
    [[nodiscard]] const std::string& file() const { return _file; }
    [[nodiscard]] Time arrival() const { return _arrival; }
    [[nodiscard]] std::uint64_t record() const { return _record; }
    /// The message's own time stamp as a time; absent where it has none or a wrong one.
    [[nodiscard]] static std::optional<Time> modemTime(const ObservedMessage& message);

private:
    void observed(const ObservedMessage& message) override {
        if (std::exchange(_isWanted, false))
            write(message);
    }

    const DecodeOptions& _options;
    SelectedLeaves _selected;
    std::string _file;
    bool _isLive;
    bool _isWanted = false; ///< the message that is being decoded
    Time _arrival{};
    std::uint64_t _record = 0;
};

/// One JSON object a line for each observed value.
class SampleLines final : public SampleWriter {
public:
    SampleLines(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);

private:
    void write(const ObservedMessage& message) override;
    void appendValue(const Observation& observation);

    LeafTexts _leaves;
    ObservedText _text;
    std::string _begin;
    TextBuffer _head; ///< what the lines of the message have in common, before the path
    TextBuffer _tail; ///< and after the text
};

/// Comma-separated values, a row for each observed value.
class SampleRows final : public SampleWriter {
public:
    SampleRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);
    [[nodiscard]] static std::string header(const DecodeOptions& options);

private:
    void write(const ObservedMessage& message) override;

    LeafTexts _leaves;
    ObservedText _text;
    std::string _fileCell;
    TextBuffer _head; ///< what the rows of the message have in common, before the path
    TextBuffer _tail; ///< and after the text
};

} // namespace velmora
