#pragma once
// Colours a script line by line: statements, comments, file names, numbers, lines without effect.

#include <Qsci/qscilexercustom.h>

namespace zel {

class ScriptLexer : public QsciLexerCustom {
  public:
    enum Style { Plain, Keyword, Comment, Argument, FileName, Number, Ignored };

    explicit ScriptLexer(QsciScintilla* parent);
    const char* language() const override { return "Script"; }
    QString description(int style) const override;
    void styleText(int start, int end) override;
    /// Fits the colours to the palette of the program.
    void takePalette(const QPalette& palette);

  private:
    void styleLine(const QByteArray& line);
};

}  // namespace zel
