#pragma once
// The waterfall's window: successive sweeps in depth, and the state that its modules share.

#include <cstdint>
#include <string>

#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/Graph3D.h"

namespace zel {

/// The row calls are events that the waterfall's room handles.
class WaterfallForm : public Form {
  public:
    WaterfallForm();

    // Rows.
    std::int32_t RowCount = 0;      ///< rows stamped since the last clear
    std::int32_t DepthAxisMin = 0;  ///< range shown on the depth axis
    std::int32_t DepthAxisMax = 0;
    bool StampPending = false;  ///< the last row got a label, or the first row arrives
    std::string LastStampText;  ///< time and row of the last label
    std::int32_t LastStampRow = 0;

    // The view: which of the two, and the camera of each.
    bool IsSpectrogram = false;
    GraphView3D SpectrogramView;
    GraphView3D WaterfallView;
    bool waterfallRotated = false;  ///< moved by the user since the last reset
    bool spectrogramRotated = false;
    bool waterfallPanned = false;
    bool spectrogramPanned = false;
    bool waterfallZoomed = false;
    bool spectrogramZoomed = false;

    Event<> clearGraph;  ///< all rows go
    Event<> resetRowCount;
    Event<int> limitRows;                ///< keeps at most so many rows
    Event<const std::string&> stampRow;  ///< counts a row; the text is the time of day
    Event<> styleLastRow;
    Event<> saveGraphView;
    /// The front draws the picture into the file of that path, its ending names the kind. The
    /// second text takes what went wrong.
    Event<const std::string&, std::string&> DrawImage;
    Event<> CopyImage;  ///< the front puts the picture on the clipboard

    // Menus.
    MenuItem View{*this, "View", "View"};
    MenuItem ViewPerspective{*this, "ViewPerspective", "Perspective", &View};
    MenuItem ViewOrthographic{*this, "ViewOrthographic", "Orthographic", &View};
    MenuItem viewLine1{*this, "viewLine1", "-", &View};
    MenuItem ViewWaterfall{*this, "ViewWaterfall", "Waterfall", &View};
    MenuItem ViewSpectrogram{*this, "ViewSpectrogram", "Spectrogram", &View};
    MenuItem viewLine2{*this, "viewLine2", "-", &View};
    MenuItem VewClear{*this, "VewClear", "Clear", &View};
    MenuItem ViewReset{*this, "ViewReset", "Reset", &View};
    MenuItem viewLine3{*this, "viewLine3", "-", &View};
    MenuItem ViewFullScreen{*this, "ViewFullScreen", "Full Screen", &View};
    MenuItem Action{*this, "Action", "Action"};
    MenuItem ActionMove{*this, "ActionMove", "Move", &Action};
    MenuItem ActionMarkers{*this, "ActionMarkers", "Markers", &Action};
    MenuItem Markers{*this, "Markers", "Markers"};
    MenuItem MarkersDelete{*this, "MarkersDelete", "Delete", &Markers};
    MenuItem Picture{*this, "Picture", "Picture"};
    MenuItem PictureSave{*this, "PictureSave", "Save Picture...", &Picture};
    MenuItem PictureCopy{*this, "PictureCopy", "Copy Picture", &Picture};

    zel::Graph3D Graph3D{*this, "Graph3D"};
    zel::Picture picColors{*this, "picColors", "colour bar"};
    Label lblMAX{*this, "lblMAX"};
    Label lblMin{*this, "lblMin"};
    Label lblPointer{*this, "lblPointer"};  ///< what lies under the pointer

    // How the picture looks.
    DropDownList ColourMapList{*this, "ColourMapList"};
    DropDownList DepthList{*this, "DepthList"};    ///< rows in the picture
    DropDownList LevelsList{*this, "LevelsList"};  ///< where the level limits come from
    TextBox LevelMinBox{*this, "LevelMinBox"};     ///< limits by hand, in the unit of axis 3
    TextBox LevelMaxBox{*this, "LevelMaxBox"};
};

}  // namespace zel
