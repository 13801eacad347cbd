// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Fields/FieldsWriter.h"

namespace velmora {

class Output;

/// A table for each technology: path, kind with unit, role, log codes. For reading on a terminal.
class TextFields final : public FieldsWriter {
public:
    explicit TextFields(Output& output) : _output(output) {}

    void write(std::string_view technology, const CatalogueRows& rows) override;

private:
    Output& _output;
    bool _isFirst = true;
};

} // namespace velmora
