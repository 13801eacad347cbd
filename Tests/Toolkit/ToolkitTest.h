// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Application.h"
#include "Toolkit/Navigation/NavigationController.h"
#include "Toolkit/Tables/TableCell.h"
#include "Toolkit/Tables/TableViewController.h"
#include "Toolkit/Window.h"

#include <QString>
#include <QWidget>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The one of this program, on an offscreen display.
[[nodiscard]] Application& testApplication();

/// Serves events until `done`; fails after ten seconds.
[[nodiscard]] bool eventually(const std::function<bool()>& done);
/// Serves what is waiting to be served.
void runUntilIdle();

/// The visible widget of that name in the window, or null.
[[nodiscard]] QWidget* find(const Window& window, const char* objectName);
/// Its text: a label's or a button's.
[[nodiscard]] std::string textOf(const QWidget* widget);

/// Turns reduced motion on during its lifetime.
class ReducedMotion {
public:
    ReducedMotion();
    ~ReducedMotion();
    ReducedMotion(const ReducedMotion&) = delete;
    ReducedMotion& operator=(const ReducedMotion&) = delete;
};

/// A pane whose rows are the given texts, all under one identifier; records its calls.
class ListPane : public TableViewController {
public:
    explicit ListPane(std::vector<std::string> rowTexts, std::string_view title = {});

    [[nodiscard]] std::size_t numberOfRowsInSection(TableView& tableView, std::size_t section) override;
    [[nodiscard]] std::shared_ptr<TableCell> cellForRowAtIndexPath(TableView& tableView,
                                                                   const IndexPath& indexPath) override;
    void didSelectRowAtIndexPath(TableView& tableView, const IndexPath& indexPath) override;
    void viewWillAppear(bool animated) override;
    void viewDidAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;
    void viewDidDisappear(bool animated) override;

    [[nodiscard]] TableCell* cell(std::size_t row);

    std::vector<std::string> texts;
    /// Rows asked for.
    std::vector<std::size_t> asked;
    std::vector<std::size_t> chosen;
    std::size_t cellsMade = 0;
    std::function<void(std::size_t)> onChoose;
    /// "title:notice" of every pane, shared by those of a test.
    std::vector<std::string>* diary = nullptr;
    std::string identifier = "row";
};

/// "Row 0", "Row 1", ...
[[nodiscard]] std::vector<std::string> numberedTexts(std::size_t count);

/// A window of 400 x 604 points with a navigation stack on a list: the bars leave the list 10 rows of 50 or
/// fewer.
struct Stage {
    explicit Stage(std::shared_ptr<ListPane> rootPane);
    ~Stage();
    Stage(const Stage&) = delete;
    Stage& operator=(const Stage&) = delete;

    void show();

    std::shared_ptr<ListPane> root;
    std::shared_ptr<NavigationController> stack;
    Window window;
};

} // namespace velmora
