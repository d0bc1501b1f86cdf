// The verbs over a line that cuts transfers: what did not come is printed and recorded nowhere.

#include <gtest/gtest.h>

#include <map>
#include <sstream>

#include "ZELSim/InProcessPort.h"
#include "console/Address.h"
#include "console/Fronts.h"
#include "console/Tool.h"
#include "desktop/platform/QtSignals.h"
#include "platform/virtual/VirtualPlatform.h"
#include "support/ExitStatus.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

constexpr std::size_t kStatusBytes = 2;
constexpr std::size_t kSeparator = 1;

/// Passes only so many bytes of a transfer's samples; the rest of that answer is lost.
class CutPort : public SerialPort {
  public:
    explicit CutPort(SerialPort& inner) : inner_(inner) {
        inner_.OnComm.connect([this](int code) { OnComm(code); });
    }
    /// Bytes after the status, by the number of the transfer, from 1.
    std::map<int, std::size_t> cuts;

    bool open(const SerialSetup& setup) override { return inner_.open(setup); }
    void close() override { inner_.close(); }
    bool isOpen() const override { return inner_.isOpen(); }
    std::string problem() const override { return inner_.problem(); }
    void output(std::string_view bytes) override {
        left_ = std::string::npos;
        if (bytes == "TRACEBIN\r" && cuts.contains(++transfers_))
            left_ = kStatusBytes + cuts[transfers_];
        inner_.output(bytes);
    }
    std::string input() override {
        std::string bytes = inner_.input();
        if (left_ == std::string::npos) return bytes;
        if (bytes.size() > left_) bytes.resize(left_);
        left_ -= bytes.size();
        return bytes;
    }

  private:
    SerialPort& inner_;
    int transfers_ = 0;
    std::size_t left_ = std::string::npos;
};

class CutFront : public Front {
  public:
    CutFront() { p_.ports.ports = {kSimulatorPort}; }
    const Clock& clock() const override { return p_.clock; }
    Events& events() override { return p_.events; }
    QtSignals& endSignals() override { return signals_; }
    Platform platform(Events& served, MessageBoxes& boxes, FileDialogs& dialogs) override {
        return {p_.clock,     served,        boxes,           port,        p_.ports,
                p_.tcpSocket, p_.serverPort, p_.serverSocket, p_.settings, p_.debug,
                p_.clipboard, p_.launcher,   p_.startup,      p_.folder,   dialogs,
                p_.files,     signals_,      p_.machine,      p_.portProbe};
    }
    VirtualFiles& disk() { return p_.files; }

  private:
    QtSignals signals_;
    VirtualPlatform p_;

  public:
    zelsim::InProcessPort instrument{p_.clock, p_.events, {}, {.answering = 0.0001}};
    CutPort port{instrument};
};

struct CutTraceTest : ::testing::Test {
    CutTraceTest() {
        front.instrument.device().edit().detector = 3;  // 301 samples
        front.disk().putFolder("/views");
    }
    int run(std::vector<std::string> words) { return run(front, std::move(words)); }
    int run(Front& on, std::vector<std::string> words) {
        words.insert(words.begin(), {"zelctl", "--connect", "sim:"});
        std::vector<const char*> list;
        list.reserve(words.size());
        for (const std::string& word : words) list.push_back(word.c_str());
        out.str("");
        errors.str("");
        Options options;
        EXPECT_FALSE(
            parseOptions(static_cast<int>(list.size()), list.data(), options, out, errors));
        return runTool(options, on, {out, errors});
    }
    /// Rows of each sweep that was printed, without the header.
    std::vector<std::size_t> rows() const {
        std::vector<std::size_t> counts{0};
        std::istringstream in(out.str());
        std::string line;
        std::getline(in, line);
        while (std::getline(in, line)) {
            if (line.empty())
                counts.push_back(0);
            else
                ++counts.back();
        }
        return counts;
    }
    std::size_t recorded(const std::string& file) {
        std::size_t found = 0;
        for (const std::string& line : linesOf(front.disk().bytes(file)))
            if (line.rfind("Trace Name;", 0) == 0) ++found;
        return found;
    }

    CutFront front;
    std::ostringstream out;
    std::ostringstream errors;
};

using Counts = std::vector<std::size_t>;

TEST_F(CutTraceTest, Sweep_PrintsTheRowsThatCameAndGoesOn) {
    front.port.cuts = {{2, 600}};
    EXPECT_EQ(run({"sweep", "--count", "3"}), kLinkFailed);
    EXPECT_EQ(rows(), (Counts{301, 150, 301}));
    EXPECT_EQ(errors.str(), "incomplete trace: 150 of 301 samples\n");
}

TEST_F(CutTraceTest, Sweep_LossOfLessThanASample_PrintsNoRow) {
    // Of 1205 bytes one to three are missing, and nobody knows which.
    for (const std::size_t came : {1202U, 1203U, 1204U}) {
        CutFront fresh;
        fresh.instrument.device().edit().detector = 3;
        fresh.port.cuts = {{1, came}};
        EXPECT_EQ(run(fresh, {"sweep"}), kLinkFailed) << came;
        EXPECT_EQ(rows(), Counts{0}) << came;
        EXPECT_EQ(errors.str(), "incomplete trace: 0 of 301 samples\n") << came;
    }
}

TEST_F(CutTraceTest, Sweep_TraceOfWhichNothingCame_CountsToo) {
    front.port.cuts = {{1, 0}};
    EXPECT_EQ(run({"sweep", "--count", "2"}), kLinkFailed);
    EXPECT_EQ(rows(), (Counts{0, 301}));
    EXPECT_EQ(errors.str(), "incomplete trace: 0 of 301 samples\n");
}

TEST_F(CutTraceTest, Sweep_OfPairs_PrintsThePairsThatCame) {
    front.instrument.device().edit().detector = 0;
    front.port.cuts = {{1, 1204 + kSeparator + 400}};
    EXPECT_EQ(run({"sweep"}), kLinkFailed);
    // The partner of point i is sample i - 1 of the second block: 100 of them, and the first.
    EXPECT_EQ(rows(), Counts{101});
    EXPECT_EQ(errors.str(), "incomplete trace: 401 of 602 samples\n");
}

TEST_F(CutTraceTest, Sweep_IncompleteTrace_IsNotSaved) {
    front.port.cuts = {{1, 600}};
    EXPECT_EQ(run({"sweep", "--output", "/views/cut.csv"}), kLinkFailed);
    EXPECT_FALSE(front.disk().has("/views/cut.csv"));
    EXPECT_NE(errors.str().find("box[exclamation]"), std::string::npos) << errors.str();
    EXPECT_NE(errors.str().find("150 of 301 samples came, and is not saved"), std::string::npos);
}

TEST_F(CutTraceTest, Record_WritesWholeTracesOnlyAndCountsEachTick) {
    front.port.cuts = {{1, 0}, {3, 600}};
    EXPECT_EQ(run({"record", "--interval", "1", "--count", "5", "--output", "/views/r.csv"}),
              kLinkFailed);
    EXPECT_EQ(recorded("/views/r.csv"), 3U);
    EXPECT_EQ(errors.str(),
              "incomplete trace: 0 of 301 samples\nincomplete trace: 150 of 301 samples\n");
}

TEST_F(CutTraceTest, Record_GoodLine_WritesEachTickAndEndsWithZero) {
    EXPECT_EQ(run({"record", "--interval", "1", "--count", "3", "--output", "/views/r.csv"}),
              kDone);
    EXPECT_EQ(recorded("/views/r.csv"), 3U);
    EXPECT_EQ(errors.str(), "");
}

}  // namespace
}  // namespace zel
