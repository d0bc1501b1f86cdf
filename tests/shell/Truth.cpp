#include "tests/shell/Truth.h"

#include <algorithm>
#include <cmath>
#include <utility>

#include "model/CodeTables.h"
#include "support/ByteCast.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kBlock = 1204;
constexpr std::size_t kPoints = 301;
constexpr const char* kFile = "/truth.csv";

/// The samples of a block or two in the order of the wire; no number for those that are missing.
std::vector<double> wireSamples(std::string bytes, bool pairs) {
    if (pairs && bytes.size() > kBlock) bytes.erase(kBlock, 1);
    const auto* data = reinterpret_cast<const unsigned char*>(bytes.data());
    std::vector<double> wire(pairs ? 2 * kPoints : kPoints, std::nan(""));
    for (std::size_t i = 0; i < wire.size() && 4 * i + 4 <= bytes.size(); ++i)
        wire[i] = int32FromLittleEndian(data + 4 * i);
    return wire;
}

/// The same as the display orders them.
std::vector<double> displayed(const std::vector<double>& wire, bool pairs) {
    if (!pairs) return wire;
    std::vector<double> values(wire.size());
    for (std::size_t i = 0; i < kPoints; ++i) {
        values[2 * i] = wire[i];
        values[2 * i + 1] = wire[kPoints - 1 + i];
    }
    return values;
}

}  // namespace

const char* nameOf(LineFault fault) {
    constexpr const char* kNames[] = {"none",    "drop",  "garble", "flip",
                                      "silence", "pause", "close"};
    return kNames[static_cast<int>(fault)];
}

void TruthTap::arm(LineFault fault, long at, int pauseMs) {
    fault_ = fault;
    left_ = at;
    pauseMs_ = pauseMs;
    silent_ = false;
}

void TruthTap::sent(std::string_view bytes) {
    for (const char c : bytes) {
        if (c != '\r') {
            line_ += c;
            continue;
        }
        const std::string mode = upperCase(line_);
        if (mode == "CMD" || mode == "SET" || mode == "GET") ++exchanges_;
        inBlock_ = line_ == "TRACEBIN";
        if (inBlock_) block_.clear();
        word_ = std::exchange(line_, {}).substr(0, line_.find(','));
        clean_ = true;
        lines_ = 0;
    }
}

std::string TruthTap::pass(const std::string& bytes) {
    std::string out;
    if (!late_.empty() && clock_.micros() >= lateAt_) out = std::exchange(late_, {});
    for (char c : bytes) {
        ++passed_;
        const bool hit = fault_ != LineFault::None && left_-- == 0;
        bool lost = silent_ || closed_;
        if (hit) {
            ++faults_;
            const LineFault fault = std::exchange(fault_, LineFault::None);
            if (fault == LineFault::Garble) c = garbled(c);
            if (fault == LineFault::Flip) c = static_cast<char>(c ^ 1);
            if (fault == LineFault::Drop) lost = true;
            if (fault == LineFault::Silence) lost = silent_ = true;
            if (fault == LineFault::Close) lost = closed_ = true;
            if (fault == LineFault::Pause)
                lateAt_ = clock_.micros() + std::int64_t{pauseMs_} * 1000;
            if (fault == LineFault::Pause && late_.empty()) {
                late_ += c;
                events_.schedule(pauseMs_, [this] { Woke(); });
            }
            clean_ = false;
            if (fault == LineFault::Garble || fault == LineFault::Flip || fault == LineFault::Drop)
                spoiled_.insert(word_);
            if (inBlock_) block_ += c;
            if (fault == LineFault::Pause) continue;
            if (!lost) out += c;
            continue;
        }
        if (inBlock_) block_ += c;
        if (!late_.empty()) {
            late_ += c;
        } else if (!lost) {
            out += c;
            // A status and a value, and both as they were sent.
            if (c == '\r' && ++lines_ == 2 && clean_) spoiled_.erase(word_);
        }
    }
    return out;
}

bool TruthPort::open(const SerialSetup& setup) {
    tap_.reopened();
    return inner_.open(setup);
}

std::string TruthPort::input() {
    if (!isOpen()) return {};
    return tap_.pass(inner_.input());
}

void TruthPort::output(std::string_view bytes) {
    if (!isOpen()) return;
    tap_.sent(bytes);
    inner_.output(bytes);
}

void TruthSocket::connectTo(const std::string&, int) {
    close();
    tap_.reopened();
    inner_.open({});
    connected_ = true;
}

void TruthSocket::close() {
    connected_ = false;
    waiting_.clear();
    inner_.close();
}

SocketState TruthSocket::state() const {
    if (!connected_) return SocketState::Closed;
    return tap_.closed() ? SocketState::PeerClosing : SocketState::Connected;
}

bool TruthSocket::sendData(std::string_view bytes) {
    if (state() != SocketState::Connected) return false;
    tap_.sent(bytes);
    inner_.output(bytes);
    return true;
}

void TruthSocket::fetch() {
    if (connected_ && !tap_.closed()) waiting_ += tap_.pass(inner_.input());
}

std::string TruthSocket::peekData() {
    fetch();
    return waiting_;
}

std::string TruthSocket::getData() {
    fetch();
    return std::exchange(waiting_, {});
}

ServedEnd::ServedEnd(VirtualPlatform& desk, SerialPort& line)
    : socket_(desk.events),
      listener_(desk.events),
      server_({desk.clock, desk.events, far_.boxes, far_.port, far_.ports, far_.tcpSocket, line,
               listener_, far_.settings, far_.debug, far_.clipboard, far_.launcher, far_.startup,
               far_.folder, far_.fileDialogs, far_.files, far_.endSignals, far_.machine,
               far_.portProbe},
              "") {
    socket_.knocks = [this](PipeSocket& who) { listener_.knock(who); };
    server_.start();
    server_.serverDialog().fillFields();
    ServerForm& form = server_.forms().server;
    form.COMList.setText("COM1");
    form.chkBaudRate.setValue(false);
    form.BaudList.setText("57600");
}

bool ServedEnd::serve() { return bridge().bridging() || bridge().connect(true); }

TruthRun::TruthRun(LineKind kind, std::uint64_t seed)
    : instrument(platform.clock, platform.events, {.seed = seed},
                 {.baud = kind == LineKind::Tcp ? 0 : 57600,
                  .answering = 0.0005,
                  .wholeAnswers = kind == LineKind::Tcp}),
      served(kind == LineKind::Served ? std::make_unique<ServedEnd>(platform, port) : nullptr),
      program({platform.clock, platform.events, platform.boxes,
               served ? static_cast<SerialPort&>(platform.port) : port, platform.ports,
               served ? static_cast<Socket&>(served->socket()) : socket, platform.serverPort,
               platform.serverSocket, platform.settings, platform.debug, platform.clipboard,
               platform.launcher, platform.startup, platform.folder, platform.fileDialogs,
               platform.files, platform.endSignals, platform.machine, platform.portProbe},
              ""),
      kind_(kind) {
    platform.ports.ports = {"COM1"};
    program.start();
    panel.SaveView.connect([this](const std::string&) {
        check(program.sweep(), "a recording wrote");
        saved_.push_back(program.sweep());
    });
}

void TruthRun::finding(const std::string& text) { findings.push_back(text); }

bool TruthRun::connect() {
    platform.boxes.clear();
    if (served && !served->serve()) return false;
    return program.connect(kind_ == LineKind::Serial
                               ? LinkAddress{LinkAddress::Kind::Serial, "COM1", 57600}
                               : LinkAddress{LinkAddress::Kind::Tcp, "host", 2277},
                           false);
}

void TruthRun::check(const Sweep& sweep, const char* where) {
    const std::string head = std::string(where) + " a whole trace ";
    if (sweep.raw != displayed(sentSamples(sweep), sweep.autoPeak()))
        finding(head + "that the instrument did not send");
    for (std::size_t i = 0; i < sweep.raw.size(); ++i) {
        if (std::fabs(sweep.physical[i] - sweep.raw[i] / 1000) < 0.0005) continue;
        finding(head + "with levels that do not follow from its samples");
        break;
    }
    checkSettings(sweep, head);
}

/// After the status digit and its CR, be they as they will.
std::vector<double> TruthRun::sentSamples(const Sweep& sweep) const {
    const std::string& sent = tap.lastBlock();
    return wireSamples(sent.size() > 2 ? sent.substr(2) : std::string(), sweep.autoPeak());
}

void TruthRun::checkSettings(const Sweep& sweep, const std::string& head) {
    const zelsim::Settings& real = instrument.device().settings();
    const ZEL3Variables& told = sweep.settings;
    struct Field {
        const char* word;
        double told;
        double real;
    };
    const Field fields[] = {
        {"FREQ", told.CenterFrequency, real.centre},
        {"SPAN", told.Span, real.span},
        {"REFLVL", told.ReferenceLevel, real.referenceLevel},
        {"UNIT", told.ReferenceUnit, real.unit},
        {"RANGE", told.ReferenceRange, real.range},
        {"TRACEDET", double(told.TraceDetector), real.detector},
    };
    for (const Field& field : fields)
        if (field.told != field.real && !tap.spoiled(field.word))
            finding(head + "with " + field.word + " " + generalNumber(field.told) + " instead of " +
                    generalNumber(field.real));
    if (tap.spoiled("FREQ") || tap.spoiled("SPAN") || real.span == 0) return;
    if (sweep.axis.start != real.centre - real.span / 2 ||
        sweep.axis.stop != real.centre + real.span / 2)
        finding(head + "over other frequencies than it was read at");
}

/// Samples that count as come are those that the instrument sent first.
void TruthRun::checkPart(const Sweep& sweep) {
    const std::vector<double> shown = displayed(sentSamples(sweep), sweep.autoPeak());
    std::size_t came = 0;
    for (std::size_t i = 0; i < sweep.raw.size(); ++i) {
        if (std::isnan(sweep.raw[i])) continue;
        ++came;
        if (sweep.raw[i] != shown[i])
            return finding("an incomplete trace has a sample that the instrument did not send");
    }
    // Of the pairs one sample stands twice, and one nowhere.
    if (came > sweep.came + 1) finding("an incomplete trace has more samples than came");
}

void TruthRun::checkGraph() {
    const Graph& graph = panel.CWGraph1;
    const Sweep& drawn = program.sweep();
    if (drawn.incomplete() == graph.Incomplete.get().empty())
        finding("the mark of an incomplete trace is wrong");
    if (!drawn.incomplete() && graph.values() != drawn.shown)
        finding("the graph shows another trace");
    if (!drawn.incomplete()) return;
    const auto came = [](double value) { return !std::isnan(value); };
    const auto shown = std::count_if(graph.values().begin(), graph.values().end(), came);
    if (shown > static_cast<std::ptrdiff_t>(drawn.came) + 1) finding("more is drawn than came");
}

void TruthRun::readTrace(bool full) {
    bool success = false;
    if (full) {
        program.traces().ReadSingleTrace(success);
    } else {
        program.traces().ReadSingleTrace2({}, success);
    }
    const Sweep& sweep = program.traces().lastSweep();
    if (sweep.whole() && !success) finding("a whole trace counts as failed");
    if (success && sweep.whole()) {
        ++wholeTraces;
        check(sweep, "the panel shows");
    }
    if (sweep.incomplete()) {
        ++incompleteTraces;
        checkPart(sweep);
    }
    checkGraph();
}

void TruthRun::setDetector(int code) { set("TRACEDET," + std::to_string(code)); }

void TruthRun::record(int ticks) {
    saved_.clear();
    TimeForm& dialog = program.forms().time;
    panel.RecordData.Click();
    if (panel.RecordData.Checked) panel.StopButton.Click();
    dialog.TimeIntervalBox.Text = "1";
    platform.fileDialogs.answer(kFile);
    dialog.SubmitTimeButton.Click();
    const std::int64_t end = platform.clock.micros() + std::int64_t{400} * 1000000;
    while (dialog.TickCount < ticks && platform.clock.micros() < end) platform.events.wait(100);
    const double counted = dialog.RecordedCount;
    const double other = dialog.IncompleteCount + dialog.FailedCount;
    const double tried = dialog.TickCount;
    panel.StopButton.Click();
    incompleteTraces += static_cast<long>(other);
    wholeTraces += static_cast<long>(counted);
    if (counted + other != tried) finding("ticks of the recording are not counted");
    if (counted != static_cast<double>(saved_.size())) finding("the recording counts wrong");
    checkFile();
}

/// The file holds the rows of the recorded traces, each with its own settings, and no others.
void TruthRun::checkFile() {
    std::vector<std::vector<double>> traces;
    std::vector<std::string> centres;
    bool rows = false;
    for (std::string line : split(platform.files.bytes(kFile), '\n')) {
        if (!line.empty() && line.back() == '\r') line.pop_back();
        if (startsWith(line, "Center Frequency;")) centres.push_back(line.substr(17));
        if (startsWith(line, "Trace Name;")) {
            rows = false;
            traces.emplace_back();
        } else if (!traces.empty() && line.empty()) {
            rows = true;
        } else if (rows) {
            const std::vector<std::string> fields = split(line, ';');
            for (std::size_t i = 1; i < fields.size(); ++i)
                if (!trimmed(fields[i]).empty()) traces.back().push_back(leadingNumber(fields[i]));
        }
    }
    if (traces.size() != saved_.size() || centres.size() != saved_.size())
        return finding("the file holds " + std::to_string(traces.size()) + " traces, " +
                       std::to_string(saved_.size()) + " were recorded");
    const auto near = [](double x, double y) { return std::fabs(x - y) < 1e-9; };
    for (std::size_t i = 0; i < traces.size(); ++i) {
        const std::vector<double>& values = saved_[i].physical;
        if (!std::equal(traces[i].begin(), traces[i].end(), values.begin(), values.end(), near))
            finding("the file holds other values than were recorded");
        if (leadingNumber(centres[i]) != saved_[i].settings.CenterFrequency)
            finding("the file holds another frequency than was recorded");
    }
}

void TruthRun::wholeSession() {
    if (!connect()) return;
    set("FREQ,1200000000");
    set("SPAN,1000000000");
    for (const int detector : {DETSAMPLE, DETAUTOPEAK, DETMAXPEAK}) {
        setDetector(detector);
        readTrace(true);
    }
    record(3);
    disconnect();
}

}  // namespace zel
