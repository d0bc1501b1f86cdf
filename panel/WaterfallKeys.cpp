#include "panel/WaterfallKeys.h"

#include <string>

#include "files/FileOps.h"
#include "forms/WaterfallForm.h"
#include "platform/MessageBox.h"

namespace zel {

WaterfallKeys::WaterfallKeys(WaterfallForm& form, FileOps& files, MessageBoxes& boxes)
    : form_(form), files_(files), boxes_(boxes) {
    handlers_.on(form_.PictureSave.Clicked, [this] { PictureSave_Click(); });
    handlers_.on(form_.PictureCopy.Clicked, [this] { form_.CopyImage(); });
    handlers_.on(form_.ViewFullScreen.Clicked,
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
