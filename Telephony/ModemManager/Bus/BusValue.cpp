// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Bus/BusValue.h"

#include "Platform/UTF8.h"

#include <QDBusArgument>
#include <QDBusObjectPath>
#include <QDBusSignature>
#include <QDBusVariant>
#include <QStringList>

#include <limits>

namespace velmora {
namespace {

constexpr std::size_t longestQuote = 200;

/// Reads one message, counting what it takes.
class Reader {
public:
    Value read(const QVariant& content, int depth) {
        if (depth > BusBounds::depth || !count())
            return {};
        const int type = content.userType();
        if (type == qMetaTypeId<QDBusArgument>())
            return readContainer(content.value<QDBusArgument>(), depth);
        if (type == qMetaTypeId<QDBusVariant>())
            return read(content.value<QDBusVariant>().variant(), depth + 1);
        if (type == qMetaTypeId<QDBusObjectPath>())
            return text(content.value<QDBusObjectPath>().path());
        if (type == qMetaTypeId<QDBusSignature>())
            return text(content.value<QDBusSignature>().signature());
        switch (type) {
        case QMetaType::Bool: return content.toBool();
        case QMetaType::UChar:
        case QMetaType::Short:
        case QMetaType::UShort:
        case QMetaType::Int:
        case QMetaType::UInt:
        case QMetaType::LongLong: return content.toLongLong();
        case QMetaType::ULongLong: return unsignedNumber(content.toULongLong());
        case QMetaType::Double: return content.toDouble();
        case QMetaType::QString: return text(content.toString());
        case QMetaType::QByteArray: return data(content.toByteArray());
        case QMetaType::QStringList: return strings(content.toStringList());
        default: return {};
        }
    }

private:
    bool count() { return ++_count <= BusBounds::values; }

    static Value unsignedNumber(qulonglong number) {
        if (number > static_cast<qulonglong>(std::numeric_limits<std::int64_t>::max()))
            return {};
        return static_cast<std::int64_t>(number);
    }

    static Value text(const QString& text) {
        if (text.size() > static_cast<qsizetype>(BusBounds::text))
            return {};
        std::string bytes = text.toStdString();
        return bytes.size() <= BusBounds::text ? Value(std::move(bytes)) : Value();
    }

    static Value data(const QByteArray& bytes) {
        if (bytes.size() > static_cast<qsizetype>(BusBounds::text))
            return {};
        return Data(std::vector<std::uint8_t>(bytes.begin(), bytes.end()));
    }

    Value strings(const QStringList& list) {
        const ArrayRef array = makeArray();
        for (const QString& each : list)
            if (!append(*array, text(each)))
                break;
        return array;
    }

    /// False once there is no room for more.
    bool append(Array& array, Value value) {
        if (!count())
            return false;
        if (!value.isNone())
            array.append(std::move(value));
        return true;
    }

    // Nothing of a container that is too large is read any further: what is left of it goes with the message.
    Value readContainer(const QDBusArgument& argument, int depth) {
        switch (argument.currentType()) {
        case QDBusArgument::ArrayType: return readArray(argument, depth);
        case QDBusArgument::StructureType: return readStructure(argument, depth);
        case QDBusArgument::MapType: return readMap(argument, depth);
        case QDBusArgument::BasicType:
        case QDBusArgument::VariantType: return read(argument.asVariant(), depth + 1);
        default: return {};
        }
    }

    Value next(const QDBusArgument& argument, int depth) {
        // A container is not turned into a variant of its own first, which would read it twice.
        const auto type = argument.currentType();
        if (type == QDBusArgument::BasicType || type == QDBusArgument::VariantType)
            return read(argument.asVariant(), depth + 1);
        if (depth + 1 > BusBounds::depth || !count()) {
            static_cast<void>(argument.asVariant());
            return {};
        }
        return readContainer(argument, depth + 1);
    }

    Value readArray(const QDBusArgument& argument, int depth) {
        const ArrayRef array = makeArray();
        argument.beginArray();
        while (!argument.atEnd() && _count < BusBounds::values)
            if (Value each = next(argument, depth); !each.isNone())
                array->append(std::move(each));
        argument.endArray();
        return array;
    }

    Value readStructure(const QDBusArgument& argument, int depth) {
        const ArrayRef array = makeArray();
        argument.beginStructure();
        while (!argument.atEnd() && _count < BusBounds::values)
            array->append(next(argument, depth));
        argument.endStructure();
        return array;
    }

    Value readMap(const QDBusArgument& argument, int depth) {
        const DictionaryRef dictionary = makeDictionary();
        argument.beginMap();
        while (!argument.atEnd() && _count < BusBounds::values) {
            argument.beginMapEntry();
            const Value key = next(argument, depth);
            Value value = next(argument, depth);
            argument.endMapEntry();
            if (value.isNone())
                continue;
            if (const std::string* name = key.asString())
                dictionary->set(*name, std::move(value));
            else if (const std::int64_t* number = key.asInteger())
                dictionary->set(std::to_string(*number), std::move(value));
        }
        argument.endMap();
        return dictionary;
    }

    std::size_t _count = 0;
};

} // namespace

Value busValue(const QVariant& content) {
    return Reader().read(content, 0);
}

std::string printableForLog(std::string_view text) {
    std::string quoted;
    std::size_t offset = 0;
    while (offset < text.size() && quoted.size() < longestQuote) {
        const auto character = nextCharacter(text, offset);
        if (!character)
            ++offset;
        if (!character || *character < 0x20 || (*character >= 0x7F && *character < 0xA0))
            quoted += '?';
        else
            appendUTF8(quoted, *character);
    }
    return quoted;
}

} // namespace velmora
