#include "bench/ServedLine.h"

#include <sys/types.h>
#include <unistd.h>

#include <QByteArray>
#include <QFile>
#include <QList>
#include <QTemporaryDir>
#include <chrono>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include "bench/CoreSession.h"
#include "bench/Figures.h"
#include "bench/Process.h"
#include "link/CommandExchange.h"
#include "platform/LinkAddress.h"
#include "support/NumberText.h"

namespace zelbench {
namespace {

constexpr int kBaud = 57600;
constexpr int kRounds = 7;
constexpr int kPacedSweeps = 3;
constexpr int kUnpacedSweeps = 60;
constexpr int kQueries = 60;
constexpr int kStartSeconds = 20;
constexpr double kMayTake = 0.015;  // seconds more
constexpr int kIdleSeconds = 20;
constexpr double kMostShare = 0.001;
constexpr double kMostMemory = 30e6;

class Server {
  public:
    Server(const std::string& console, const std::string& device, const std::string& group)
        : process_(console,
                   {"--home", home_.path().toStdString(), "serve", "--serial", device, "--baud",
                    std::to_string(kBaud), "--listen", "127.0.0.1:0", "--group", group}) {
        const std::string listening = process_.line(kStartSeconds);
        port_ = static_cast<int>(zel::leadingNumber(listening.substr(listening.rfind(':') + 1)));
        process_.line(kStartSeconds);  // the instrument
    }
    zel::LinkAddress address() const { return {zel::LinkAddress::Kind::Tcp, "127.0.0.1", port_}; }
    pid_t id() const { return process_.id(); }

  private:
    QTemporaryDir home_;
    Process process_;
    int port_ = 0;
};

double secondsOfSweeps(const zel::LinkAddress& address, int sweeps) {
    CoreSession session(address);
    session.sweep();
    return timeOf([&] {
               for (int i = 0; i < sweeps; ++i) session.sweep();
           }) /
           sweeps;
}

double secondsOfQueries(const zel::LinkAddress& address) {
    CoreSession session(address);
    std::string value;
    return timeOf([&] {
               for (int i = 0; i < kQueries; ++i)
                   if (!session.program().exchange().GetInstrument("FREQ", value))
                       throw std::runtime_error("a query failed");
           }) /
           kQueries;
}

/// Medians of both sides, and of the ratios direct / served, in rounds that take turns.
struct Compared {
    double direct;
    double served;
    double ratio;
};

template <typename Measure>
Compared compare(const Simulator& instrument, const std::string& console, const std::string& group,
                 const Measure& measure) {
    std::vector<double> direct;
    std::vector<double> served;
    std::vector<double> ratios;
    for (int round = 0; round < kRounds; ++round) {
        direct.push_back(measure({zel::LinkAddress::Kind::Serial, instrument.device(), kBaud}));
        const Server server(console, instrument.device(), group);
        served.push_back(measure(server.address()));
        ratios.push_back(direct.back() / served.back());
    }
    return {median(direct), median(served), median(ratios)};
}

Figure sweeps(const std::string& what, const Compared& got, double limit) {
    return {
        what, timeText(got.served), "on the line, " + timeText(got.direct), got.ratio, limit, true,
        ""};
}

QList<QByteArray> numbersOf(pid_t process, const char* file) {
    QFile numbers(QString("/proc/%1/%2").arg(process).arg(file));
    if (!numbers.open(QIODevice::ReadOnly)) throw std::runtime_error("the server has ended");
    const QByteArray text = numbers.readAll();
    return text.mid(text.lastIndexOf(')') + 1).simplified().split(' ');
}

/// Seconds of a core that the process has used. The ticks of the clock are 10 ms, as much as an
/// idle server takes in many seconds; the scheduler counts nanoseconds, of the first thread, and
/// the server has no other.
double cpuSeconds(pid_t process) {
    const QList<QByteArray> exact = numbersOf(process, "schedstat");
    constexpr int kNumbers = 3;
    if (exact.size() == kNumbers) return static_cast<double>(exact[0].toLongLong()) / 1e9;
    constexpr int kUser = 11;  // after the name, from 0
    const QList<QByteArray> fields = numbersOf(process, "stat");
    const double ticks = static_cast<double>(fields.value(kUser).toLongLong() +
                                             fields.value(kUser + 1).toLongLong());
    return ticks / static_cast<double>(sysconf(_SC_CLK_TCK));
}

double residentBytes(pid_t process) {
    const double pages = static_cast<double>(numbersOf(process, "statm").value(1).toLongLong());
    return pages * static_cast<double>(sysconf(_SC_PAGESIZE));
}

}  // namespace

Figure servedPaced(const std::string& simulator, const std::string& console) {
    const Simulator instrument(simulator, {"--baud", std::to_string(kBaud), "--speed", "1000000"});
    return sweeps("(w) sweep through the server, line at 57,600 baud",
                  compare(instrument, console, "10",
                          [](const zel::LinkAddress& address) {
                              return secondsOfSweeps(address, kPacedSweeps);
                          }),
                  0.95);
}

Figure servedUnpaced(const std::string& simulator, const std::string& console) {
    const Simulator instrument(simulator, {"--speed", "1000000"});
    return sweeps("(w) sweep through the server, unpaced pty",
                  compare(instrument, console, "10",
                          [](const zel::LinkAddress& address) {
                              return secondsOfSweeps(address, kUnpacedSweeps);
                          }),
                  0.5);
}

Figure servedRoundTrip(const std::string& simulator, const std::string& console) {
    const Simulator instrument(simulator, {"--baud", std::to_string(kBaud), "--speed", "1000000"});
    // A query is two round trips: the mode word and the name.
    const Compared got = compare(instrument, console, "10", secondsOfQueries);
    const double more = (got.served - got.direct) / 2;
    return {"(w) round trip through the server",
            timeText(got.served / 2),
            "on the line, " + timeText(got.direct / 2) + ", and 15 ms more",
            more / kMayTake,
            1,
            false,
            ""};
}

Figure servedIdle(const std::string& simulator, const std::string& console) {
    const Simulator instrument(simulator, {});
    const Server server(console, instrument.device(), "10");
    std::this_thread::sleep_for(std::chrono::seconds(1));
    const double before = cpuSeconds(server.id());
    std::this_thread::sleep_for(std::chrono::seconds(kIdleSeconds));
    const double share = (cpuSeconds(server.id()) - before) / kIdleSeconds;
    return {"(w) server without a client, share of a core",
            numberText(share * 100) + " %",
            "0.1 %",
            share / kMostShare,
            1,
            false,
            ""};
}

Figure servedMemory(const std::string& simulator, const std::string& console) {
    const Simulator instrument(simulator, {});
    const Server server(console, instrument.device(), "10");
    const double bytes = residentBytes(server.id());
    return {"(w) server without a client, memory",
            numberText(bytes / 1e6) + " MB",
            "30 MB",
            bytes / kMostMemory,
            1,
            false,
            ""};
}

}  // namespace zelbench
