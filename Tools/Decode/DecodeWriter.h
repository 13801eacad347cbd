// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/DecodeOptions.h"
#include "Tools/Decode/Decoding.h"

#include <cstddef>
#include <memory>

namespace velmora {

class Output;
class PositionedReader;
class SampleColumns;

/// What `decode` prints of a file, in one of its formats: during decoding or at its end.
class DecodeWriter : public DecodingObserver {
public:
    /// The writer of the options' format for the file of that index. `isLive`: more may still be written to
    /// the file, as to a pipe. `columns`: those of wide samples. `options`, `columns` and `output` must
    /// outlive it.
    [[nodiscard]] static std::unique_ptr<DecodeWriter> make(const DecodeOptions& options, std::size_t index,
                                                            bool isLive, SampleColumns& columns,
                                                            Output& output);

    /// Where the positions of the messages are read; for writers of samples. It must outlive the writer.
    virtual void setPositions(const PositionedReader& /*positions*/) {}
    /// The file has been decoded to its end; called for each of its technologies.
    virtual void finish(const Decoded&) {}
    /// Writes out what is complete, and nothing else: decoding may have ended in the middle of a message.
    virtual void flush() {}
    [[nodiscard]] bool isDone() const override;

protected:
    explicit DecodeWriter(Output& output) : _output(output) {}
    [[nodiscard]] Output& output() const { return _output; }

private:
    Output& _output;
};

} // namespace velmora
