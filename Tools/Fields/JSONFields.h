// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Fields/FieldsWriter.h"
#include "Tools/Text/TextBuffer.h"

namespace velmora {

class Output;

/// One object, whose "fields" are the rows, one a line: see velmora-log-fields.schema.json.
class JSONFields final : public FieldsWriter {
public:
    explicit JSONFields(Output& output) : _output(output) {}

    void begin() override;
    void write(std::string_view technology, const CatalogueRows& rows) override;
    void end() override;

private:
    Output& _output;
    TextBuffer _line;
    bool _isFirst = true;
};

} // namespace velmora
