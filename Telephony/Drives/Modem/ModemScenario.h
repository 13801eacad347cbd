// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/Modem/ModemPhone.h"

#include <functional>

namespace velmora {

/// A drive with a modem that ModemManager looks after, in the technology Modem, through GSM, UMTS, LTE and NR
/// of test networks 001/01 and 001/02 (NRNetwork). What an engineer sees in a round of some four minutes:
///
/// - No ModemManager, no permission, no modem; then a modem whose SIM asks for its PIN.
/// - GSM, idle and with a packet session; UMTS, at first known by its identity alone; LTE in two bands, with
/// a
///   second context; LTE and NR (non-standalone); NR alone in two bands, where the session begins anew.
/// - Loss of coverage, which suspends and ends the session; limited service; the SIM of the other slot, whose
///   modem reports no neighbours and whose first context fails.
/// - Unplugging; the return under another number, failed without its SIM, then without permission to see
///   cells; a ModemManager that does not answer.
///
/// Cells, link, traffic and position are reported every 2 s, the rest less often, and all of it when the
/// modem changes. The phone reselects when a neighbour has been 4 dB better for 2 s. About every ten seconds
/// a message is unusual (see UnusualMessage): property lists that are cut in each of the eight codes, and
/// cells whose values are of other kinds or out of range, in place of counts that are too high. Main thread
/// only.
class ModemScenario final : public DriveScenario {
public:
    explicit ModemScenario(std::uint64_t seed);
    [[nodiscard]] std::string_view technology() const override;
    void setIdentities(const DriveIdentities& identities) override { _phone.identities = identities; }
    /// Sessions on GSM and on LTE in which nothing arrives for a while, in a round of less than three
    /// minutes.
    void addIncidents() override;

    /// What the messages are of: the modem and the cells around it after the last step.
    [[nodiscard]] const ModemPhone& phone() const { return _phone; }
    [[nodiscard]] const NRNetwork& network() const { return _network; }

private:
    static const Phase phases[];
    static const Phase incidents[];

    /// What happens to the modem; each adds its steps to the script, from now on.
    void loseManager();
    void losePermission();
    void findNoModem();
    void plugInLocked();
    void unlock();
    void startSession();
    void changeToUMTS();
    void changeToLTE();
    void changeLTECarrier();
    void addSecondary();
    void changeToNR();
    void changeNRCarrier();
    void loseCoverage();
    void findLimitedService();
    void changeSIM();
    void unplug();
    void returnWithoutSIM();
    void returnWithSIM();
    void stopAnswering();
    void stall() { _isStalled = true; }
    void flow() { _isStalled = false; }

    void drive(double seconds) override;
    [[nodiscard]] const RadioNetwork& road() const override { return _network.radio(); }
    void react() override;
    void addReports(DriveScript& due) override;
    void countUntil(double at) override;
    [[nodiscard]] UnusualMessageParts unusualMessageParts(std::size_t number) override;
    [[nodiscard]] std::unique_ptr<DriveTruth> makeTruth(TruthSink& sink) const override;

    /// Adds a change and the messages of all codes after it.
    void addChange(double delay, const std::function<void()>& change);
    void addAbsence(ModemPresence presence, const char* reason);
    /// Adds the steps from a disabled modem to a registered one; `delay` is that of the first.
    void addRegistration(double delay, ModemCell::Radio radio);
    /// Camps on the best cell of that technology and carrier; registers there, unless service is limited.
    void camp(ModemCell::Radio radio, std::size_t carrier);
    void updateRegistration();
    void updateSecondary();
    /// Connects a bearer, which may have been connected before.
    void connect(int number, bool isIPv6);

    NRNetwork _network;
    ModemPhone _phone;
    ModemReportContext _context;
    bool _isLimited = false; ///< the network denies its service
    bool _isStalled = false; ///< nothing arrives, whatever is sent
    double _countedUntil = 0;
};

} // namespace velmora
