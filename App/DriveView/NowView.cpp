// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/NowView.h"

#include "App/DriveView/DriveText.h"
#include "App/DriveView/LabelText.h"

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

constexpr double margin = 12;
constexpr double captionSize = 12;
constexpr double factSize = 15;
constexpr double technologySize = 20;
constexpr double numberSize = 34;

double lineOf(const Font& font) {
    return std::ceil(sizeOfText("X", font).height);
}

double captionLine() {
    return lineOf(Font::systemFontOfSize(captionSize));
}

double factHeight() {
    return captionLine() + lineOf(Font::systemFontOfSize(factSize)) + 6;
}

double technologyHeight() {
    return lineOf(Font::boldSystemFontOfSize(technologySize));
}

double quantityHeight() {
    return 2 * captionLine() + lineOf(Font::boldSystemFontOfSize(numberSize)) + 8;
}

} // namespace

NowView::NowView() {
    setAccessibleName("Now");
    _technology.setFont(Font::boldSystemFontOfSize(technologySize));
    _state.setFont(Font::systemFontOfSize(captionSize));
    _state.setTextColor(Color::secondary);
    _change.setFont(Font::systemFontOfSize(captionSize));
    for (Label* each : {&_technology, &_state, &_change})
        addSubview(*each);
    _level.caption.setText("Level, dBm");
    _quality.caption.setText("Quality, dB");
    for (Quantity* each : {&_level, &_quality}) {
        each->caption.setFont(Font::systemFontOfSize(captionSize));
        each->caption.setTextColor(Color::secondary);
        each->number.setFont(Font::boldSystemFontOfSize(numberSize));
        each->words.setFont(Font::systemFontOfSize(captionSize));
        for (Label* label : {&each->caption, &each->number, &each->words})
            addSubview(*label);
    }
    for (Fact& each : _facts) {
        each.caption.setFont(Font::systemFontOfSize(captionSize));
        each.caption.setTextColor(Color::secondary);
        each.value.setFont(Font::systemFontOfSize(factSize));
        addSubview(each.caption);
        addSubview(each.value);
    }
}

NowView::~NowView() = default;

void NowView::show(const DriveNow& now, const LevelClasses& classes, Time time, std::string_view link,
                   std::string_view change) {
    const std::string mode = now.mode ? ", " + std::string(nameOf(*now.mode)) : std::string();
    changeText(_technology, now.technology ? std::string(nameOf(*now.technology)) + mode
                            : now.mode     ? "No cell" + mode
                                           : "Radio technology not reported");
    const bool isPast = !link.empty() || !now.reported || isOld(*now.reported, time);
    _technology.setTextColor(isPast ? Color::secondary : Color::darkText);
    std::string state(link);
    const auto add = [&state](const std::string& text) { state += (state.empty() ? "" : ", ") + text; };
    if (now.state && !now.state->text.empty())
        add(now.state->text);
    if (now.reported && isOld(*now.reported, time))
        add("reported " + ageText(*now.reported, time));
    changeText(_state, state);
    changeText(_change, change.empty() ? std::string_view("No event so far") : change);
    changeName(_change, "Latest event, " + _change.text());

    const auto classOf = [&](Role role, const std::optional<DriveValue>& value) {
        return value ? classes.of(now.technology, role, value->number) : std::nullopt;
    };
    showQuantity(_level, now.level, classOf(Role::ServingLevel, now.level), time);
    showQuantity(_quality, now.quality, classOf(Role::ServingQuality, now.quality), time);

    const bool isKnown = now.technology.has_value();
    showFact(network, "PLMN", now.network, time);
    showFact(area, "Area", now.area, time);
    showFact(cell, "Cell", now.cell, time);
    showFact(channel, isKnown ? channelNameOf(*now.technology) : "Channel", now.channel, time);
    showFact(band, "Band", now.band, time);
    showFact(physicalCell, isKnown ? physicalCellNameOf(*now.technology) : "Physical cell", now.physicalCell,
             time);
}

void NowView::showQuantity(Quantity& quantity, const std::optional<DriveValue>& value,
                           std::optional<LevelClass> levelClass, Time time) {
    const std::string caption = quantity.caption.text();
    if (!value) {
        changeText(quantity.number, "\u2013");
        quantity.number.setTextColor(Color::secondary);
        changeText(quantity.words, notReported);
        quantity.words.setTextColor(Color::secondary);
        changeName(quantity.number, caption + ", " + std::string(notReported));
        return;
    }
    const bool isPast = isOld(value->time, time);
    const Color color = isPast ? Color::secondary : colorOf(levelClass);
    const std::string number = numberText(value->text);
    const std::string word = levelClass ? std::string(nameOf(*levelClass)) + ", " : std::string();
    const std::string words = word + ageText(value->time, time) + (isPast ? ", old" : "");
    changeText(quantity.number, number);
    quantity.number.setTextColor(color);
    changeText(quantity.words, words);
    quantity.words.setTextColor(color);
    changeName(quantity.number, caption + ", " + number + ", " + words);
}

void NowView::showFact(FactIndex fact, std::string_view caption, const std::optional<DriveValue>& value,
                       Time time) {
    Fact& shown = _facts[fact];
    const bool isPast = value && isOld(value->time, time);
    const std::string text = !value   ? std::string(notReported)
                             : isPast ? value->text + " (" + ageText(value->time, time) + ')'
                                      : value->text;
    changeText(shown.caption, caption);
    changeText(shown.value, text);
    shown.value.setTextColor(!value || isPast ? Color::secondary : Color::darkText);
    changeName(shown.value, std::string(caption) + ", " + text);
}

std::size_t NowView::columnsIn(double width) {
    return width >= 560 ? 3 : 2;
}

double NowView::heightForWidth(double width) const {
    const std::size_t columns = columnsIn(width);
    const double rows = static_cast<double>((facts + columns - 1) / columns);
    return margin + technologyHeight() + 2 * captionLine() + quantityHeight() + 6 + rows * factHeight() +
           margin;
}

void NowView::layoutSubviews() {
    const double width = std::max(bounds().width - 2 * margin, 0.0);
    double y = margin;
    const auto line = [](Label& label, double x, double& top, double lineWidth) {
        const double height = lineOf(label.font());
        label.setFrame({x, top, lineWidth, height});
        top += height;
    };
    line(_technology, margin, y, width);
    line(_state, margin, y, width);
    line(_change, margin, y, width);
    y += 4;
    const double half = width / 2;
    for (Quantity* each : {&_level, &_quality}) {
        double top = y;
        const double x = each == &_level ? margin : margin + half;
        line(each->caption, x, top, half - 4);
        line(each->number, x, top, half - 4);
        line(each->words, x, top, half - 4);
    }
    y += quantityHeight() + 2;
    const std::size_t columns = columnsIn(bounds().width);
    const double columnWidth = width / static_cast<double>(columns);
    for (std::size_t i = 0; i < facts; ++i) {
        double top = y + static_cast<double>(i / columns) * factHeight();
        const double x = margin + static_cast<double>(i % columns) * columnWidth;
        line(_facts[i].caption, x, top, columnWidth - 8);
        line(_facts[i].value, x, top, columnWidth - 8);
    }
}

} // namespace velmora
