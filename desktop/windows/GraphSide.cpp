#include "desktop/windows/GraphSide.h"

#include <QEvent>
#include <QVBoxLayout>

#include "desktop/graph/SpectrogramWidget.h"
#include "desktop/windows/PlaybackBar.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

constexpr int kSpacing = 6;

}  // namespace

GraphSide::GraphSide(Program& program, Binder& binder, EmptyScreen::Ways ways, QWidget* parent)
    : QWidget(parent), program_(program), panel_(program.forms().controller), binder_(binder) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(kSpacing);
    graph_ = new GraphWidget(panel_.CWGraph1,
                             [this] { return annotateView(panel_, program_.variables()); });
    empty_ = new EmptyScreen(std::move(ways), graph_);
    readouts_ = new Readouts(panel_, binder_);
    binder_.bindShow(panel_.CWGraph1, graph_, [this] {
        graph_->refresh();
        showEmpty();
    });
    graph_->installEventFilter(this);
    layout->addWidget(graph_, 2);
    layout->addWidget(spectrogram(), 1);
    layout->addWidget(
        new PlaybackBar(panel_.PlaybackFrame, program_.forms().specialMeas.sldSpeed, binder_));
    layout->addWidget(readouts_);
    showEmpty();
}

QWidget* GraphSide::spectrogram() {
    auto* earlier = new SpectrogramWidget(program_.forms(), program_.history(), [this] {
        const QRect plot = graph_->plotArea();
        return std::pair(plot.left(), plot.right() + 1);
    });
    binder_.bindShow(panel_.SpectrogramPicture, earlier, [this, earlier] {
        earlier->setVisible(panel_.SpectrogramPicture.Visible);
        earlier->refresh();
    });
    for (Control* control :
         {static_cast<Control*>(&panel_.SpectrogramPause), static_cast<Control*>(&panel_.CWGraph1)})
        control->Changed.connect([self = QPointer<GraphSide>(this)] {
            if (self && self->panel_.SpectrogramPicture.Visible)
                self->panel_.SpectrogramPicture.noteChange();
        });
    return earlier;
}

void GraphSide::showEmpty() {
    const bool empty = !panel_.isConnected && panel_.CWGraph1.values().empty();
    if (empty == empty_->isVisibleTo(graph_)) return;
    empty_->setVisible(empty);
    place();
}

void GraphSide::place() { empty_->setGeometry(graph_->rect()); }

bool GraphSide::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Resize) place();
    return QWidget::eventFilter(watched, event);
}

}  // namespace zel
