#include "forms/WaterfallForm.h"

#include "platform/Form.h"

namespace zel {

WaterfallForm::WaterfallForm() : Form("WaterfallForm") {
    Caption = "Waterfall";
    ViewPerspective.Checked = true;
    ViewWaterfall.Checked = true;
    ActionMove.Checked = true;
    addVariables({
        {"RowCount", &RowCount},
        {"DepthAxisMin", &DepthAxisMin},
        {"DepthAxisMax", &DepthAxisMax},
        {"StampPending", &StampPending},
        {"LastStampText", &LastStampText},
        {"LastStampRow", &LastStampRow},
        {"IsSpectrogram", &IsSpectrogram},
        {"LatitudeS", &SpectrogramView.Latitude},
        {"LongitudeS", &SpectrogramView.Longitude},
        {"DistanceS", &SpectrogramView.Distance},
        {"TransXS", &SpectrogramView.TransX},
        {"TransYS", &SpectrogramView.TransY},
        {"TransZS", &SpectrogramView.TransZ},
        {"LatitudeW", &WaterfallView.Latitude},
        {"LongitudeW", &WaterfallView.Longitude},
        {"DistanceW", &WaterfallView.Distance},
        {"TransXW", &WaterfallView.TransX},
        {"TransYW", &WaterfallView.TransY},
        {"TransZW", &WaterfallView.TransZ},
        {"waterfallRotated", &waterfallRotated},
        {"spectrogramRotated", &spectrogramRotated},
        {"waterfallPanned", &waterfallPanned},
        {"spectrogramPanned", &spectrogramPanned},
        {"waterfallZoomed", &waterfallZoomed},
        {"spectrogramZoomed", &spectrogramZoomed},
    });
}

}  // namespace zel
