#include "files/ViewReader.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <memory>
#include <new>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "files/FieldList.h"
#include "files/FileOps.h"
#include "files/LoadedRows.h"
#include "files/SeriesFrames.h"
#include "files/ViewFormat.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "model/CodeTables.h"
#include "model/LevelRange.h"
#include "model/ZEL3Variables.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "support/AtEnd.h"
#include "support/FileText.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/FrequencyLabels.h"
#include "trace/Interlock.h"
#include "trace/Sweep.h"
#include "trace/TraceOnGraph.h"

namespace zel {
namespace {

using CF = ControllerForm;

/// What one trace's header and 301 rows come to.
constexpr int kLargestSingle = 970;
constexpr int kMostRowsBack = 500;
constexpr double kIntervals = 300;
constexpr int kShownBytes = 4 << 20;
constexpr int kFirstLogEntry = 3;

constexpr const char* kFaultLocation = "Fault Location";
constexpr const char* kAutoPeak = "Auto Peak";
constexpr const char* kLinear = "lin 0 - 100%";

/// The first entry from `from` on that holds the word, or -1.
int findEntry(const FieldList& lines, std::string_view word, int from = 0) {
    for (int i = from; i <= lines.last(); ++i)
        if (contains(lines[i], word)) return i;
    return -1;
}

/// Time of day of a trace and the day of its file.
std::string rowLabelOf(const FieldList& lines, int timeEntry, const std::string& fileTime) {
    return std::string(lines[timeEntry + 1]) + " " + fileTime.substr(0, kDayLength);
}

std::string percentText(double part) { return generalNumber(std::floor(part * 100)) + " %"; }

}  // namespace

ViewReader::ViewReader(Forms& forms, ZEL3Variables& mirror, const TraceOnGraph& onGraph,
                       FileOps& files, const Interlock& interlock)
    : forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      onGraph_(onGraph.sweep),
      files_(files),
      scaling_(onGraph.scaling),
      interlock_(interlock),
      clock_(interlock.session().clock),
      events_(interlock.session().events),
      boxes_(interlock.session().boxes),
      conversion_(onGraph.conversion),
      rows_(forms.controller, mirror),
      playback_(forms, interlock) {
    handlers_.on(panel_.LoadData.Clicked, [this] { LoadData_Click(); });
    handlers_.on(panel_.OpenFile, [this](const std::string& path) {
        if (loading_ || interlock_.refuses(panel_.LoadData)) return;
        files_.note(path);
        loadFile(path);
    });
    handlers_.on(playback_.Play, [this](int index) { playFrom(index); });
    handlers_.on(playback_.Jump, [this](int index) { jumpTo(index); });
}

void ViewReader::LoadData_Click() {
    if (loading_ || interlock_.refuses(panel_.LoadData)) return;
    const std::string path = files_.ShowOpenDataDialog(FileOps::kCsvFilter);
    if (!path.empty()) loadFile(path);
}

void ViewReader::loadFile(const std::string& path) {
    if (loading_) return;
    loading_ = true;
    const AtEnd done([this] {
        panel_.FileLabel.Caption = "";
        loading_ = false;
    });
    name_ = std::filesystem::path(path).filename().string();
    try {
        const auto text = std::make_shared<const std::string>(
            files_.ReadWholeFile(path, [this](std::uint64_t got, std::uint64_t size) {
                if (size > kShownBytes)
                    progress("Reading", static_cast<double>(got) / static_cast<double>(size));
            }));
        // The name decides before the contents.
        if (isNameOfOldLog(path) || contains(*text, "END OF LOG")) {
            LoadTheDataForOlderVersions(*text);
            if (startsWith(*text, kTraceName))
                boxes_.show({BoxIcon::Information,
                             name_ + " begins as a saved view and was read as a log of the older " +
                                 "format, because its name holds \"dat\"." + kCrLf +
                                 "Under another name it shows the view."});
        } else {
            takeView(text, files_.dateTimeOf(path), 0);
        }
        FileLoaded(path);
    } catch (const std::runtime_error& problem) {
        boxes_.show({BoxIcon::Critical, problem.what()});
    } catch (const std::bad_alloc&) {
        boxes_.show({BoxIcon::Critical, readProblem(path, "there is not enough memory for it")});
    }
}

void ViewReader::progress(const std::string& what, double part) {
    panel_.FileLabel.Caption = what + " " + name_ + ": " + percentText(part);
    events_.pump();
}

void ViewReader::takeRange(std::string_view entry) {
    if (contains(entry, "lin")) {
        mirror_.ReferenceRange = RANGELIN;
        return;
    }
    const double number = leadingNumber(entry);
    // A range that no number names, as those of the reflection are saved, is drawn at 10 dB.
    mirror_.ReferenceRange = decibelsPerDivision(RANGE10DB);
    for (int code = RANGE10DB; code <= RANGE1DB; ++code)
        if (decibelsPerDivision(code) == number) mirror_.ReferenceRange = number;
}

ViewReader::Header ViewReader::readHeader(const std::string& text, const FieldList& lines,
                                          const std::string& fileTime) {
    Header header;
    mirror_.TraceDetector =
        contains(text, kAutoPeak) ? std::uint8_t{DETAUTOPEAK} : std::uint8_t{DETSAMPLE};
    panel_.IsLINValued = contains(text, kLinear);
    panel_.isZELViewLinFile = panel_.IsLINValued && !contains(text, "ZELRemote");
    header.zeroSpan = contains(text, kZeroSpan);
    if (header.zeroSpan) mirror_.Span = 0;

    // A mark that is there ends the header, so the walk need not go through all rows.
    const int pointer = findEntry(lines, kTraceWritePointer);
    const int measured = contains(text, kMeasuredValue) ? findEntry(lines, kMeasuredValue) : -1;
    const bool later = measured > pointer;
    header.mark = later ? measured : pointer;
    if (header.mark >= 0) header.markWord = later ? kMeasuredValue : kTraceWritePointer;

    const auto find = [&lines](auto&& fits) {
        for (int i = 0; i <= lines.last(); ++i)
            if (fits(lines[i])) return i;
        return -1;
    };
    const int level = find([](std::string_view entry) {
        return contains(entry, kReferenceLevel) || contains(entry, "RefLvl");
    });
    if (level >= 0) mirror_.ReferenceLevel = fieldNumber(lines[level + 1]);
    const int range = find([](std::string_view entry) {
        return contains(entry, "Range") && !contains(entry, kDynamicRange);
    });
    if (range >= 0) takeRange(lines[range + 1]);
    const int unit = findEntry(lines, kReferenceUnit);
    for (const CodeRow& row : codeTable(CodeTable::ReferenceUnit))
        if (unit >= 0 && !row.saved.empty() && lines[unit + 1] == row.saved)
            mirror_.ReferenceUnit = row.code;
    const int time = findEntry(lines, kTime);
    if (time >= 0) header.rowLabel = rowLabelOf(lines, time, fileTime);
    rememberShown(lines, header.mark);
    const bool distance = panel_.Shown.mode == kFaultLocation;
    panel_.Shown.xUnit = distance ? "m" : header.zeroSpan ? "s" : "Hz";
    return header;
}

void ViewReader::rememberShown(const FieldList& lines, int end) {
    struct Entry {
        const char* name;
        std::string ShownView::*text;
    };
    constexpr Entry kEntries[] = {{kMeasurementType, &ShownView::mode},
                                  {kResolutionBandwidth, &ShownView::rbw},
                                  {kVideoBandwidth, &ShownView::vbw},
                                  {kSweepTime, &ShownView::sweepTime},
                                  {kTraceDetector, &ShownView::detector}};
    panel_.Shown = {};
    panel_.Shown.fromFile = true;
    for (int i = 0; i < end; ++i)
        for (const Entry& entry : kEntries)
            if (lines[i] == entry.name) panel_.Shown.*entry.text = std::string(lines[i + 1]);
}

void ViewReader::LoadTheData(const std::string& text, const std::string& fileTime,
                             std::int16_t rowNumber) {
    takeView(std::make_shared<const std::string>(text), fileTime, rowNumber);
}

void ViewReader::underStop(const std::function<void()>& work) {
    panel_.Connection.Enabled = false;
    panel_.Utility.Enabled = false;
    panel_.PlayContinuousButton.Visible = false;
    panel_.StopButton.Visible = true;
    panel_.STOPFlag = true;
    const AtEnd done([this] {
        panel_.STOPFlag = false;
        panel_.Connection.Enabled = true;
        panel_.Utility.Enabled = true;
        panel_.PlayContinuousButton.Visible = true;
        panel_.StopButton.Visible = false;
        panel_.MousePointer = kArrow;
    });
    work();
}

void ViewReader::takeView(const Text& text, const std::string& fileTime, std::int16_t rowNumber) {
    if (text->empty()) return;
    playback_.close();
    underStop([&] {
        panel_.YVectorVal = rowNumber;
        if (rowNumber == 0) forms_.waterfall.clearGraph();
        panel_.MousePointer = kHourglass;
        events_.pump();

        FieldList lines(*text, [this](double part) { progress("Loading", part); });
        Header header = readHeader(*text, lines, fileTime);
        const bool series = header.series = rowNumber == 0 && lines.last() > kLargestSingle;
        int start = header.mark + kRowsAfterMark;
        if (header.mark < 0) {
            // A table without a header begins with its first number.
            for (start = 0; start <= lines.last() && !looksLikeNumber(lines[start]);) ++start;
        }
        const std::string_view mark = series ? header.markWord : std::string_view();
        showSeries(std::make_shared<SeriesFrames>(text, std::move(lines), start, mark, fileTime),
                   header, 0);
        if (series) forms_.waterfall.styleLastRow();
        forms_.waterfall.saveGraphView();
    });
}

bool ViewReader::showFrame(SeriesFrames& frames, Header& header, int index) {
    int next = -1;
    const FieldList& lines = frames.lines();
    const bool autoPeak = mirror_.TraceDetector == DETAUTOPEAK;
    if (rows_.ReadDataRows(lines, autoPeak, frames.at(index).start, next) == 0) return false;
    frames.rowsEnd(index, next < 0 ? lines.count() : next);
    if (index > 0 || header.rowLabel.empty()) header.rowLabel = frames.at(index).label;
    showTrace(header);
    return true;
}

bool ViewReader::showUpTo(SeriesFrames& frames, Header& header, int index) {
    const int position = playback_.position();
    int from = position + 1;
    if (index <= position || index - position > kMostRowsBack) {
        panel_.YVectorVal = 0;
        forms_.waterfall.clearGraph();
        from = std::max(0, index - kMostRowsBack + 1);
    }
    for (int i = from; i <= index; ++i)
        if (!frames.reach(i) || !showFrame(frames, header, i)) return false;
    return true;
}

void ViewReader::showSeries(const std::shared_ptr<SeriesFrames>& frames, Header header, int first) {
    bool begun = playback_.frames() == frames;
    const AtEnd done([this] { playback_.setPlaying(false); });
    for (int index = first;;) {
        events_.pump();
        const bool jumps = begun && index != playback_.position() + 1;
        if (jumps ? !showUpTo(*frames, header, index) : !showFrame(*frames, header, index)) {
            frames->endAt(index);
            break;
        }
        panel_.TraceLoaded();
        const bool more = frames->reach(index + 1);
        if (!begun && !more) break;
        if (!begun) playback_.open(frames);
        begun = true;
        if (!playback_.playing()) playback_.setPlaying(true);
        playback_.setPosition(index);
        panel_.FileLabel.Caption =
            "Trace " + std::to_string(index + 1) + " of " + name_ + ", " +
            percentText(more ? static_cast<double>(frames->at(index + 1).start) /
                                   frames->lines().count()
                             : 1);
        const std::optional<int> next = playback_.next();
        if (!next || playback_.frames() != frames) break;
        index = *next;
    }
}

void ViewReader::playFrom(int index) {
    const std::shared_ptr<SeriesFrames> frames = playback_.frames();
    if (loading_ || !frames) return;
    loading_ = true;
    const AtEnd done([this] {
        panel_.FileLabel.Caption = "";
        loading_ = false;
    });
    underStop([&] {
        panel_.MousePointer = kHourglass;
        playback_.setPlaying(true);
        Header header = readHeader(frames->text(), frames->lines(), frames->fileTime());
        header.series = true;
        showSeries(frames, header, index);
        forms_.waterfall.styleLastRow();
        forms_.waterfall.saveGraphView();
    });
}

void ViewReader::jumpTo(int index) {
    const std::shared_ptr<SeriesFrames> frames = playback_.frames();
    if (loading_ || !frames) return;
    Header header = readHeader(frames->text(), frames->lines(), frames->fileTime());
    header.series = true;
    if (!frames->reach(index)) return playback_.setPosition(playback_.position());
    if (!showUpTo(*frames, header, index)) {
        frames->endAt(index);  // the file ends there, after all that was shown
        return playback_.setPosition(playback_.position());
    }
    panel_.TraceLoaded();
    playback_.setPosition(index);
    forms_.waterfall.styleLastRow();
    forms_.waterfall.saveGraphView();
}

void ViewReader::spread(bool zeroSpan, double first, double last) {
    if (zeroSpan) {
        panel_.ViewStop = last;
        panel_.SpanLabel.Caption = spanLabelText(0);
        return;
    }
    mirror_.CenterFrequency = first + (last - first) / 2;
    mirror_.Span = last - first;
    panel_.CFLabel.Caption = centerLabelText(generalNumber(mirror_.CenterFrequency));
    panel_.SpanLabel.Caption = spanLabelText(generalNumber(mirror_.Span));
}

void ViewReader::showTrace(const Header& header) {
    const std::vector<double>& xs = panel_.DataXAxisArrayToLoad;
    const std::vector<double>& values = panel_.DataValArrayToLoad;
    const bool autoPeak = mirror_.TraceDetector == DETAUTOPEAK;
    const double pairs = autoPeak ? 2 : 1;
    spread(header.zeroSpan, xs.front(), xs.back());

    double first = xs.front();
    double last = xs.back();
    double increment = xs.size() > 1 ? (xs[1] - xs[0]) / pairs : 0;
    if (header.zeroSpan) {
        // The column holds no times then: the sweep's own time spreads the points.
        const double sweep = leadingNumber(panel_.Shown.sweepTime);
        first = 0;
        increment = last / (autoPeak ? 2 * kIntervals + 1 : kIntervals);
        if (last == 0 && sweep > 0) {
            mirror_.SweepTime = last = panel_.ViewStop = sweep;
            increment = sweep / (pairs * (kIntervals - 2));
        }
    }
    panel_.ViewSpan = header.zeroSpan ? 0 : last - first;
    panel_.TraceIntervals = kIntervals;
    scaling_.setGraphXAxis(first, last);
    const double range = mirror_.ReferenceRange;
    scaling_.setGraphYAxis(mirror_.ReferenceLevel, LevelRange::ofDecibels(std::trunc(range)));
    scaling_.addWaterfallRowLimit();
    forms_.waterfall.stampRow(header.rowLabel);
    if (header.series) forms_.waterfall.styleLastRow();

    panel_.CWGraph1.plotY(values, first, increment);
    scaling_.BuildXYVectors(increment);
    panel_.TraceColours = conversion_.colour(values);
    forms_.waterfall.Graph3D.plotCurve(panel_.YVector, panel_.XVector, values, panel_.TraceColours);
    panel_.CWGraph1.Old = false;
    keepAsSweep(increment);
    constexpr std::int32_t kLastRow = 2147483647;
    if (panel_.YVectorVal < kLastRow) ++panel_.YVectorVal;
}

void ViewReader::keepAsSweep(double increment) {
    Sweep sweep;
    sweep.physical = panel_.RawTraceData;
    sweep.shown = panel_.DataValArrayToLoad;
    sweep.colours = panel_.TraceColours;
    sweep.wanted = sweep.came = sweep.physical.size();
    sweep.settings = mirror_;
    sweep.settings.ReferenceRange = LevelRange::ofDecibels(mirror_.ReferenceRange).code();
    if (panel_.ViewSpan == 0) sweep.settings.Span = 0;
    sweep.settingsKept = true;
    sweep.instrumentMode = panel_.InstrumentMode;
    sweep.axis = {panel_.ViewStart, panel_.ViewStop,       panel_.CWGraph1.firstX(),
                  increment,        panel_.TraceIntervals, panel_.Shown.xUnit};
    onGraph_ = std::move(sweep);
    panel_.CWGraph1.Incomplete = "";
}

void ViewReader::LoadTheDataForOlderVersions(const std::string& text) {
    if (text.empty()) return;
    playback_.close();
    const bool pairs = contains(text, "MinMax");
    const bool linear = contains(text, "LIN");
    const bool zeroSpan = contains(text, "ZeroSpan");
    const FieldList lines(text, [this](double part) { progress("Loading", part); });
    int start = kFirstLogEntry;
    while (start <= lines.last() && !looksLikeNumber(lines[start])) ++start;

    std::vector<double>& xs = panel_.DataXAxisArrayToLoad;
    std::vector<double>& values = panel_.DataValArrayToLoad;
    xs.clear();
    values.clear();
    const int perRow = pairs ? 2 : 1;
    for (int i = start; xs.size() < LoadedRows::kRows;) {
        // A blank closes a row; after the rows stands the end of the log.
        while (i <= lines.last() && trimmed(lines[i]).empty()) ++i;
        if (i + perRow > lines.last() || contains(lines[i], "END OF LOG")) break;
        xs.push_back(leadingNumber(lines[i++]));
        for (int k = 0; k < perRow; ++k) values.push_back(leadingNumber(lines[i++]));
    }
    if (xs.empty()) return;

    spread(zeroSpan, xs.front(), xs.back());
    if (zeroSpan) mirror_.Span = 0;
    panel_.Shown = {};
    panel_.Shown.fromFile = true;
    panel_.Shown.xUnit = zeroSpan ? "s" : "Hz";
    panel_.RawTraceData = values;
    mirror_.TraceDetector = pairs ? std::uint8_t{DETAUTOPEAK} : std::uint8_t{DETSAMPLE};
    const double increment = xs.size() > 1 ? (xs[1] - xs[0]) / perRow : 0;
    panel_.ViewSpan = zeroSpan ? 0 : mirror_.Span;
    panel_.TraceIntervals = kIntervals;
    panel_.ViewStart = xs.front();
    panel_.ViewStop = xs.back();
    Graph& graph = panel_.CWGraph1;
    graph.setXRange(xs.front(), xs.back());
    const auto [low, high] = std::minmax_element(values.begin(), values.end());
    if (linear) {
        graph.setYRange(0, 100);
    } else {
        // Whole tens, so that the trace touches neither edge.
        constexpr double kStep = 10;
        graph.setYRange(std::floor(*low / kStep - 0.1) * kStep,
                        std::ceil(*high / kStep + 0.1) * kStep);
    }
    graph.showYLabels(true);
    graph.plotY(values, xs.front(), increment);
    graph.Old = false;
    keepAsSweep(increment);
    panel_.TraceLoaded();
}

}  // namespace zel
