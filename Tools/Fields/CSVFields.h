// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Fields/FieldsWriter.h"
#include "Tools/Text/CSVText.h"
#include "Tools/Text/TextBuffer.h"

namespace velmora {

class Output;

/// A row for each leaf (RFC 4180). Where a leaf has several sources, each cell about them has a value for
/// each, in their order, with semicolons between; a cell that would have nothing but the semicolons is empty.
class CSVFields final : public FieldsWriter {
public:
    explicit CSVFields(Output& output, CSVGuard guard = CSVGuard::Off) : _output(output), _guard(guard) {}

    void begin() override;
    void write(std::string_view technology, const CatalogueRows& rows) override;

private:
    void appendCell(std::string_view text);
    void endLine();

    Output& _output;
    CSVGuard _guard;
    TextBuffer _line;
};

} // namespace velmora
