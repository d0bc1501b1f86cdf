#pragma once
// A line of annotations around the graph, some of which may be struck.

#include <qcustomplot.h>

namespace zel {

class AnnotationText : public QCPTextElement {
  public:
    AnnotationText(QCustomPlot* plot, const QFont& font) : QCPTextElement(plot, " ", font) {}

    /// Parts of the text that a line goes through. A part that the text does not hold is passed
    /// over.
    void setStruck(const QStringList& parts) { struck_ = parts; }
    const QStringList& struck() const { return struck_; }

  protected:
    void draw(QCPPainter* painter) override;

  private:
    QStringList struck_;
};

}  // namespace zel
