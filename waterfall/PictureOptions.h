#pragma once
// The lists and boxes of the waterfall's window that say how its picture looks.

#include <string>

#include "forms/WaterfallForm.h"
#include "platform/Event.h"
#include "platform/Graph3D.h"
#include "waterfall/SurfaceRenderer.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {

class PictureOptions {
  public:
    /// Fills the lists.
    explicit PictureOptions(WaterfallForm& form);

  private:
    void LevelsList_Click();

    WaterfallForm& form_;
    Handlers handlers_;
};

/// What the lists and boxes say. Limits that are no numbers, or equal, leave those of the axis.
PictureStyle pictureStyle(const WaterfallForm& form);
/// "2.4 GHz   12:00:05   -41.2 dBm" of a sample, both counted from 0; empty where there is none.
std::string sampleText(const Graph3D& graph, const SurfaceHit& hit);

}  // namespace zel
