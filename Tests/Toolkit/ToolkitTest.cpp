// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include <QAbstractButton>
#include <QCoreApplication>
#include <QLabel>
#include <QtGlobal>

#include <chrono>
#include <utility>

namespace velmora {

bool eventually(const std::function<bool()>& done) {
    return testApplication().runUntil(done, std::chrono::seconds(10));
}

void runUntilIdle() {
    QCoreApplication::sendPostedEvents();
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

QWidget* find(const Window& window, const char* objectName) {
    for (QWidget* const widget : window.widget()->findChildren<QWidget*>(QString::fromLatin1(objectName)))
        if (widget->isVisible())
            return widget;
    return nullptr;
}

std::string textOf(const QWidget* widget) {
    if (const auto* const label = dynamic_cast<const QLabel*>(widget))
        return label->text().toStdString();
    const auto* const button = dynamic_cast<const QAbstractButton*>(widget);
    return button ? button->text().toStdString() : "(no text)";
}

ReducedMotion::ReducedMotion() {
    qputenv("VELMORA_REDUCED_MOTION", "1");
}

ReducedMotion::~ReducedMotion() {
    qunsetenv("VELMORA_REDUCED_MOTION");
}

ListPane::ListPane(std::vector<std::string> rowTexts, std::string_view title) : texts(std::move(rowTexts)) {
    setTitle(title);
}

std::size_t ListPane::numberOfRowsInSection(TableView& /*tableView*/, std::size_t section) {
    return section == 0 ? texts.size() : 0;
}

std::shared_ptr<TableCell> ListPane::cellForRowAtIndexPath(TableView& tableView, const IndexPath& indexPath) {
    asked.push_back(indexPath.row());
    std::shared_ptr<TableCell> result = tableView.dequeueReusableCell(identifier);
    if (!result) {
        result = std::make_shared<TableCell>(TableCellStyle::plain, identifier);
        ++cellsMade;
    }
    result->textLabel().setText(texts[indexPath.row()]);
    return result;
}

void ListPane::didSelectRowAtIndexPath(TableView& /*tableView*/, const IndexPath& indexPath) {
    chosen.push_back(indexPath.row());
    if (onChoose)
        onChoose(indexPath.row());
}

void ListPane::viewWillAppear(bool animated) {
    TableViewController::viewWillAppear(animated);
    if (diary)
        diary->push_back(title() + ":will appear");
}

void ListPane::viewDidAppear(bool /*animated*/) {
    if (diary)
        diary->push_back(title() + ":did appear");
}

void ListPane::viewWillDisappear(bool /*animated*/) {
    if (diary)
        diary->push_back(title() + ":will disappear");
}

void ListPane::viewDidDisappear(bool /*animated*/) {
    if (diary)
        diary->push_back(title() + ":did disappear");
}

TableCell* ListPane::cell(std::size_t row) {
    return tableView().cellForRow({0, row}).get();
}

std::vector<std::string> numberedTexts(std::size_t count) {
    std::vector<std::string> texts;
    for (std::size_t number = 0; number < count; ++number) {
        texts.emplace_back("Row ");
        texts.back() += std::to_string(number);
    }
    return texts;
}

Stage::Stage(std::shared_ptr<ListPane> rootPane)
    : root(std::move(rootPane)), stack(std::make_shared<NavigationController>(root)),
      window({0, 0, 400, 604}) {
    window.setRootViewController(stack);
}

Stage::~Stage() {
    window.setHidden(true);
}

void Stage::show() {
    window.makeKeyAndVisible();
    EXPECT_TRUE(eventually([this] { return window.widget()->isActiveWindow(); }));
}

} // namespace velmora
