// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/WindowWidget.h"

#include "Toolkit/Widgets/Navigation/SheetWidget.h"

#include <QApplication>
#include <QDropEvent>
#include <QFile>
#include <QKeyEvent>
#include <QMimeData>
#include <QPointer>
#include <QUrl>
#include <QWindow>

#include <utility>

namespace velmora {

namespace {

/// Empty where what is dropped is not one file of this machine.
QString droppedFile(const QMimeData& data) {
    const QList<QUrl> urls = data.urls();
    return urls.size() == 1 && urls.front().isLocalFile() ? urls.front().toLocalFile() : QString();
}

} // namespace

WindowWidget::WindowWidget() {
    setObjectName("velmora.window");
    setMinimumSize(240, 320);
}

SheetWidget* WindowWidget::sheet() const {
    SheetWidget* topmost = nullptr;
    for (QObject* const child : children())
        if (auto* const candidate = dynamic_cast<SheetWidget*>(child);
            candidate && !candidate->isPassive() && !candidate->isHidden())
            topmost = candidate;
    return topmost;
}

void WindowWidget::returnFocus(QWidget* before) {
    if (before && before->isVisible() && isAncestorOf(before))
        before->setFocus(Qt::OtherFocusReason);
    else if (onFocus)
        onFocus();
}

WindowWidget* WindowWidget::main() {
    if (auto* const active = dynamic_cast<WindowWidget*>(QApplication::activeWindow()))
        return active;
    for (QWidget* const widget : QApplication::topLevelWidgets())
        if (auto* const window = dynamic_cast<WindowWidget*>(widget); window && window->isVisible())
            return window;
    return nullptr;
}

bool WindowWidget::isBackOrCancel(const QKeyEvent& event) {
    return event.key() == Qt::Key_Back || event.matches(QKeySequence::Cancel) ||
           (event.key() == (QGuiApplication::isRightToLeft() ? Qt::Key_Right : Qt::Key_Left) &&
            event.modifiers() == Qt::AltModifier);
}

void WindowWidget::checkPainted() {
    // Queued: the exposure itself is yet to be handled.
    if (onPainted)
        QMetaObject::invokeMethod(this, &WindowWidget::paintFirst, Qt::QueuedConnection);
}

void WindowWidget::paintFirst() {
    if (!onPainted || !windowHandle() || !windowHandle()->isExposed())
        return;
    repaint();
    // What has been drawn may still be on its way to the display server.
    const QPointer<WindowWidget> self(this);
    QGuiApplication::sync();
    if (self)
        if (const auto painted = std::exchange(onPainted, nullptr))
            painted();
}

bool WindowWidget::eventFilter(QObject* watched, QEvent* event) {
    if (watched == windowHandle() && event->type() == QEvent::Expose)
        checkPainted();
    return QWidget::eventFilter(watched, event);
}

void WindowWidget::showEvent(QShowEvent* event) {
    QWidget::showEvent(event);
    if (windowHandle())
        windowHandle()->installEventFilter(this); // once, however often it is shown
}

bool WindowWidget::runCommand(const QKeyEvent& event) const {
    const auto found = commands.find(event.keyCombination());
    if (found == commands.end())
        return false;
    const std::function<void()> command = found->second; // the call may set another one
    command();
    return true;
}

void WindowWidget::keyPressEvent(QKeyEvent* event) {
    if (runCommand(*event))
        return;
    if (SheetWidget* const over = sheet()) { // no widget in it has the keyboard focus
        QApplication::sendEvent(over, event);
        return;
    }
    const std::function<void()> action = event->matches(QKeySequence::Save) ? onSave
                                         : isBackOrCancel(*event)           ? onCancel
                                                                            : std::function<void()>();
    event->setAccepted(action != nullptr);
    if (action)
        action();
}

void WindowWidget::resizeEvent(QResizeEvent* /*event*/) {
    if (onResize)
        onResize();
}

void WindowWidget::dragEnterEvent(QDragEnterEvent* event) {
    if (!droppedFile(*event->mimeData()).isEmpty())
        event->acceptProposedAction();
}

void WindowWidget::dropEvent(QDropEvent* event) {
    const QString path = droppedFile(*event->mimeData());
    if (path.isEmpty() || !onDrop)
        return;
    event->acceptProposedAction();
    // Once the drop is over: what opens the file may take a while.
    QMetaObject::invokeMethod(
        this,
        [this, path] {
            if (onDrop)
                onDrop(QFile::encodeName(path).toStdString());
        },
        Qt::QueuedConnection);
}

} // namespace velmora
