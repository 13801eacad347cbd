// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Resources.h"
#include "PropertyLists/PropertyList.h"

#include <map>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// Resources in memory. They are the process's resources for as long as this lives; the earlier ones come
/// back when it ends. Main thread only.
class FakeResources final : public Resources {
public:
    /// The application's version; absent unless set.
    std::optional<std::string> version;
    std::string stamp = "Sep 11 2019 18:54:57";

    FakeResources() : _earlier(setResources(this)) {}
    ~FakeResources() override { setResources(_earlier); }
    FakeResources(const FakeResources&) = delete;
    FakeResources& operator=(const FakeResources&) = delete;

    void put(std::string_view name, std::string_view type, Data content) {
        _contents.insert_or_assign({std::string(type), std::string(name)}, std::move(content));
    }

    /// Puts the value there as an XML property list; std::invalid_argument where it has no such form.
    void put(std::string_view name, std::string_view type, const Value& value) {
        const auto xml = writeXMLPropertyList(value);
        if (!xml)
            throw std::invalid_argument(xml.reason());
        put(name, type, Data(std::vector<std::uint8_t>(xml->begin(), xml->end())));
    }

    [[nodiscard]] Result<Data> read(std::string_view name, std::string_view type) const override {
        const auto content = _contents.find({std::string(type), std::string(name)});
        if (content == _contents.end())
            return Failure{"no resource " + std::string(name) + "." + std::string(type) + " in memory"};
        return content->second;
    }

    [[nodiscard]] std::vector<std::string> list(std::string_view type) const override {
        std::vector<std::string> names;
        for (const auto& [typeAndName, content] : _contents)
            if (typeAndName.first == type)
                names.push_back(typeAndName.second);
        return names;
    }

    [[nodiscard]] std::optional<std::string> bundleVersion() const override { return version; }
    [[nodiscard]] std::string buildStamp() const override { return stamp; }

private:
    Resources* _earlier;
    /// By type, then name, which is the order that `list` promises.
    std::map<std::pair<std::string, std::string>, Data> _contents;
};

} // namespace velmora
