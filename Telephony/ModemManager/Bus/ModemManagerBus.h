// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "PropertyLists/Value.h"

#include <QVariantList>

#include <chrono>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// A method of ModemManager's and its arguments.
struct BusCall {
    std::string path;
    std::string_view interface;
    std::string_view method;
    QVariantList arguments;
    std::chrono::milliseconds timeout{25'000}; ///< after which the answer is an error
    bool startsService = false;                ///< the bus may start ModemManager for it
};

/// The result of a call: its first return value, or the name and text of an error.
struct BusReply {
    Value value;       ///< none where the method has no result, and on an error
    std::string error; ///< as the bus names it; empty where there is none
    std::string text;
    std::string sender; ///< the address on the bus of what answered

    [[nodiscard]] bool failed() const { return !error.empty(); }
    /// The modem or ModemManager cannot do it.
    [[nodiscard]] bool isUnsupported() const;
    /// The bus or ModemManager denies access.
    [[nodiscard]] bool isDenied() const;
    /// The service does not exist.
    [[nodiscard]] bool isAbsent() const;
    /// The error as a log line ends in it: "NAME: WORDS".
    [[nodiscard]] std::string reason() const;
};

/// A connection to the bus that ModemManager lives on. No callback runs after it was closed or destroyed, or
/// inside its own functions. No call blocks on ModemManager. Main thread only, on Qt's event loop.
class ModemManagerBus {
public:
    class Observer {
    public:
        virtual ~Observer() = default;
        /// ModemManager has come to the bus. Not called for one that was there when the bus was opened.
        virtual void serviceAppeared() = 0;
        /// It has left the bus. Pending calls are not answered any more.
        virtual void serviceVanished() = 0;
        /// The connection to the bus has ended; no further callbacks until it is opened again.
        virtual void busLost() = 0;
        /// ModemManager sent one of its objects' signals.
        virtual void signalArrived(const std::string& path, std::string_view member,
                                   const Array& arguments) = 0;
    };

    /// `address` is a bus's address, the system bus's where it is empty. The observer must outlive the bus.
    ModemManagerBus(std::string address, Observer& observer);
    ~ModemManagerBus();
    ModemManagerBus(const ModemManagerBus&) = delete;
    ModemManagerBus& operator=(const ModemManagerBus&) = delete;

    /// Connects, and listens to the signals of the object manager and of changed properties. The failure says
    /// why there is no connection. Precondition: not open.
    Result<Done> open();
    [[nodiscard]] bool isOpen() const { return _connection != nullptr; }
    /// Does nothing on a closed bus. Precondition: not called from inside a callback of the bus.
    void close();

    using Answered = std::function<void(const BusReply&)>;
    /// Calls asynchronously; `answered` runs later, unless the service vanishes or the bus is closed before.
    /// Does nothing on a closed bus.
    void call(const BusCall& call, Answered answered);
    /// Calls and ignores the answer. Calls sent before the bus is closed are still delivered.
    void send(const BusCall& call);

private:
    class Connection;

    std::string _address;
    Observer& _observer;
    std::unique_ptr<Connection> _connection; ///< null while the bus is not open
};

} // namespace velmora
