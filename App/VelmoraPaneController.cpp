// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraPaneController.h"

#include "App/DriveView/DriveScreen.h"
#include "App/VelmoraApp.h"
#include "App/VelmoraCell.h"
#include "Model/NodePath.h"
#include "Toolkit/Bars/FlexibleSpace.h"
#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/BusyIndicator.h"
#include "Toolkit/Navigation/NavigationController.h"

#include <memory>
#include <utility>
#include <vector>

namespace velmora {

namespace {

/// Both kinds of row share it, and so recycle each other's cells, which keep the kind that they were made as:
/// a leaf that gets a cell made for an inner row shows its name only, until the table makes fresh cells. That
/// is meant.
constexpr const char* cellIdentifier = "VelmoraPaneControllerCell";

constexpr double statusFontSize = 14;

} // namespace

VelmoraPaneController::VelmoraPaneController(NodeRef node, std::string path, VelmoraApp& app)
    : _nodes(std::move(node)), _keyPath(std::move(path)), _app(app) {}

std::unique_ptr<View> VelmoraPaneController::loadView() {
    auto view = TableViewController::loadView();
    static_cast<TableView&>(*view).setEmptyText("Nothing has been reported.");
    return view;
}

void VelmoraPaneController::viewWillAppear(bool animated) {
    TableViewController::viewWillAppear(animated);
    resetTitle();
    if (NavigationController* stack = navigationController())
        stack->setToolbarHidden(false, animated);
    createToolbarItems();
}

void VelmoraPaneController::viewWillDisappear(bool) {
    resignFirstResponder();
}

void VelmoraPaneController::setStatus(std::optional<std::string_view> status, bool isLoading) {
    _status = status.value_or("");
    _isLoading = isLoading;
    createToolbarItems();
}

void VelmoraPaneController::reloadWithNode(NodeRef node) {
    _nodes = std::move(node);
    resetTitle();
    tableView().reloadData();
    createToolbarItems();
}

void VelmoraPaneController::createToolbarItems() {
    std::vector<std::shared_ptr<ToolbarItem>> items;

    const auto indicator = std::make_shared<BusyIndicator>();
    indicator->setHidesWhenStopped(true);
    if (_isLoading)
        indicator->startAnimating();
    else
        indicator->stopAnimating();
    items.push_back(indicator);

    const auto label = std::make_shared<LabelItem>(_status);
    label->setFont(Font::systemFontOfSize(statusFontSize));
    label->setBackgroundColor(Color::clear);
    label->setTextColor(Color::darkText);
    items.push_back(label);

    items.push_back(std::make_shared<FlexibleSpace>());

    if (_app.allowSaveButton())
        items.push_back(std::make_shared<SaveButton>([&app = _app] { app.showSaveView(); }));

    setToolbarItems(std::move(items), true);
}

std::size_t VelmoraPaneController::numberOfRowsInSection(TableView&, std::size_t) {
    const auto* children = _nodes ? _nodes->childNodes() : nullptr;
    return children ? children->size() : 0;
}

std::shared_ptr<TableCell> VelmoraPaneController::cellForRowAtIndexPath(TableView& tableView,
                                                                        const IndexPath& indexPath) {
    const NodeRef& node = nodeAt(indexPath);
    const bool isInner = node->childNodes() != nullptr;
    // Every waiting cell of a pane is one of ours.
    auto cell = std::static_pointer_cast<VelmoraCell>(tableView.dequeueReusableCell(cellIdentifier));
    if (!cell)
        cell = isInner ? std::make_shared<VelmoraCell>(VelmoraCell::StyleKey{TableCellStyle::value},
                                                       cellIdentifier)
                       : std::make_shared<VelmoraCell>(TableCellStyle::value, cellIdentifier);
    const std::string* value = node->value();
    cell->key().setText(node->displayName());
    cell->setAccessory(isInner ? TableCellAccessory::disclosureIndicator : TableCellAccessory::none);
    if (Label* label = cell->value())
        label->setText(value ? std::string_view(*value) : std::string_view());
    if (isInner)
        cell->setLayoutKey();
    else
        cell->setLayout();
    return cell;
}

TableRowSummary VelmoraPaneController::summaryOfRowAtIndexPath(TableView&, const IndexPath& indexPath) {
    const NodeRef& node = nodeAt(indexPath);
    if (node->childNodes())
        return {node->displayName(), TableCellAccessory::disclosureIndicator};
    const std::string* value = node->value();
    return {value && !value->empty() ? node->displayName() + ", " + *value : node->displayName(),
            TableCellAccessory::none};
}

void VelmoraPaneController::didSelectRowAtIndexPath(TableView& tableView, const IndexPath& indexPath) {
    if (indexPath.isNull())
        return;
    const NodeRef node = nodeAt(indexPath);
    if (!node->childNodes()) {
        tableView.deselectRow(indexPath, false);
        return;
    }
    const auto pane = std::make_shared<VelmoraPaneController>(node, pathOfRow(indexPath), _app);
    pane->setStatus(_status, _isLoading);
    if (NavigationController* stack = navigationController())
        stack->pushViewController(pane, true);
}

std::vector<MenuItem> VelmoraPaneController::menuForRowAtIndexPath(TableView&, const IndexPath& indexPath) {
    const DriveModel& drive = static_cast<const DriveSource&>(_app.drive().source()).model();
    std::string path = pathOfRow(indexPath);
    if (nodeAt(indexPath)->childNodes() || !drive.canPin(path))
        return {};
    const char* const title = drive.isPinned(path) ? "Unpin Chart" : "Pin as Chart";
    // The pane and what the drive view shows may be gone when the menu is answered.
    return {{title, [&app = _app, row = std::move(path)] { (void)app.drive().source().togglePin(row); }}};
}

void VelmoraPaneController::togglePinOfFocusRow() {
    const IndexPath row = tableView().indexPathForFocusRow();
    if (row.isNull() || nodeAt(row)->childNodes())
        return;
    (void)_app.drive().source().togglePin(pathOfRow(row));
}

std::string VelmoraPaneController::pathOfRow(const IndexPath& indexPath) const {
    return appendingPathComponent(_keyPath, nodeAt(indexPath)->displayName());
}

const NodeRef& VelmoraPaneController::nodeAt(const IndexPath& indexPath) const {
    return (*_nodes->childNodes())[indexPath.row()];
}

void VelmoraPaneController::resetTitle() {
    setTitle(_nodes ? std::string_view(_nodes->displayName()) : std::string_view("Velmora"));
    tableView().setAccessibleName(title());
}

} // namespace velmora
