// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Color.h"
#include "Toolkit/Geometry.h"

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

class QWidget;

namespace velmora {

/// A rectangle of the screen that draws itself and holds others. A view is owned by its creator; a superview
/// only shows it. A view may be destroyed at any time, from its own callbacks too: it then leaves its
/// superview, and its subviews remain without one. Needs the application; main thread only.
class View {
public:
    View();
    virtual ~View();
    View(const View&) = delete;
    View& operator=(const View&) = delete;

    /// Place and size in the superview. Reads back as it was set; what is drawn lies on whole points.
    [[nodiscard]] Rect frame() const;
    /// Calls `layoutSubviews` when the size is another than before.
    void setFrame(const Rect& frame);
    /// The inside: the frame's size, from 0, 0.
    [[nodiscard]] Rect bounds() const;

    /// Shows the view in this one, over those added before; it leaves its earlier superview.
    void addSubview(View& view);
    void removeFromSuperview();
    [[nodiscard]] View* superview() const;
    /// In the order in which they were added.
    [[nodiscard]] const std::vector<View*>& subviews() const;

    /// Gives the subviews their frames. The toolkit calls it when the size has changed; the base does
    /// nothing.
    virtual void layoutSubviews();
    /// Makes the view as large as its contents need, at the same origin. The base keeps the size.
    virtual void sizeToFit();

    [[nodiscard]] bool isHidden() const;
    void setHidden(bool isHidden);
    /// Whether it can be seen: it is in a window on the screen that is not minimized.
    [[nodiscard]] bool isOnScreen() const;
    void setBackgroundColor(Color color);

    /// Called for a tap or click on the view that none of its subviews takes.
    void setOnTap(std::function<void()> onTap);

    /// The view's name for screen readers; by default its text.
    void setAccessibleName(std::string_view name);
    [[nodiscard]] std::string accessibleName() const;

    /// Takes the keyboard focus; false when the view can't, or is not on the screen.
    bool becomeFirstResponder();
    /// Releases the keyboard focus if the view or a subview has it.
    void resignFirstResponder();
    [[nodiscard]] bool isFirstResponder() const;

    /// What draws the view, for the toolkit and its tests; never null, lives as long as the view.
    [[nodiscard]] QWidget* widget() const;

protected:
    /// For subclasses: takes ownership of the widget that draws the view.
    explicit View(QWidget* widget);
    /// Where subviews are shown; the view's own widget unless overridden.
    [[nodiscard]] virtual QWidget* subviewWidget() const;

private:
    class State;
    std::unique_ptr<State> _state;
};

} // namespace velmora
