// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/InfoJSON.h"

#include "PropertyLists/Value.h"
#include "Tools/Text/JSONText.h"
#include "Tools/Text/TimeText.h"

namespace velmora {

namespace {

Value number(std::uint64_t value) {
    return Value(static_cast<std::int64_t>(value));
}

Value timeValue(Time moment) {
    TextBuffer text;
    TimeText().append(text, moment);
    return Value(std::string(text.view()));
}

Value countValue(const MessageSummary::Count& counted) {
    const DictionaryRef count = makeDictionary();
    count->set("messages", number(counted.messages));
    if (counted.messages != 0) {
        count->set("record", number(counted.firstNumber));
        count->set("offset", number(counted.firstOffset));
    }
    return count;
}

Value codesValue(const TechnologyInfo& technology) {
    const ArrayRef codes = makeArray();
    for (const auto& [code, counted] : technology.summary.codes()) {
        const DictionaryRef entry = makeDictionary();
        entry->set("code", number(code));
        entry->set("messages", number(counted.messages));
        const ArrayRef names = makeArray();
        if (technology.names.namesOf)
            for (const std::string& name : technology.names.namesOf(code))
                names->append(name);
        entry->set("names", names);
        codes->append(entry);
    }
    return codes;
}

Value technologyValue(const TechnologyInfo& technology) {
    const MessageSummary& summary = technology.summary;
    const DictionaryRef value = makeDictionary();
    value->set("technology", technology.name.empty() ? Value() : Value(technology.name));
    if (summary.first()) {
        value->set("first", timeValue(*summary.first()));
        value->set("last", timeValue(*summary.last()));
    }
    value->set("messages", number(summary.messages()));
    value->set("bytes", number(summary.bytes()));
    if (summary.isBinary()) {
        value->set("prefixed", countValue(summary.prefixed()));
        value->set("tooShort", countValue(summary.tooShort()));
        value->set("wrongType", countValue(summary.wrongType()));
    }
    value->set("undecoded", countValue(summary.undecoded()));
    if (summary.isBinary())
        value->set("codes", codesValue(technology));
    return value;
}

Value lossesValue(const MessageReader& reader) {
    const ArrayRef first = makeArray();
    for (const Loss& loss : reader.losses()) {
        const DictionaryRef entry = makeDictionary();
        entry->set("record", number(loss.recordNumber));
        entry->set("offset", number(loss.offset));
        entry->set("bytes", number(loss.bytes));
        entry->set("reason", loss.reason);
        first->append(entry);
    }
    const DictionaryRef losses = makeDictionary();
    losses->set("count", number(reader.lossTotals().losses));
    losses->set("bytes", number(reader.lossTotals().bytes));
    losses->set("first", first);
    return losses;
}

const char* nameOf(Comment::About about) {
    switch (about) {
    case Comment::About::Snapshot: return "snapshot";
    case Comment::About::Section: return "section";
    case Comment::About::Interface: return "interface";
    case Comment::About::Message: break;
    }
    return "record";
}

Value commentsValue(const Comments& comments) {
    const ArrayRef first = makeArray();
    for (const Comment& comment : comments.first()) {
        const DictionaryRef entry = makeDictionary();
        entry->set("about", nameOf(comment.about));
        if (comment.about != Comment::About::Snapshot) {
            entry->set("number", number(comment.number));
            entry->set("offset", number(comment.offset));
        }
        entry->set("text", comment.text);
        first->append(entry);
    }
    const DictionaryRef value = makeDictionary();
    value->set("count", number(comments.count()));
    value->set("first", first);
    return value;
}

Value positionsValue(const PositionInfo& positions) {
    const DictionaryRef value = makeDictionary();
    value->set("fixes", number(positions.fixes));
    value->set("first", timeValue(*positions.first));
    value->set("last", timeValue(*positions.last));
    value->set("messages", number(positions.messages));
    return value;
}

} // namespace

std::string infoJson(const std::string& file, const FileInfo& info, const MessageReader& reader) {
    const DictionaryRef object = makeDictionary();
    object->set("file", file);
    object->set("form", std::string(reader.form()));
    object->set("compressed", reader.isCompressed());
    const ArrayRef technologies = makeArray();
    for (const TechnologyInfo& technology : info.technologies)
        technologies->append(technologyValue(technology));
    object->set("technologies", technologies);
    if (info.positions.fixes > 0)
        object->set("positions", positionsValue(info.positions));
    object->set("losses", lossesValue(reader));
    object->set("comments", commentsValue(reader.comments()));
    TextBuffer text;
    appendIndentedJson(text, object);
    text.append('\n');
    return std::string(text.view());
}

} // namespace velmora
