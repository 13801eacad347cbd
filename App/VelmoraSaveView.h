// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Button.h"
#include "Toolkit/Label.h"
#include "Toolkit/Tables/TableView.h"
#include "Toolkit/TextField.h"
#include "Toolkit/View.h"

#include <string_view>

namespace velmora {

/// The save screen's layout: Cancel, a heading and Save in a row (where that is too narrow, the heading in a
/// row of its own), below them the description field, below that the list, and around all a background. Main
/// thread only.
class VelmoraSaveView final : public View {
public:
    /// The list and the field are the screen's; they leave this view when they end.
    VelmoraSaveView(std::string_view heading, TableView& list, TextField& description);

    [[nodiscard]] Button& saveButton() { return _save; }
    [[nodiscard]] Button& cancelButton() { return _cancel; }

    void layoutSubviews() override;

private:
    TableView& _list;
    TextField& _description;
    Label _heading;
    Button _cancel;
    Button _save;
};

} // namespace velmora
