#include "desktop/binders/OwnTexts.h"

#include <QObject>
#include <QRegularExpression>
#include <algorithm>
#include <cstddef>
#include <string>
#include <vector>

#include "desktop/binders/ToolTips.h"
#include "platform/Form.h"

namespace zel {
namespace {

/// %1 to %3 are names and numbers, which stay; those in `sentences` are sentences themselves.
struct Row {
    const char* text;
    const char* sentences = "";
};
constexpr Row kRows[] = {
    {QT_TRANSLATE_NOOP("QObject",
                       "The connection to %1 was lost. What is shown stays until it is "
                       "back.")},
    {QT_TRANSLATE_NOOP("QObject",
                       "%1 has gone. Plug it in again; what is shown stays until then.")},
    {QT_TRANSLATE_NOOP("QObject",
                       "%1 has gone again. Plug it in; what is shown stays until then.")},
    {QT_TRANSLATE_NOOP("QObject", "%1 is back.")},
    {QT_TRANSLATE_NOOP("QObject",
                       "%1 is back, but no instrument answers at %2 baud yet. It is "
                       "asked again each 5 s.")},
    {QT_TRANSLATE_NOOP("QObject", "No connection to %1 yet: %2 It is tried again each 5 s."), "2"},
    {QT_TRANSLATE_NOOP("QObject",
                       "No instrument answers on %1 at %2 baud. Check that it is on, "
                       "then try again.")},
    {QT_TRANSLATE_NOOP("QObject", "No connection to %1. %2"), "2"},
    {QT_TRANSLATE_NOOP("QObject", "%1 The recording has ended; begin it again."), "1"},
    {QT_TRANSLATE_NOOP("QObject", "Connected to %1 again. All settings are as before.")},
    {QT_TRANSLATE_NOOP("QObject", "Connected to %1 again. Changed: %2."), "2"},
    {QT_TRANSLATE_NOOP("QObject", "%1 (before: %2); %3"), "3"},
    {QT_TRANSLATE_NOOP("QObject", "%1 (before: %2)")},
    {QT_TRANSLATE_NOOP("QObject", "Connecting to %1 again")},
    {QT_TRANSLATE_NOOP("QObject", "Connecting to %1")},
    {QT_TRANSLATE_NOOP("QObject", "The attempt was left.")},
    {QT_TRANSLATE_NOOP("QObject", "The server is there, but no instrument answers.")},
    {QT_TRANSLATE_NOOP("QObject", "The server did not answer within 30 seconds.")},
    {QT_TRANSLATE_NOOP("QObject",
                       "The server closed the connection. It may be at work for another "
                       "client, or not let this computer in.")},
    {QT_TRANSLATE_NOOP("QObject", "Port open, waiting for the instrument")},
    {QT_TRANSLATE_NOOP("QObject", "Server reached, waiting for the instrument")},
    {QT_TRANSLATE_NOOP("QObject", "Line up, waiting for the instrument")},
    {QT_TRANSLATE_NOOP("QObject", "The instrument answers, reading its settings")},
    {QT_TRANSLATE_NOOP("QObject", "Waiting for the instrument, at most %1 more")},
    {QT_TRANSLATE_NOOP("QObject", "Waiting for the instrument")},
    {QT_TRANSLATE_NOOP("QObject", "Searching the instrument at %1 baud, rate %2 of %3")},
    {QT_TRANSLATE_NOOP("QObject",
                       "No instrument answers on %1 at %2 baud. Check that it is on and "
                       "that its cable is at this port")},
    {QT_TRANSLATE_NOOP("QObject",
                       "%1 at %2 baud: check that the instrument is on, that its cable "
                       "is at this port, and that it is set to %3 baud")},
    {QT_TRANSLATE_NOOP("QObject",
                       "%1: check that the server runs there, that its instrument is on "
                       "and connected, and that no firewall is between")},
    {QT_TRANSLATE_NOOP("QObject", "%1, next in %2 s"), "1"},
    {QT_TRANSLATE_NOOP("QObject", "%1, waits for the trigger"), "1"},
    {QT_TRANSLATE_NOOP("QObject", "%1, the interval of 0 s takes no trace"), "1"},
    {QT_TRANSLATE_NOOP("QObject", "%1: 1 trace, %2"), "2"},
    {QT_TRANSLATE_NOOP("QObject", "%1: %2 traces, %3"), "3"},
    {QT_TRANSLATE_NOOP("QObject", "%1 incomplete, %2"), "2"},
    {QT_TRANSLATE_NOOP("QObject", "%1 failed, %2"), "2"},
    {QT_TRANSLATE_NOOP("QObject", "%1 old   %2 sweeps/s   the sweep sets the pace")},
    {QT_TRANSLATE_NOOP("QObject", "%1 old   %2 sweeps/s   the line sets the pace")},
    {QT_TRANSLATE_NOOP("QObject", "%1 old")},
    {QT_TRANSLATE_NOOP("QObject", "Trace %1 of %2, %3")},
    {QT_TRANSLATE_NOOP("QObject", "%1 of %2   %3")},
    {QT_TRANSLATE_NOOP("QObject", "pass %1/%2")},
    {QT_TRANSLATE_NOOP("QObject",
                       "The instrument did not take this value. The next sweep asks it.")},
    {QT_TRANSLATE_NOOP("QObject",
                       "Read before the axis changed. The marker's keys read it again.")},
    {QT_TRANSLATE_NOOP("QObject", "\"%1\" is not %2, such as %3"), "2"},
    {QT_TRANSLATE_NOOP("QObject", "\"%1\" is no unit of %2, such as %3"), "2"},
    {QT_TRANSLATE_NOOP("QObject", "a frequency")},
    {QT_TRANSLATE_NOOP("QObject", "a time")},
    {QT_TRANSLATE_NOOP("QObject", "a level")},
    {QT_TRANSLATE_NOOP("QObject", "a difference")},
    {QT_TRANSLATE_NOOP("QObject", "a length")},
    {QT_TRANSLATE_NOOP("QObject", "a height")},
    {QT_TRANSLATE_NOOP("QObject", "a number")},
    {QT_TRANSLATE_NOOP("QObject", "Of comma and point only one can be the decimal mark")},
    {QT_TRANSLATE_NOOP("QObject", "%1 can be %2 or %3: write it without the comma")},
    {QT_TRANSLATE_NOOP("QObject", "A small m is a thousandth: write %1 MHz")},
    {QT_TRANSLATE_NOOP("QObject", "Not listening")},
    {QT_TRANSLATE_NOOP("QObject", "Looking for the instrument")},
    {QT_TRANSLATE_NOOP("QObject", "A client is connected")},
    {QT_TRANSLATE_NOOP("QObject", "Waiting for a client")},
    {QT_TRANSLATE_NOOP("QObject", "Held traces ended: frequency changed")},
    {QT_TRANSLATE_NOOP("QObject", "Held traces ended: span changed")},
    {QT_TRANSLATE_NOOP("QObject", "Held traces ended: sweep time changed")},
    {QT_TRANSLATE_NOOP("QObject", "Held traces ended: unit changed")},
    {QT_TRANSLATE_NOOP("QObject", "Held traces ended: mode changed")},
    {QT_TRANSLATE_NOOP("QObject", "Held traces ended: correction changed")},
};

/// The seconds at the end of a step: of any sentence.
constexpr const char* kSeconds = QT_TRANSLATE_NOOP("QObject", "%1, %2 of %3 s");

/// Labels whose texts are sentences of the program's own.
constexpr const char* kLabels[] = {"ReconnectLabel", "AdviceLabel", "lblReason",     "FileLabel",
                                   "WaitLabel",      "PaceLabel",   "PlaybackLabel", "lblState"};

QRegularExpression patternOf(const char* text) {
    QString pattern = QRegularExpression::escape(QString::fromUtf8(text));
    for (const char* place : {"1", "2", "3"})
        pattern.replace(QString("\\%") + place, QString("(?<p%1>.+?)").arg(place));
    return QRegularExpression(QRegularExpression::anchoredPattern(pattern),
                              QRegularExpression::DotMatchesEverythingOption);
}

QString filled(const QString& translated, const QRegularExpressionMatch& match,
               const QString& sentences) {
    QString text;
    for (qsizetype i = 0; i < translated.size(); ++i) {
        const QChar place = i + 1 < translated.size() ? translated[i + 1] : QChar();
        if (translated[i] != '%' || place < '1' || place > '3') {
            text += translated[i];
            continue;
        }
        const QString part = match.captured(QString("p") + place);
        text += sentences.contains(place) ? ownText(part) : part;
        ++i;
    }
    return text;
}

}  // namespace

QString ownText(const QString& sentence) {
    static const std::vector<QRegularExpression> patterns = [] {
        std::vector<QRegularExpression> all;
        for (const Row& row : kRows) all.push_back(patternOf(row.text));
        return all;
    }();
    static const QRegularExpression seconds("^(?<p1>.+), (?<p2>\\d+) of (?<p3>\\d+) s$");
    // Without another language the sentences are the program's already.
    if (sentence.isEmpty() || QObject::tr(kRows[0].text) == QString::fromUtf8(kRows[0].text))
        return sentence;
    for (std::size_t i = 0; i < patterns.size(); ++i)
        if (const auto match = patterns[i].match(sentence); match.hasMatch())
            return filled(QObject::tr(kRows[i].text), match, kRows[i].sentences);
    if (const auto match = seconds.match(sentence); match.hasMatch())
        return filled(QObject::tr(kSeconds), match, "1");
    return sentence;
}

QString ownText(const std::string& sentence) { return ownText(QString::fromStdString(sentence)); }

QString labelText(const Control& label, const std::string& caption) {
    const bool own = std::any_of(std::begin(kLabels), std::end(kLabels),
                                 [&label](const char* name) { return label.name() == name; });
    return own ? ownText(caption) : ownCaption(label, caption);
}

}  // namespace zel
