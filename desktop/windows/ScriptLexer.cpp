#include "desktop/windows/ScriptLexer.h"

#include <Qsci/qsciscintilla.h>

#include <QFontDatabase>
#include <QPalette>
#include <algorithm>
#include <string>

#include "script/Language.h"

namespace zel {
namespace {

struct StyleColors {
    int style;
    const char* light;
    const char* dark;
};
constexpr StyleColors kColors[] = {
    {ScriptLexer::Keyword, "#0b57a4", "#6cb2ff"},  {ScriptLexer::Comment, "#3f7d3f", "#86c486"},
    {ScriptLexer::FileName, "#8a3a8a", "#d59ad5"}, {ScriptLexer::Number, "#9a4a00", "#f0b060"},
    {ScriptLexer::Ignored, "#b02020", "#ff8078"},
};

int styleOf(Argument argument) {
    switch (argument) {
        case Argument::File:
            return ScriptLexer::FileName;
        case Argument::Number:
        case Argument::Whole:
            return ScriptLexer::Number;
        default:
            return ScriptLexer::Argument;
    }
}

}  // namespace

ScriptLexer::ScriptLexer(QsciScintilla* parent) : QsciLexerCustom(parent) {
    const QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    setDefaultFont(font);
    for (int style = Plain; style <= Ignored; ++style) setFont(font, style);
    QFont bold = font;
    bold.setBold(true);
    setFont(bold, Keyword);
}

void ScriptLexer::takePalette(const QPalette& palette) {
    const bool dark = palette.color(QPalette::Base).lightness() < 128;
    setDefaultColor(palette.color(QPalette::Text));
    setDefaultPaper(palette.color(QPalette::Base));
    for (int style = Plain; style <= Ignored; ++style) {
        setColor(palette.color(QPalette::Text), style);
        setPaper(palette.color(QPalette::Base), style);
    }
    for (const StyleColors& row : kColors) setColor(QColor(dark ? row.dark : row.light), row.style);
}

QString ScriptLexer::description(int style) const {
    constexpr const char* kNames[] = {"Plain",     "Keyword", "Comment", "Argument",
                                      "File name", "Number",  "Ignored"};
    return style >= Plain && style <= Ignored ? kNames[style] : QString();
}

void ScriptLexer::styleText(int start, int end) {
    // From the beginning of a line on: what a line is can change with each of its characters.
    const long first = editor()->SendScintilla(
        QsciScintilla::SCI_POSITIONFROMLINE,
        editor()->SendScintilla(QsciScintilla::SCI_LINEFROMPOSITION, start));
    QByteArray text(static_cast<qsizetype>(end - first) + 1, '\0');
    editor()->SendScintilla(QsciScintilla::SCI_GETTEXTRANGE, static_cast<int>(first), end,
                            text.data());
    text.chop(1);
    startStyling(static_cast<int>(first));
    for (qsizetype at = 0; at < text.size();) {
        qsizetype stop = text.indexOf('\n', at);
        stop = stop < 0 ? text.size() : stop + 1;
        styleLine(text.mid(at, stop - at));
        at = stop;
    }
}

void ScriptLexer::styleLine(const QByteArray& line) {
    const int length = static_cast<int>(line.size());
    const std::string capitals = statementText(line.toStdString());
    const Statement* statement = findStatement(capitals);
    if (statement == nullptr) return setStyling(length, capitals.empty() ? Plain : Ignored);
    if (statement->test == LineTest::FirstCharacter) return setStyling(length, Comment);
    if (statement->test == LineTest::Anywhere) return setStyling(length, Keyword);
    qsizetype begin = 0;
    while (begin < line.size() && line[begin] == ' ') ++begin;
    const int word = static_cast<int>(begin + static_cast<qsizetype>(statement->word.size()));
    setStyling(std::min(word, length), Keyword);
    if (word < length) setStyling(length - word, styleOf(statement->argument));
}

}  // namespace zel
