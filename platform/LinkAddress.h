#pragma once
// Where an instrument is to be found.

#include <string>

namespace zel {

/// The fastest rate that a serial port is opened at, in bits per second.
inline constexpr int kFastestBaud = 10'000'000;

struct LinkAddress {
    /// The kinds from `TwoModems` on dial first.
    enum class Kind { Serial, Tcp, Tls, TwoModems, TwoPhones, ModemToPhone, PhoneToModem };
    Kind kind = Kind::Serial;
    std::string port;         ///< device name, or host
    int number = 0;           ///< baud rate, or TCP port
    std::string phone = {};   ///< the number to dial
    std::string pinned = {};  ///< fingerprint of the server's certificate; empty: by authority

    bool overNetwork() const { return kind == Kind::Tcp || kind == Kind::Tls; }
    bool dialled() const { return kind != Kind::Serial && !overNetwork(); }
};

}  // namespace zel
