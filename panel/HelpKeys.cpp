#include "panel/HelpKeys.h"

#include "platform/KeyInput.h"

namespace zel {

HelpKeys::HelpKeys(ControllerForm& panel) : panel_(panel) {
    const auto connect = [this](Event<int, int>& event) {
        event.connect([this](int key, int) { keyDown(key); });
    };
    for (Button* key :
         {&panel_.FrequencyButton, &panel_.SpanButton, &panel_.AmplitudeButton, &panel_.BWButton,
          &panel_.SweepButton, &panel_.TraceButton, &panel_.MeasButton, &panel_.TrackButton1,
          &panel_.MarkerButton, &panel_.SendButton})
        connect(key->KeyDown);
    for (Button& key : panel_.SoftKey) connect(key.KeyDown);
    for (TextBox& box : panel_.SoftTextBox) connect(box.KeyDown);
    connect(panel_.CWGraph1.KeyDown);
    panel_.HelpHelp.Clicked.connect([this] { panel_.ShowHelp(kContentsTopic); });
}

void HelpKeys::keyDown(int key) {
    if (key == kKeyF1) panel_.ShowHelp(kPanelTopic);
}

}  // namespace zel
