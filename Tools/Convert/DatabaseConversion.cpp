// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/DatabaseConversion.h"

#include "Export/Database/Database.h"
#include "Recording/Positions/FixAssembler.h"
#include "Tools/Analysed/FileMessages.h"
#include "Tools/Convert/DatabaseAnalysis.h"
#include "Tools/Decode/ShownProgress.h"
#include "Tools/Decode/TrackedResources.h"
#include "Tools/Rules/RuleFiles.h"

#include <memory>
#include <vector>

namespace velmora {

namespace {

/// Puts the positions of a file into the database while its messages are read.
class Positions {
public:
    Positions(MessageReader& reader, const DatabaseChoice& choice, RecordingDatabase& database)
        : _reader(reader), _choice(choice), _database(database) {
        reader.setSentences([this](const PositionSentence& sentence) { add(_assembler.add(sentence)); });
    }
    ~Positions() { _reader.setSentences({}); }
    Positions(const Positions&) = delete;
    Positions& operator=(const Positions&) = delete;

    void finish() { add(_assembler.finish()); }

private:
    void add(const std::optional<Fix>& fix) {
        if (fix && _choice.isIn(fix->time))
            _database.add(*fix);
    }

    MessageReader& _reader;
    const DatabaseChoice& _choice;
    RecordingDatabase& _database;
    FixAssembler _assembler;
};

} // namespace

Result<bool> convertToDatabase(MessageReader& reader, const Conversion& conversion, WorkContext& context) {
    Result<Database> database = Database::create(conversion.temporary);
    if (!database)
        return Failure{"cannot write " + conversion.name + ": " + database.reason()};
    const TrackedResources resources;
    const AllCatalogues catalogues;
    const RuleSet rules = loadRules(catalogues, {});
    if (!rules.errors().empty())
        return Failure{rules.errors().front().message()};
    std::optional<RecordingDatabase> tables(*database);
    DatabaseChoice choice{conversion.attributes, conversion.messages, std::nullopt};
    Positions positions(reader, choice, *tables);
    AnalysisFeed feed(AnalysisClock::Arrival, [&](const Catalogue& catalogue) {
        return std::make_unique<DatabaseAnalysis>(catalogue, rules, choice, *tables);
    });
    ShownProgress progress(reader, conversion.path, false);
    FileMessages messages(reader, {0, conversion.path, conversion.technology}, feed, context);
    messages.setProgress(progress.get());
    const Result<Done> read = messages.run([&] { return database->failure().has_value(); });
    progress.clear();
    if (!read)
        return Failure{conversion.title + ": " + read.reason()};
    if (reader.failure())
        return Failure{conversion.title + ": " + reader.failure()->reason};
    if (!resources.failure().empty())
        return Failure{conversion.title + ": decoded without its template: " + resources.failure()};
    feed.finish();
    positions.finish();
    tables->finish();
    tables.reset(); // its statements, before the database is closed
    if (const Result<Done> finished = database->finish(); !finished)
        return Failure{"cannot write " + conversion.name + ": " + finished.reason()};
    return messages.undecoded().report(conversion.title);
}

} // namespace velmora
