// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraSaveViewController.h"

#include "App/VelmoraApp.h"
#include "App/VelmoraSaveView.h"
#include "Export/Masking/Sealing/SealedFile.h"
#include "Model/Snapshot.h"
#include "Platform/SystemLog.h"
#include "PropertyLists/PropertyList.h"
#include "Toolkit/Alert.h"
#include "Toolkit/Screen.h"
#include "Toolkit/Tables/TableCell.h"

#include <chrono>
#include <new>
#include <utility>

namespace velmora {

namespace {

constexpr const char* cellIdentifier = "SaveHistoryContentCell";
constexpr double cellFontSize = 13;
constexpr const char* heading = "Save Snapshot"; // also what screen readers call the sheet

} // namespace

VelmoraSaveViewController::VelmoraSaveViewController(const ArrayRef& saveHistory, VelmoraApp& app,
                                                     std::optional<Time> timeStamp)
    : _timeStamp(timeStamp ? *timeStamp : app.platform().model().clock.now()),
      _saveHistory(saveHistory ? Value(saveHistory).copy().arrayRef() : nullptr), _seal(app.maskSeal()),
      _app(app) {
    setTitle(heading);
}

VelmoraSaveViewController::~VelmoraSaveViewController() = default;

std::unique_ptr<View> VelmoraSaveViewController::loadView() {
    auto view = std::make_unique<VelmoraSaveView>(title(), _saveContentTable, _saveDescription);
    if (_seal)
        _saveDescription.setPlaceholder("Description (left out while identities are masked)");
    view->saveButton().setAction([this] { savePressed(); });
    view->cancelButton().setAction([this] { cancelPressed(); });
    view->setOnTap([this] { backgroundTouched(); });
    _saveContentTable.setDataSource(this);
    _saveContentTable.setDelegate(this);
    _saveContentTable.reloadData();
    view->setFrame(Screen::mainApplicationFrame());
    return view;
}

void VelmoraSaveViewController::viewDidLoad() {
    _saveDescription.setDelegate(this);
    ViewController::viewDidLoad();
    _saveContentTable.sizeToFit();
}

void VelmoraSaveViewController::viewWillAppear(bool) {
    view().setFrame(Screen::mainApplicationFrame());
}

void VelmoraSaveViewController::didReceiveMemoryWarning() {
    ViewController::didReceiveMemoryWarning();
}

void VelmoraSaveViewController::viewDidUnload() {
    ViewController::viewDidUnload();
}

std::string VelmoraSaveViewController::snapshotPath() const {
    // By the second, so that a second save within it replaces the first.
    const auto now = std::chrono::floor<std::chrono::seconds>(_app.platform().model().clock.now());
    return _app.platform().files().diagnosticLogDirectory() + "/VelmoraSnapshot-" +
           std::to_string(now.time_since_epoch().count()) + ".velmora";
}

bool VelmoraSaveViewController::writeSnapshot(const std::string& path) const {
    try {
        const Value snapshot(makeSnapshot(_timeStamp, _saveHistory, _saveDescription.text()));
        // What is typed may name a person, and the seal has its place.
        const Result<Done> sealed =
            _seal && _saveHistory ? sealSnapshot(snapshot, *_seal) : Result<Done>(Done{});
        const auto list = sealed ? writePropertyList(snapshot) : Failure{sealed.reason()};
        const auto written =
            list ? _app.platform().files().writeDirectly(path, *list) : Failure{list.reason()};
        if (!written)
            logFormat(LogPriority::Info, "Snapshot: %s", written.reason().c_str());
        return static_cast<bool>(written);
    } catch (const std::bad_alloc&) {
        // A long history is written as one text. What there is no room for ends neither the display nor the
        // log.
        logLine(LogPriority::Info, "Snapshot: out of memory");
        return false;
    }
}

void VelmoraSaveViewController::savePressed() {
    const std::string path = snapshotPath();
    if (!writeSnapshot(path)) {
        logFormat(LogPriority::Error, "Unable to write snapshot to %s", path.c_str());
        Alert("File Error", "Unable to write file to disk", "Close").show();
    } else {
        _app.snapshotWritten(path);
    }
    // In both cases: a failure leaves only the notice.
    queueClosing();
}

void VelmoraSaveViewController::cancelPressed() {
    queueClosing();
}

void VelmoraSaveViewController::queueClosing() {
    _app.platform().model().queue.async([&app = _app] { app.closeSaveView(); });
}

bool VelmoraSaveViewController::becomeFirstResponder() {
    return _saveDescription.becomeFirstResponder();
}

bool VelmoraSaveViewController::textFieldShouldReturn(TextField& textField) {
    textField.resignFirstResponder();
    return true;
}

void VelmoraSaveViewController::backgroundTouched() {
    _saveDescription.resignFirstResponder();
}

std::size_t VelmoraSaveViewController::numberOfSections(TableView&) {
    return 1;
}

std::size_t VelmoraSaveViewController::numberOfRowsInSection(TableView&, std::size_t) {
    return _saveHistory ? _saveHistory->size() : 0;
}

std::string VelmoraSaveViewController::description(std::size_t row) const {
    const Dictionary* entry = (*_saveHistory)[row].asDictionary();
    const std::string* text = entry ? (*entry)["Description"].asString() : nullptr;
    return text ? *text : std::string();
}

TableRowSummary VelmoraSaveViewController::summaryOfRowAtIndexPath(TableView&, const IndexPath& indexPath) {
    return {description(indexPath.row()), TableCellAccessory::checkMark};
}

std::shared_ptr<TableCell> VelmoraSaveViewController::cellForRowAtIndexPath(TableView& tableView,
                                                                            const IndexPath& indexPath) {
    auto cell = tableView.dequeueReusableCell(cellIdentifier);
    if (!cell)
        cell = std::make_shared<TableCell>(TableCellStyle::plain, cellIdentifier);
    cell->textLabel().setText(description(indexPath.row()));
    cell->textLabel().setFont(Font::named("Helvetica", cellFontSize));
    cell->setAccessory(TableCellAccessory::checkMark);
    return cell;
}

void VelmoraSaveViewController::didSelectRowAtIndexPath(TableView&, const IndexPath&) {
    _saveDescription.resignFirstResponder();
}

} // namespace velmora
