// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Fields/FieldsWriter.h"

#include <functional>
#include <string>

namespace velmora {

class Output;

/// A small catalogue that has one leaf of each kind that rows of catalogues can be of.
class ExampleCatalogue {
public:
    ExampleCatalogue();

    [[nodiscard]] CatalogueRows rows() const;

private:
    Catalogue _catalogue{"Ostrel_GSM"};
};

/// A catalogue of a technology without log codes, with a number and a text.
class ExampleTexts {
public:
    ExampleTexts();

    [[nodiscard]] CatalogueRows rows() const;

private:
    Catalogue _catalogue{"IFX"};
};

/// All that is put into the output.
[[nodiscard]] std::string written(const std::function<void(Output&)>& write);

/// The example's rows and then the texts' as a writer of that class writes them.
template <class Writer>
[[nodiscard]] std::string writtenBy() {
    return written([](Output& output) {
        const ExampleCatalogue example;
        const ExampleTexts texts;
        Writer writer(output);
        writer.begin();
        writer.write("Ostrel_GSM", example.rows());
        writer.write("IFX", texts.rows());
        writer.end();
    });
}

} // namespace velmora
