// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModelNode.h"
#include "Toolkit/Tables/TableViewController.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class VelmoraApp;

/// A measurement pane: the children of one node of the display tree as rows, and below them a toolbar with
/// the status. It remembers its node's path, by which the application object gives it the fresh node after
/// every redraw; nodes of an older tree live on as long as a pane shows them. The navigation stack owns it.
/// Main thread only.
class VelmoraPaneController final : public TableViewController {
public:
    /// `node` may be null. `app` must outlive the pane.
    VelmoraPaneController(NodeRef node, std::string path, VelmoraApp& app);

    [[nodiscard]] const std::string& path() const { return _keyPath; }

    void viewWillAppear(bool animated) override;
    /// Only releases the keyboard focus, without calling the base; that is intended.
    void viewWillDisappear(bool animated) override;

    /// Shows the status (an absent one as an empty text), and whether something is in progress.
    void setStatus(std::optional<std::string_view> status, bool isLoading);
    /// Shows another node (or none) under the same path.
    void reloadWithNode(NodeRef node);
    /// Makes the toolbar from scratch.
    void createToolbarItems();

    [[nodiscard]] std::size_t numberOfRowsInSection(TableView& tableView, std::size_t section) override;
    [[nodiscard]] std::shared_ptr<TableCell> cellForRowAtIndexPath(TableView& tableView,
                                                                   const IndexPath& indexPath) override;
    void didSelectRowAtIndexPath(TableView& tableView, const IndexPath& indexPath) override;
    /// A row with a number can be pinned as a chart of the drive view.
    [[nodiscard]] std::vector<MenuItem> menuForRowAtIndexPath(TableView& tableView,
                                                              const IndexPath& indexPath) override;
    /// Pins the row that the keyboard is on, or takes it off.
    void togglePinOfFocusRow();

private:
    [[nodiscard]] std::string pathOfRow(const IndexPath& indexPath) const;
    /// The row's node. Precondition: there is such a row.
    [[nodiscard]] const NodeRef& nodeAt(const IndexPath& indexPath) const;
    void resetTitle();

    NodeRef _nodes;
    std::string _keyPath;
    std::string _status;
    bool _isLoading = true;
    VelmoraApp& _app;
};

} // namespace velmora
