// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Sealing/MaskSeal.h"
#include "Platform/Clock.h"
#include "PropertyLists/Value.h"
#include "Toolkit/Navigation/ViewController.h"
#include "Toolkit/Tables/TableView.h"
#include "Toolkit/Tables/TableViewDataSource.h"
#include "Toolkit/Tables/TableViewDelegate.h"
#include "Toolkit/TextField.h"
#include "Toolkit/TextFieldDelegate.h"

#include <memory>
#include <optional>
#include <string>

namespace velmora {

class VelmoraApp;

/// The save screen: a list of what will be saved and a field for a description. Save writes one snapshot file
/// to the diagnostic-log directory; either button closes the screen through the application object, which
/// owns it. Main thread only.
class VelmoraSaveViewController final : public ViewController,
                                        public TextFieldDelegate,
                                        public TableViewDataSource,
                                        public TableViewDelegate {
public:
    /// `saveHistory` may be null: the model has no decoder. `app` must outlive the screen. `timeStamp`: the
    /// snapshot's, for a recording's moment; absent for now.
    VelmoraSaveViewController(const ArrayRef& saveHistory, VelmoraApp& app,
                              std::optional<Time> timeStamp = std::nullopt);
    ~VelmoraSaveViewController() override;

    [[nodiscard]] TableView& saveContentTable() { return _saveContentTable; }
    [[nodiscard]] TextField& saveDescription() { return _saveDescription; }

    void viewDidLoad() override;
    /// Only fills the screen, without calling the base; that is intended.
    void viewWillAppear(bool animated) override;
    void didReceiveMemoryWarning() override;
    void viewDidUnload() override;

    void savePressed();
    void cancelPressed();
    void backgroundTouched();

    /// Takes the keyboard for the description.
    bool becomeFirstResponder() override;

    bool textFieldShouldReturn(TextField& textField) override;

    [[nodiscard]] std::size_t numberOfSections(TableView& tableView) override;
    [[nodiscard]] std::size_t numberOfRowsInSection(TableView& tableView, std::size_t section) override;
    [[nodiscard]] std::shared_ptr<TableCell> cellForRowAtIndexPath(TableView& tableView,
                                                                   const IndexPath& indexPath) override;
    [[nodiscard]] TableRowSummary summaryOfRowAtIndexPath(TableView& tableView,
                                                          const IndexPath& indexPath) override;
    /// Only releases the keyboard focus: every entry is always saved, none can be chosen.
    void didSelectRowAtIndexPath(TableView& tableView, const IndexPath& indexPath) override;

protected:
    [[nodiscard]] std::unique_ptr<View> loadView() override;

private:
    /// What the list says of that entry.
    [[nodiscard]] std::string description(std::size_t row) const;
    [[nodiscard]] std::string snapshotPath() const;
    /// With what the field says now, or the seal.
    [[nodiscard]] bool writeSnapshot(const std::string& path) const;
    void queueClosing();

    /// When the screen was created, or the moment that it saves; not when it is saved.
    Time _timeStamp;
    ArrayRef _saveHistory;
    std::optional<MaskSeal> _seal; ///< of a snapshot of masked messages
    TableView _saveContentTable;
    TextField _saveDescription;
    VelmoraApp& _app;
};

} // namespace velmora
