#pragma once
// A page of the trace tools, and the texts that all of them show.

#include <QString>
#include <QWidget>
#include <optional>
#include <string>

#include "analysis/SpectrumTrace.h"
#include "analysis/TraceTools.h"

namespace zel {

class TracePage : public QWidget {
  public:
    explicit TracePage(TraceTools& tools) : tools_(tools) {}
    /// Takes over what the tools found.
    virtual void showState() = 0;

  protected:
    TraceTools& tools_;
};

/// "1.510 GHz" for samples that lie 10 MHz from each other: what lies between two samples is known
/// to a tenth of their distance. A dash where there is none.
QString placeText(std::optional<double> x, const std::optional<SpectrumTrace>& trace);
/// "-30.00 dBm"; a dash where there is none.
QString levelText(std::optional<double> level, const std::string& unit);
/// "935M", "1.2 GHz", "-20": a number that may have a prefix and a unit; nothing for other texts.
std::optional<double> quantityOf(const QString& text);
/// Asks for a file to read, and reads it; nothing when the user cancels or it cannot be read, which
/// a box reports.
std::optional<QString> readTable(QWidget& over, const QString& title, QString* name);
/// Asks for a file and writes the text; a box reports what went wrong.
void saveTable(QWidget& over, const QString& title, const QString& text);

}  // namespace zel
