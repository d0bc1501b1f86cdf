#pragma once
// The waterfall's window: its two modes with a camera each, projection, mouse mode, markers.

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/WaterfallForm.h"
#include "platform/Event.h"
#include "platform/Files.h"
#include "platform/Graph3D.h"
#include "platform/Services.h"
#include "waterfall/Graph3dOps.h"
#include "waterfall/ViewSettings.h"

namespace zel {

class WaterfallView {
  public:
    /// Connects the menus, the key `cmd3D` and the mouse. The camera is kept in "3dgraph.ini" of
    /// the application's folder.
    WaterfallView(Forms& forms, Graph3dOps& ops, ApplicationFolder& folder, FileService& files);

    /// Reads "3dgraph.ini"; what is not there keeps the design's value.
    void Form_Load();
    void Form_Unload();

    void cmd3D_Click();
    void ViewPerspective_Click();
    void ViewOrthographic_Click();
    void ViewWaterfall_Click();
    void ViewSpectrogram_Click();
    void VewClear_Click();
    void ViewReset_Click();
    void ActionMove_Click();
    void ActionMarkers_Click();
    void MarkersDelete_Click();

    /// The last cursor lands there: frequency, depth, level.
    void addCursor(double x, double y, double z);
    /// Shows the time of a row, counted from 0, in the name of the current cursor; nothing when
    /// `count` cursors are none.
    void setTimeStamps(int count, int row);

  private:
    void setProjection(bool isOrthographic);
    /// The camera takes over what the user moved in this mode; the rest of the set is the camera's.
    void takeMoved(const GraphView3D& set, bool& rotated, bool& zoomed, bool& panned);
    void place(int plot, int point);
    void styleRows(int map);

    WaterfallForm& form_;
    ControllerForm& panel_;
    Graph3dOps& ops_;
    ViewSettings settings_;
    bool loading_ = false;
    Handlers handlers_;
};

}  // namespace zel
