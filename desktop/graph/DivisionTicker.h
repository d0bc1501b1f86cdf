#pragma once
// Ticks at the ten divisions of an axis, with texts in engineering units.

#include <qcustomplot.h>

#include <string>

namespace zel {

class DivisionTicker : public QCPAxisTicker {
  public:
    /// A text stands at every `labelEvery`th tick.
    explicit DivisionTicker(int labelEvery) : labelEvery_(labelEvery) {}
    /// With a unit the texts carry prefix and unit, without one they are plain numbers.
    void setUnit(const std::string& unit) { unit_ = unit; }

  protected:
    double getTickStep(const QCPRange& range) override { return range.size() / kDivisions; }
    int getSubTickCount(double) override { return 0; }
    QVector<double> createTickVector(double tickStep, const QCPRange& range) override;
    QVector<QString> createLabelVector(const QVector<double>& ticks, const QLocale& locale,
                                       QChar formatChar, int precision) override;

  private:
    static constexpr int kDivisions = 10;
    int labelEvery_;
    std::string unit_;
};

}  // namespace zel
