#pragma once
// Looking closer at the graph and back: zoom about a point, pan, a history of views.

#include <optional>
#include <vector>

#include "forms/ControllerForm.h"

namespace zel {

/// Changes the axes of the graph alone; nothing goes to the instrument. As long as the view is a
/// closer one the Zoom key says "Out", as after a zoom rectangle.
class GraphNavigator {
  public:
    explicit GraphNavigator(ControllerForm& panel);

    struct View {
        double left = 0;
        double right = 0;
        double bottom = 0;
        double top = 0;
        bool operator==(const View&) const = default;
    };

    /// A factor below 1 looks closer; `about` keeps its place. Units of the axis.
    void zoomX(double about, double factor);
    void zoomY(double about, double factor);
    /// Moves the view by a distance in the units of the axes.
    void pan(double x, double y);
    /// A view of its own, as a rectangle chose it.
    void showRectangle(const View& view);
    void back();
    void forward();
    bool canGoBack() const { return !past_.empty(); }
    bool canGoForward() const { return !future_.empty(); }
    /// Both axes as they were before the first step.
    void whole();
    /// A new trace lays out the axes as the instrument has them; where these are still the ones of
    /// the whole view, the closer view stays. To be called before each drawing.
    void keepView();
    /// The next step begins a new one of the history.
    void endStep() { step_ = Step::None; }

  private:
    /// Steps in a row of one kind are one step of the history.
    enum class Step { None, Wheel, Pan, Rectangle, History };

    void remember(Step step);
    View now() const;
    void show(const View& view);
    void markZoomed();
    void forget();

    ControllerForm& panel_;
    std::vector<View> past_;
    std::vector<View> future_;
    std::optional<View> whole_;
    View last_;
    Step step_ = Step::None;
    bool zoomed_ = false;       ///< the last view was a closer one on the x axis
    unsigned long serial_ = 0;  ///< of the trace that was drawn last
};

}  // namespace zel
