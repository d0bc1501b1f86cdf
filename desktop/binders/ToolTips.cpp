#include "desktop/binders/ToolTips.h"

#include <algorithm>

#include "platform/Controls.h"

namespace zel {
namespace {

struct Tip {
    const char* name;
    const char* text;
};
const Tip kTips[] = {
    {"PlaySingleButton", "Read one sweep"},
    {"PlayContinuousButton", "Read sweep after sweep"},
    {"StopButton", "Stop the continuous view or the recording"},
    {"cmdZoom", "Draw a rectangle to look closer; press again for the whole span"},
    {"cmd3D", "Waterfall: a hundred sweeps in depth"},
    {"ColourMapList", "Colours of the levels"},
    {"DepthList", "How many of the newest sweeps the picture shows"},
    {"LevelsList", "Where the lowest and the highest level come from"},
    {"LevelMinBox", "Lowest level"},
    {"LevelMaxBox", "Highest level"},
    {"lblPointer", "Frequency, time and level under the pointer"},
    {"cmdSpecial", "Scripts of measurements"},
    {"CFLabel", "Centre frequency"},
    {"SpanLabel", "Span"},
    {"MarkerLabel", "Marker: position and level"},
    {"DeltaLabel", "Delta marker or pointer: position and level"},
    {"PaceLabel", "Age of the trace, sweeps a second, and what sets the pace"},
    {"DebugTextBox", "Last step of the exchange with the instrument"},
    {"GetOption", "A soft key asks the instrument"},
    {"SetOption", "A soft key changes the instrument"},
    {"FrequencyButton", "Frequency menu"},
    {"SpanButton", "Span menu"},
    {"AmplitudeButton", "Amplitude menu"},
    {"BWButton", "Bandwidth menu"},
    {"SweepButton", "Sweep menu"},
    {"TraceButton", "Trace menu"},
    {"MeasButton", "Measurement menu"},
    {"TrackButton1", "Tracking generator menu"},
    {"MarkerButton", "Marker menu"},
    {"AnalyzerButton", "Analyzer mode"},
    {"TrackButton", "Tracking generator mode"},
    {"PwrButton", "Power sensor mode"},
    {"ChnPwrButton", "Channel power mode"},
    {"OccBWButton", "Occupied bandwidth mode"},
    {"TDMAButton", "TDMA power mode"},
    {"DistFaultButton", "Distance to fault mode"},
    {"AnalyzerCheck", "Analyzer mode"},
    {"TrackingGenCheck", "Tracking generator mode"},
    {"PowerSensorCheck", "Power sensor mode"},
    {"ChannelPowerCheck", "Channel power mode"},
    {"OccBWCheck", "Occupied bandwidth mode"},
    {"TDMAPowerCheck", "TDMA power mode"},
    {"DistFaultCheck", "Distance to fault mode"},
    {"MarkerCheckBox", "Switch the marker on or off"},
    {"DeltaCheckBox", "Switch the delta marker on or off"},
    {"MarkPkButton", "Marker to the highest peak"},
    {"NextPeakButton", "Marker to the next peak"},
    {"MinPeakButton", "Marker to the minimum"},
    {"MarkToCentButton", "The marker's frequency becomes the centre"},
    {"MarkToRefButton", "The marker's level becomes the reference level"},
    {"ResetButton", "Preset the instrument"},
    {"LocalButton", "Give the instrument's own keys back"},
    {"OnOffButton", "Toggle remote (R) and local (L) control; the key shows the next state"},
    {"ManualCommandText", "A line of the instrument's protocol"},
    {"SendButton", "Send the line"},
    {"ManualCommandTextAnsw", "The instrument's answer"},
    {"TimeLabel", "Length of the session"},
    {"COMList", "Serial port: choose one or type a device name"},
    {"BaudList", "Baud rate: the instrument's own"},
    {"ZELButton", "Open the port and connect"},
    {"IDText", "Identity of the instrument"},
    {"TelNumberBox", "Telephone number of the far modem"},
    {"AirBaudRateText", "The modem's answer"},
    {"manualSizeMin", "Lower end of the vertical axis"},
    {"manualSizeMax", "Upper end of the vertical axis"},
    {"IPAdressTextBox", "Name or address of the computer at the instrument"},
    {"RemotePortTextBox", "TCP port of the server"},
    {"IDTextBox", "State of the connection"},
    {"localPortTextBox", "TCP port on which the server listens"},
    {"txtDebug", "State of the server"},
    {"FileLabel", "Progress of the recording or of the file that loads"},
    {"sldSpeed", "Set the speed for loading traces."},
    {"TimeIntervalBox", "Seconds from one trace to the next"},
    {"CWGraph1", "The sweep. With a marker on, drag it or move it with the arrow keys"},
};

/// Names of what the screen itself does not name.
const Tip kNames[] = {
    {"CWGraph1", "Graph"},
    {"SpectrogramPicture", "Spectrogram"},
    {"ManualCommandText", "Command"},
    {"ManualCommandTextAnsw", "Answer"},
    {"DebugTextBox", "Last step"},
    {"TimeLabel", "Length of the session"},
    {"COMList", "Port"},
    {"BaudList", "Baud rate"},
    {"IDText", "Instrument"},
    {"TelNumberBox", "Number"},
    {"AirBaudRateText", "Modem"},
    {"ConnectedPic", "State of the connection"},
    {"Picture3", "State of the connection"},
    {"FileLabel", "Progress"},
    {"WaitLabel", "Wait"},
};

/// "1" of "SoftKey(0)": people count from one.
QString numberOf(const std::string& name) {
    const auto bracket = name.find('(');
    if (bracket == std::string::npos) return {};
    const QString index = QString::fromStdString(name.substr(bracket + 1)).chopped(1);
    return QString::number(index.toInt() + 1);
}

/// What stands on the control, in one line.
QString writtenOn(const Control& control) {
    std::string caption;
    switch (control.kind()) {
        case ControlKind::Button:
            caption = static_cast<const Button&>(control).Caption;
            break;
        case ControlKind::CheckBox:
            caption = static_cast<const CheckBox&>(control).Caption;
            break;
        case ControlKind::OptionButton:
            caption = static_cast<const OptionButton&>(control).Caption;
            break;
        case ControlKind::Label:
            caption = static_cast<const Label&>(control).Caption;
            break;
        default:
            break;
    }
    return QString::fromStdString(caption).simplified();
}

bool darkInk = true;

}  // namespace

QString toolTipOf(const Control& control) {
    const std::string base = control.name().substr(0, control.name().find('('));
    for (const Tip& tip : kTips)
        if (base == tip.name) return QString::fromUtf8(tip.text);
    if (base == "SoftKey") return "Soft key";
    if (base == "SoftTextBox") return "Value: type a number with its prefix, then Enter";
    if (base == "ChoiceBox") return "Choice";
    return {};
}

QString accessibleNameOf(const Control& control) {
    const std::string base = control.name().substr(0, control.name().find('('));
    for (const Tip& row : kNames)
        if (base == row.name) return QString::fromUtf8(row.text);
    const QString written = writtenOn(control);
    const QString number = numberOf(control.name());
    if (base == "SoftKey")
        return "Soft key " + number + (written.isEmpty() ? QString() : ", " + written);
    if (base == "SoftTextBox") return "Value " + number;
    if (base == "ChoiceBox") return "Choice " + number;
    // A readout is read with its value.
    if (control.kind() == ControlKind::Label && !written.isEmpty()) return written;
    if (!written.isEmpty() && control.kind() != ControlKind::Label) {
        const QString tip = toolTipOf(control);
        return tip.isEmpty() ? written : written + ", " + tip;
    }
    return toolTipOf(control);
}

void useDarkInk(bool darkTheme) { darkInk = darkTheme; }

QColor inkOf(Color color) {
    const QColor plain(static_cast<int>(color & 0xFF), static_cast<int>(color >> 8 & 0xFF),
                       static_cast<int>(color >> 16 & 0xFF));
    int hue = 0;
    int saturation = 0;
    int lightness = 0;
    plain.getHsl(&hue, &saturation, &lightness);
    lightness = darkInk ? std::max(lightness, 170) : std::min(lightness, 90);
    return QColor::fromHsl(hue < 0 ? 0 : hue, saturation, lightness);
}

}  // namespace zel
