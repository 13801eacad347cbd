// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/RateMemory.h"

#include "Platform/SystemLog.h"

#include <fstream>
#include <system_error>

namespace velmora {

std::optional<RememberedRate> RateMemory::read() const {
    if (_directory.empty())
        return std::nullopt;
    std::ifstream file(_directory / fileName);
    RememberedRate rate;
    if (!(file >> rate.owner >> rate.modem >> rate.ours >> rate.earlier))
        return std::nullopt;
    return rate;
}

void RateMemory::write(const RememberedRate& rate) const {
    if (_directory.empty())
        return;
    // Under another name first: half a file would be read as a rate.
    const std::filesystem::path temporary = _directory / (std::string(fileName) + ".new");
    std::ofstream file(temporary, std::ios::trunc);
    file << rate.owner << '\n' << rate.modem << '\n' << rate.ours << '\n' << rate.earlier << '\n';
    file.close();
    std::error_code error;
    if (file)
        std::filesystem::rename(temporary, _directory / fileName, error);
    if (!file || error)
        logFormat(LogPriority::Warning, "modemmanager: %s: cannot be written",
                  (_directory / fileName).c_str());
}

void RateMemory::clear() const {
    std::error_code error; // one that is not there is as good as removed
    if (!_directory.empty())
        std::filesystem::remove(_directory / fileName, error);
}

} // namespace velmora
