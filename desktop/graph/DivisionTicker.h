#pragma once
// Ticks of an axis at round places (1, 2, 5), with texts in engineering units.

#include <qcustomplot.h>

#include <string>

namespace zel {

/// The step of about ten divisions of a range: the tenth part where that is round and the range
/// begins on a division, else the next round step. 0 for a range without a size.
double divisionOf(double lower, double upper);

class DivisionTicker : public QCPAxisTicker {
  public:
    /// With `labelEvery` 2 a text stands at every second tick where there are many.
    explicit DivisionTicker(int labelEvery) : labelEvery_(labelEvery) {}
    /// With a unit the texts carry prefix and unit, without one they are plain numbers.
    void setUnit(const std::string& unit) { unit_ = unit; }

  protected:
    double getTickStep(const QCPRange& range) override;
    int getSubTickCount(double) override { return 0; }
    QVector<double> createTickVector(double tickStep, const QCPRange& range) override;
    QVector<QString> createLabelVector(const QVector<double>& ticks, const QLocale& locale,
                                       QChar formatChar, int precision) override;

  private:
    int labelEvery_;
    std::string unit_;
};

}  // namespace zel
