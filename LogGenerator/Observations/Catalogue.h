// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstddef>
#include <cstdint>
#include <deque>
#include <map>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// What an observed value is.
enum class ObservedKind : std::uint8_t {
    Number,
    Enumeration, ///< a raw number and its text
    Flag,
    Text,
    Binary,
    Absent, ///< no value, and the text that says so
};

/// As the catalogue writes it: "number", "enumeration", "flag", "text", "bytes", "absent".
[[nodiscard]] std::string_view nameOf(ObservedKind kind);

/// One record that a leaf is read from, and where it lies there.
struct CatalogueSource {
    std::uint32_t code;         ///< the log code, 0xFF0000 added for the extra stream
    const Field* field;         ///< place, format and meaning: a constant
    const List* list = nullptr; ///< whose entry the place counts from; null for the record itself
    std::uint8_t subPacket = 0; ///< of the record, that the place counts from; 0 for the record itself
};

struct CatalogueField;

/// A place in the display: a dictionary's key or, named "*", the rows of a list.
class CatalogueNode {
public:
    CatalogueNode(std::string_view name, CatalogueNode* parent) : _name(name), _parent(parent) {}

    [[nodiscard]] const std::string& name() const { return _name; }
    /// Null for the root.
    [[nodiscard]] const CatalogueNode* parent() const { return _parent; }
    [[nodiscard]] bool isRow() const { return _name == "*"; }
    /// Null where nothing is shown here itself.
    [[nodiscard]] CatalogueField* leaf() const { return _leaf; }
    /// The child of that name; null where there is none.
    [[nodiscard]] CatalogueNode* find(std::string_view name) const;
    /// The child of that name, which is made where there is none.
    [[nodiscard]] CatalogueNode& child(std::string_view name);
    [[nodiscard]] CatalogueNode& rows() { return child("*"); }
    [[nodiscard]] std::string path() const;
    /// Whether messages name leaves of their own below this node.
    [[nodiscard]] bool isOpen() const { return _isOpen; }
    void setOpen() { _isOpen = true; }
    [[nodiscard]] const std::vector<std::unique_ptr<CatalogueNode>>& children() const { return _children; }
    /// How many nodes there are below the root. Of the root alone.
    [[nodiscard]] std::size_t count() const { return _count; }
    /// Of a list's rows: the names of the leaves that identify one.
    [[nodiscard]] std::span<const std::string_view> keys() const { return _keys; }
    /// The names must be constants.
    void setKeys(std::span<const std::string_view> keys) { _keys = keys; }

private:
    friend class Catalogue;
    std::string _name;
    CatalogueNode* _parent;
    CatalogueField* _leaf = nullptr;
    bool _isOpen = false;
    std::size_t _count = 0;
    std::span<const std::string_view> _keys;
    std::vector<std::unique_ptr<CatalogueNode>> _children;
    std::map<std::string_view, CatalogueNode*> _byName; ///< the children: a free tree may have very many
};

/// A leaf of the display: one row of the catalogue.
struct CatalogueField {
    std::size_t index = 0; ///< in the catalogue
    const CatalogueNode* node = nullptr;
    std::string path;    ///< in the display, "*" for a row of a list: "/GSM/Neighboring Cells/*/RSSI"
    std::string section; ///< empty where the technology has no sections
    std::deque<CatalogueSource> sources; ///< each stays where it is
    ObservedKind kind = ObservedKind::Text;
    Unit unit = Unit::None;
    Role role = Role::None;
    Identity identity = Identity::None;
    std::string_view clause;
    std::span<const std::string_view> keys; ///< the names of the leaves that identify its row
    std::vector<std::string> absentTexts;
    std::string sameAs;          ///< the path that shows the same value first; empty for none
    bool isReadFromText = false; ///< its number is read from a text, since the messages hold nothing else
};

/// Every leaf that the displays of a technology can show. It is made from the tables of the sections and
/// grows only where messages name their own leaves, as free trees do. Main thread only.
class Catalogue {
public:
    using Node = CatalogueNode;

    explicit Catalogue(std::string_view technology) : _technology(technology), _root("", nullptr) {}
    Catalogue(const Catalogue&) = delete;
    Catalogue& operator=(const Catalogue&) = delete;

    /// The technology's short name.
    [[nodiscard]] const std::string& technology() const { return _technology; }
    [[nodiscard]] Node& root() { return _root; }
    [[nodiscard]] const Node& root() const { return _root; }
    /// In the order of the display. Grows at the end; what is in it stays where it is.
    [[nodiscard]] const std::deque<CatalogueField>& fields() const { return _fields; }

    /// The leaf at the node, which is made where there is none.
    CatalogueField& leafAt(Node& node, std::string_view section);
    /// Adds a source to the leaf at the node, which is made from the first one.
    CatalogueField& add(Node& node, std::string_view section, const CatalogueSource& source);

    /// Whether so many leaves have been named that further ones of messages are not observed: a hostile or
    /// damaged recording may name others in each message.
    [[nodiscard]] bool isFull() const { return _root.count() >= mostNodes; }
    static constexpr std::size_t mostNodes = std::size_t{1} << 17;

    /// Whether the messages hold nothing but texts, so that numbers are read from them.
    [[nodiscard]] bool readsNumbersFromTexts() const { return _readsNumbersFromTexts; }
    void setReadsNumbersFromTexts() { _readsNumbersFromTexts = true; }

    /// The leaf that showed the field of that list (null: of none) first: this one where there was none.
    const CatalogueField* firstOf(const List* list, const Field& field, const CatalogueField& leaf) {
        return _first.try_emplace({list, &field}, &leaf).first->second;
    }

private:
    std::string _technology;
    std::map<std::pair<const List*, const Field*>, const CatalogueField*> _first;
    std::deque<CatalogueField> _fields;
    Node _root;
    bool _readsNumbersFromTexts = false;
};

/// The kind and unit of a field's physical value, and what makes the shown number physical.
[[nodiscard]] ObservedKind kindOf(const Field& field);
[[nodiscard]] Unit unitOf(const Field& field);
/// Physical value = shown value * scale + offset.
[[nodiscard]] double physicalScale(const Field& field);

} // namespace velmora
