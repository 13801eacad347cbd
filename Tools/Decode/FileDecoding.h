// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Decoding.h"
#include "Tools/Decode/TechnologyDecoder.h"
#include "Tools/Messages/TechnologyChoice.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// The decoding of a file: its technologies' decoders, in the file's order.
class FileDecoding {
public:
    FileDecoding(MessageReader& reader, const DecodingRequest& request, WorkContext& context,
                 DecodingObserver& observer)
        : _reader(reader), _request(request),
          _context(context), _shared{observer,           MessageFilter(request.messages),
                                     request.isStrict,   request.checkDecoder,
                                     observer.effects(), observer.wantsEveryRefresh()} {}

    Result<DecodedFile> run();

private:
    /// One of the file's technologies; without a decoder where it is unknown.
    struct Technology {
        std::unique_ptr<TechnologyDecoder> decoder;
        std::string reason;
    };
    struct DueRefresh {
        Time tick;
        TechnologyDecoder* decoder;
    };

    [[nodiscard]] Result<Done> begin();
    void take(const LoggedMessage& message);
    /// The technology of that index, whose decoder is made on its first message.
    [[nodiscard]] Technology& at(std::uint32_t index) {
        return index < _technologies.size() && _technologies[index].decoder ? _technologies[index]
                                                                            : make(index);
    }
    [[nodiscard]] Technology& make(std::uint32_t index);
    void refreshAllBefore(const LoggedMessage& message);
    void refreshDue();
    void noteSeveral();
    [[nodiscard]] DecodedFile finish();
    [[nodiscard]] std::vector<std::string> known() const {
        return knownTechnologies(_request.technologies, _reader);
    }
    [[nodiscard]] bool refuses() const {
        return _request.several == DecodingRequest::Several::Refuse && _request.technology.empty() &&
               known().size() > 1;
    }
    [[nodiscard]] bool decodesAll() const {
        return _request.several == DecodingRequest::Several::Decode && _choice.override.empty() &&
               !_choice.only;
    }

    MessageReader& _reader;
    const DecodingRequest& _request;
    WorkContext& _context;
    SharedDecoding _shared;
    TechnologyChoice _choice;
    std::vector<Technology> _technologies;
    std::vector<DueRefresh> _due;
    bool _hasSeveral = false; ///< several technologies are decoded
};

} // namespace velmora
