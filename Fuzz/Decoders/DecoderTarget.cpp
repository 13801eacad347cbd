// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/Decoders/DecoderSession.h"
#include "Fuzz/Decoders/MessageScript.h"
#include "Fuzz/FuzzTargets.h"
#include "LogGenerator/OstrelLogGenerator.h"

namespace velmora {

namespace {

/// A redraw copies the display; a script of nothing else would only be slow. Those beyond these are left out.
constexpr int maximumRedraws = 8;

/// The input is a MessageScript that one decoder goes through.
class DecoderTarget final : public FuzzTarget {
public:
    explicit DecoderTarget(const FuzzedTechnology& technology) : _maker(technology) {}

    void run(Bytes input) override {
        DecoderSession session(_maker);
        if (goThrough(MessageScript(input), session) && session.state()["History"].asArray())
            expectSaved(session);
    }

private:
    static bool goThrough(MessageScript script, DecoderSession& session) {
        int redraws = 0;
        int reconnects = 0;
        while (const auto step = script.next()) {
            if (step->kind == MessageScript::Kind::Message) {
                if (!session.update(step->message))
                    return false;
            } else if (step->kind == MessageScript::Kind::Redraw) {
                if (++redraws <= maximumRedraws)
                    session.redraw();
            } else if (++reconnects <= maximumReconnects) {
                session.reconnect();
            }
        }
        return true;
    }

    /// What a snapshot saves is the history and, of the binary technologies, the raw messages in it.
    static void expectSaved(DecoderSession& session) {
        const Array& history = *session.state()["History"].asArray();
        require(!history.empty() && history.size() <= 5, "the history has 1 to 5 entries");
        std::size_t logSize = dlfVersionReportSize;
        for (const Value& entry : history)
            if (const Data* raw = (*entry.asDictionary())["DisplayState"].asData(); raw && raw->size() >= 2)
                logSize += raw->size() - 1;

        const ArrayRef contents = session.decoder().getSaveContentsFromState(session.state());
        require(contents->size() >= history.size() && contents->size() <= history.size() + 1,
                "a snapshot has the history and at most one log");
        if (contents->size() > history.size()) {
            const Data* log = (*(*contents)[history.size()].asDictionary())["DLF"].asData();
            require(log && log->size() == logSize, "the log has all raw messages of the history");
        }
    }

    ShippedTemplates _templates;
    DecoderMaker _maker;
};

} // namespace

std::unique_ptr<FuzzTarget> makeOstrelGSMTarget() {
    return std::make_unique<DecoderTarget>(fuzzedTechnologies[0]);
}

std::unique_ptr<FuzzTarget> makeLTETarget() {
    return std::make_unique<DecoderTarget>(fuzzedTechnologies[1]);
}

std::unique_ptr<FuzzTarget> makeUTRANTarget() {
    return std::make_unique<DecoderTarget>(fuzzedTechnologies[2]);
}

std::unique_ptr<FuzzTarget> makeC2KTarget() {
    return std::make_unique<DecoderTarget>(fuzzedTechnologies[3]);
}

std::unique_ptr<FuzzTarget> makeModemTarget() {
    return std::make_unique<DecoderTarget>(fuzzedTechnologies[4]);
}

std::unique_ptr<FuzzTarget> makeIFXTarget() {
    return std::make_unique<DecoderTarget>(fuzzedTechnologies[5]);
}

} // namespace velmora
