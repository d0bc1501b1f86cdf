#pragma once
// The bar under the graph that sets the pace while a series of traces plays.

#include <QWidget>

#include "desktop/binders/Binder.h"
#include "platform/Controls.h"

namespace zel {

/// Shown as long as the frame is.
class PlaybackBar : public QWidget {
  public:
    PlaybackBar(Frame& frame, Slider& speed, Binder& binder, QWidget* parent = nullptr);
};

}  // namespace zel
