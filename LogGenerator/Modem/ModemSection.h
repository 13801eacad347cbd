// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/Extra/PayloadCache.h"

#include <memory>
#include <string>

namespace velmora {

/// A section of the technology Modem: a dictionary whose first row says why it is empty, or the modem's
/// state. Each of its messages is the whole account of its subject, so that what a message does not name is
/// gone, in the order of the section's tables. A message that cannot be read leaves nothing but a state that
/// says so: what there was may not be true any more.
class ModemSection : public Base {
public:
    /// Reads payloads through a cache that is shared with other sections.
    void sharePayloads(std::shared_ptr<PayloadCache> payloads) { _payloads = std::move(payloads); }

    void updateWithData(const Data& data, std::uint32_t logCode) override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;
    void describe(const View& view, ContentVisitor& visitor) const override;

protected:
    /// Names what the section shows of the message, after the state. The message is empty where there is no
    /// modem.
    virtual void show(const Dictionary& message, FieldVisitor& visitor) const = 0;
    /// Describes all that `show` may name.
    virtual void describeShown(ContentVisitor& visitor) const = 0;
    /// The state of a section whose modem works. The default is that of the modem.
    [[nodiscard]] virtual std::string stateOf(const Dictionary& message) const;
    /// Whether the section logs errors of a message: of several that read a code, one does.
    [[nodiscard]] virtual bool reportsErrors() const { return true; }
    /// Logs the errors in the contents of a message. The default logs nothing.
    virtual void checkMessage(const Dictionary& message) const;

private:
    /// The first rows of a section, each section's own: what they show is another value in each.
    template <class Section>
    static constexpr Field stateField{"State", computed, plainText()};
    template <class Section>
    static constexpr Field reasonField{"Reason", computed, plainText()};

    template <class Section>
    friend class ModemSectionOf;
    ModemSection(const Field& state, const Field& reason) : _state(state), _reason(reason) {}

    /// The message's dictionary; none where it cannot be read.
    [[nodiscard]] Value read(const Data& data, std::uint32_t logCode) const;

    const Field& _state;
    const Field& _reason;
    std::shared_ptr<PayloadCache> _payloads = std::make_shared<PayloadCache>();
    Value _message; ///< of the record that is kept
};

/// What a section derives from, with itself as the argument.
template <class Section>
class ModemSectionOf : public ModemSection {
protected:
    ModemSectionOf() : ModemSection(stateField<Section>, reasonField<Section>) {}
};

} // namespace velmora
