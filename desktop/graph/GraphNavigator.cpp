#include "desktop/graph/GraphNavigator.h"

#include <cmath>
#include <cstddef>
#include <utility>
#include <vector>

#include "forms/ControllerForm.h"
#include "platform/Form.h"
#include "platform/Graph.h"

namespace zel {
namespace {

constexpr std::size_t kMostViews = 100;
constexpr double kWidest = 4;     // times the whole view
constexpr double kFewPoints = 4;  // the closest view of the x axis
constexpr double kLowestRange = 0.01;
constexpr Color kZoomedButton = 65280;
constexpr const char* kZoomedCaption = "Out";

}  // namespace

GraphNavigator::GraphNavigator(ControllerForm& panel) : panel_(panel) {}

GraphNavigator::View GraphNavigator::now() const {
    const GraphAxis& x = panel_.CWGraph1.xAxis();
    const GraphAxis& y = panel_.CWGraph1.yAxis();
    return {x.Minimum, x.Maximum, y.Minimum, y.Maximum};
}

void GraphNavigator::remember(Step step) {
    const View view = now();
    // A setting or another trace has laid out the axes since: that is the whole view now.
    if (!whole_ || view != last_) {
        past_.clear();
        whole_ = view;
        step_ = Step::None;
    }
    future_.clear();
    if (step == step_ && step != Step::Rectangle) return;
    step_ = step;
    past_.push_back(view);
    if (past_.size() > kMostViews) past_.erase(past_.begin());
}

void GraphNavigator::markZoomed() {
    panel_.GraphZoomed = true;
    panel_.cmdZoom.Caption = kZoomedCaption;
    panel_.cmdZoom.BackColor = kZoomedButton;
}

void GraphNavigator::show(const View& view) {
    const View old = now();
    if (view.left != old.left || view.right != old.right) {
        markZoomed();
        panel_.CWGraph1.setXRange(view.left, view.right);
    }
    if (view.bottom != old.bottom || view.top != old.top)
        panel_.CWGraph1.setYRange(view.bottom, view.top);
    last_ = now();
    zoomed_ = panel_.GraphZoomed;
}

void GraphNavigator::keepView() {
    const bool newTrace =
        std::exchange(serial_, panel_.CWGraph1.plotSerial()) != panel_.CWGraph1.plotSerial();
    const View view = now();
    if (!whole_ || view == last_) return;
    const View whole = *whole_;
    const auto levelsOf = [&view](const View& other) {
        return view.bottom == other.bottom && view.top == other.top;
    };
    const auto widthOf = [&view](const View& other) {
        return view.left == other.left && view.right == other.right;
    };
    if (zoomed_ && !panel_.GraphZoomed) {
        // The key shows the whole width; the levels go with it.
        const bool closer = levelsOf(last_);
        forget();
        if (closer) panel_.CWGraph1.setYRange(whole.bottom, whole.top);
        return;
    }
    const bool laidOut = (levelsOf(whole) || levelsOf(last_)) && (widthOf(whole) || widthOf(last_));
    // The manual scale and other settings are a whole view of their own.
    if (newTrace && laidOut) return show(View(last_));
    forget();
}

void GraphNavigator::zoomX(double about, double factor) {
    remember(Step::Wheel);
    View view = now();
    const double width = (view.right - view.left) * factor;
    const double least = kFewPoints * std::fabs(panel_.CWGraph1.increment());
    const double most = kWidest * (whole_->right - whole_->left);
    if (!(width > 0) || (factor < 1 && width < least) || (factor > 1 && width > most)) {
        last_ = view;
        return;
    }
    view.left = about - (about - view.left) * factor;
    view.right = view.left + width;
    show(view);
}

void GraphNavigator::zoomY(double about, double factor) {
    remember(Step::Wheel);
    View view = now();
    const double height = (view.top - view.bottom) * factor;
    const double most = kWidest * (whole_->top - whole_->bottom);
    if (!(height > kLowestRange) || (factor > 1 && height > most)) {
        last_ = view;
        return;
    }
    view.bottom = about - (about - view.bottom) * factor;
    view.top = view.bottom + height;
    show(view);
}

void GraphNavigator::pan(double x, double y) {
    remember(Step::Pan);
    const View view = now();
    show({view.left + x, view.right + x, view.bottom + y, view.top + y});
}

void GraphNavigator::showRectangle(const View& view) {
    remember(Step::Rectangle);
    show(view);
}

void GraphNavigator::back() {
    if (past_.empty() || now() != last_) return;
    future_.push_back(now());
    const View view = past_.back();
    past_.pop_back();
    step_ = Step::History;
    show(view);
}

void GraphNavigator::forward() {
    if (future_.empty() || now() != last_) return;
    past_.push_back(now());
    const View view = future_.back();
    future_.pop_back();
    step_ = Step::History;
    show(view);
}

void GraphNavigator::whole() {
    const View left = now();
    const bool own = whole_ && left == last_;
    std::vector<View> past = past_;
    // The key's own way knows the range that the instrument has by now.
    if (panel_.cmdZoom.Caption.get() == kZoomedCaption) panel_.cmdZoom.Click();
    if (whole_ &&
        (panel_.CWGraph1.yAxis().Minimum != whole_->bottom ||
         panel_.CWGraph1.yAxis().Maximum != whole_->top) &&
        last_.bottom == panel_.CWGraph1.yAxis().Minimum &&
        last_.top == panel_.CWGraph1.yAxis().Maximum)
        panel_.CWGraph1.setYRange(whole_->bottom, whole_->top);
    forget();
    const View view = now();
    if (!own || view == left) return;
    // Who came here by mistake goes back to the closer view.
    past_ = std::move(past);
    past_.push_back(left);
    whole_ = last_ = view;
    zoomed_ = false;
    step_ = Step::History;
}

void GraphNavigator::forget() {
    past_.clear();
    future_.clear();
    whole_.reset();
    step_ = Step::None;
}

}  // namespace zel
