#include "panel/WaterfallKeys.h"

namespace zel {

WaterfallKeys::WaterfallKeys(WaterfallForm& form, FileOps& files, MessageBoxes& boxes)
    : form_(form), files_(files), boxes_(boxes) {
    form_.PictureSave.Clicked.connect([this] { PictureSave_Click(); });
    form_.PictureCopy.Clicked.connect([this] { form_.CopyImage(); });
    form_.ViewFullScreen.Clicked.connect(
        [this] { form_.ViewFullScreen.Checked = !form_.ViewFullScreen.Checked; });
}

void WaterfallKeys::PictureSave_Click() {
    const std::string path = files_.ShowSaveImageDialog("png");
    if (path.empty()) return;
    std::string problem;
    form_.DrawImage(path, problem);
    if (!problem.empty()) boxes_.show({BoxIcon::Critical, problem});
}

}  // namespace zel
