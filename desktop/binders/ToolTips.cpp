#include "desktop/binders/ToolTips.h"

#include <QObject>
#include <algorithm>
#include <cmath>
#include <string>

#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {
namespace {

struct Tip {
    const char* name;
    const char* text;
};
const Tip kTips[] = {
    {"PlaySingleButton", QT_TRANSLATE_NOOP("QObject", "Read one sweep")},
    {"PlayContinuousButton", QT_TRANSLATE_NOOP("QObject", "Read sweep after sweep")},
    {"ReconnectButton", QT_TRANSLATE_NOOP("QObject", "Connect to the same place again")},
    {"ReconnectCloseButton", QT_TRANSLATE_NOOP("QObject", "Put this line away")},
    {"StopButton", QT_TRANSLATE_NOOP("QObject", "Stop the continuous view or the recording")},
    {"cmdZoom", QT_TRANSLATE_NOOP(
                    "QObject", "Draw a rectangle to look closer; press again for the whole span")},
    {"cmd3D", QT_TRANSLATE_NOOP("QObject", "Waterfall: a hundred sweeps in depth")},
    {"ColourMapList", QT_TRANSLATE_NOOP("QObject", "Colours of the levels")},
    {"DepthList", QT_TRANSLATE_NOOP("QObject", "How many of the newest sweeps the picture shows")},
    {"LevelsList",
     QT_TRANSLATE_NOOP("QObject", "Where the lowest and the highest level come from")},
    {"LevelMinBox", QT_TRANSLATE_NOOP("QObject", "Lowest level")},
    {"LevelMaxBox", QT_TRANSLATE_NOOP("QObject", "Highest level")},
    {"lblPointer", QT_TRANSLATE_NOOP("QObject", "Frequency, time and level under the pointer")},
    {"cmdSpecial", QT_TRANSLATE_NOOP("QObject", "Scripts of measurements")},
    {"CFLabel", QT_TRANSLATE_NOOP("QObject", "Centre frequency")},
    {"SpanLabel", QT_TRANSLATE_NOOP("QObject", "Span")},
    {"MarkerLabel", QT_TRANSLATE_NOOP("QObject", "Marker: position and level")},
    {"DeltaLabel", QT_TRANSLATE_NOOP("QObject", "Delta marker or pointer: position and level")},
    {"PaceLabel",
     QT_TRANSLATE_NOOP("QObject", "Age of the trace, sweeps a second, and what sets the pace")},
    {"DebugTextBox", QT_TRANSLATE_NOOP("QObject", "Last step of the exchange with the instrument")},
    {"GetOption", QT_TRANSLATE_NOOP("QObject", "A soft key asks the instrument")},
    {"SetOption", QT_TRANSLATE_NOOP("QObject", "A soft key changes the instrument")},
    {"FrequencyButton", QT_TRANSLATE_NOOP("QObject", "Frequency menu")},
    {"SpanButton", QT_TRANSLATE_NOOP("QObject", "Span menu")},
    {"AmplitudeButton", QT_TRANSLATE_NOOP("QObject", "Amplitude menu")},
    {"BWButton", QT_TRANSLATE_NOOP("QObject", "Bandwidth menu")},
    {"SweepButton", QT_TRANSLATE_NOOP("QObject", "Sweep menu")},
    {"TraceButton", QT_TRANSLATE_NOOP("QObject", "Trace menu")},
    {"MeasButton", QT_TRANSLATE_NOOP("QObject", "Measurement menu")},
    {"TrackButton1", QT_TRANSLATE_NOOP("QObject", "Tracking generator menu")},
    {"MarkerButton", QT_TRANSLATE_NOOP("QObject", "Marker menu")},
    {"AnalyzerButton", QT_TRANSLATE_NOOP("QObject", "Analyzer mode")},
    {"TrackButton", QT_TRANSLATE_NOOP("QObject", "Tracking generator mode")},
    {"PwrButton", QT_TRANSLATE_NOOP("QObject", "Power sensor mode")},
    {"ChnPwrButton", QT_TRANSLATE_NOOP("QObject", "Channel power mode")},
    {"OccBWButton", QT_TRANSLATE_NOOP("QObject", "Occupied bandwidth mode")},
    {"TDMAButton", QT_TRANSLATE_NOOP("QObject", "TDMA power mode")},
    {"DistFaultButton", QT_TRANSLATE_NOOP("QObject", "Distance to fault mode")},
    {"AnalyzerCheck", QT_TRANSLATE_NOOP("QObject", "Analyzer mode")},
    {"TrackingGenCheck", QT_TRANSLATE_NOOP("QObject", "Tracking generator mode")},
    {"PowerSensorCheck", QT_TRANSLATE_NOOP("QObject", "Power sensor mode")},
    {"ChannelPowerCheck", QT_TRANSLATE_NOOP("QObject", "Channel power mode")},
    {"OccBWCheck", QT_TRANSLATE_NOOP("QObject", "Occupied bandwidth mode")},
    {"TDMAPowerCheck", QT_TRANSLATE_NOOP("QObject", "TDMA power mode")},
    {"DistFaultCheck", QT_TRANSLATE_NOOP("QObject", "Distance to fault mode")},
    {"MarkerCheckBox", QT_TRANSLATE_NOOP("QObject", "Switch the marker on or off")},
    {"DeltaCheckBox", QT_TRANSLATE_NOOP("QObject", "Switch the delta marker on or off")},
    {"MarkPkButton", QT_TRANSLATE_NOOP("QObject", "Marker to the highest peak")},
    {"NextPeakButton", QT_TRANSLATE_NOOP("QObject", "Marker to the next peak")},
    {"MinPeakButton", QT_TRANSLATE_NOOP("QObject", "Marker to the minimum")},
    {"MarkToCentButton", QT_TRANSLATE_NOOP("QObject", "The marker's frequency becomes the centre")},
    {"MarkToRefButton",
     QT_TRANSLATE_NOOP("QObject", "The marker's level becomes the reference level")},
    {"ResetButton", QT_TRANSLATE_NOOP("QObject", "Preset the instrument")},
    {"LocalButton", QT_TRANSLATE_NOOP("QObject", "Give the instrument's own keys back")},
    {"OnOffButton",
     QT_TRANSLATE_NOOP("QObject",
                       "Toggle remote (R) and local (L) control; the key shows the next state")},
    {"ManualCommandText", QT_TRANSLATE_NOOP("QObject", "A line of the instrument's protocol")},
    {"SendButton", QT_TRANSLATE_NOOP("QObject", "Send the line")},
    {"ManualCommandTextAnsw", QT_TRANSLATE_NOOP("QObject", "The instrument's answer")},
    {"TimeLabel", QT_TRANSLATE_NOOP("QObject", "Length of the session")},
    {"COMList", QT_TRANSLATE_NOOP("QObject", "Serial port: choose one or type a device name")},
    {"BaudList", QT_TRANSLATE_NOOP("QObject", "Baud rate: the instrument's own")},
    {"ZELButton", QT_TRANSLATE_NOOP("QObject", "Open the port and connect")},
    {"IDText", QT_TRANSLATE_NOOP("QObject", "Identity of the instrument")},
    {"TelNumberBox", QT_TRANSLATE_NOOP("QObject", "Telephone number of the far modem")},
    {"AirBaudRateText", QT_TRANSLATE_NOOP("QObject", "The modem's answer")},
    {"manualSizeMin", QT_TRANSLATE_NOOP("QObject", "Lower end of the vertical axis")},
    {"manualSizeMax", QT_TRANSLATE_NOOP("QObject", "Upper end of the vertical axis")},
    {"IPAdressTextBox",
     QT_TRANSLATE_NOOP("QObject", "Name or address of the computer at the instrument")},
    {"RemotePortTextBox", QT_TRANSLATE_NOOP("QObject", "TCP port of the server")},
    {"IDTextBox", QT_TRANSLATE_NOOP("QObject", "State of the connection")},
    {"localPortTextBox", QT_TRANSLATE_NOOP("QObject", "TCP port on which the server listens")},
    {"txtDebug", QT_TRANSLATE_NOOP("QObject", "State of the server")},
    {"FileLabel",
     QT_TRANSLATE_NOOP("QObject", "Progress of the recording or of the file that loads")},
    {"PlaybackBack", QT_TRANSLATE_NOOP("QObject", "One trace back")},
    {"PlaybackPlay",
     QT_TRANSLATE_NOOP("QObject", "Play the recording from here; the same key pauses")},
    {"PlaybackForward", QT_TRANSLATE_NOOP("QObject", "One trace forward")},
    {"PlaybackPosition", QT_TRANSLATE_NOOP("QObject", "The trace on the graph")},
    {"PlaybackLabel",
     QT_TRANSLATE_NOOP("QObject", "Position in the recording and time of the trace")},
    {"PlaybackRepeat", QT_TRANSLATE_NOOP("QObject", "Begin again at the end")},
    {"PlaybackRealTime",
     QT_TRANSLATE_NOOP("QObject", "As quick as it was recorded, by the times in the file")},
    {"PlaybackClose", QT_TRANSLATE_NOOP("QObject", "Close the recording; its last trace stays")},
    {"sldSpeed", QT_TRANSLATE_NOOP("QObject", "Set the speed for loading traces.")},
    {"TimeIntervalBox", QT_TRANSLATE_NOOP("QObject", "Seconds from one trace to the next")},
    {"CWGraph1",
     QT_TRANSLATE_NOOP("QObject",
                       "The sweep. With a marker on, drag it or move it with the arrow keys")},
};

/// Names of what the screen itself does not name.
const Tip kNames[] = {
    {"CWGraph1", QT_TRANSLATE_NOOP("QObject", "Graph")},
    {"SpectrogramPicture", QT_TRANSLATE_NOOP("QObject", "Spectrogram")},
    {"ManualCommandText", QT_TRANSLATE_NOOP("QObject", "Command")},
    {"ManualCommandTextAnsw", QT_TRANSLATE_NOOP("QObject", "Answer")},
    {"DebugTextBox", QT_TRANSLATE_NOOP("QObject", "Last step")},
    {"TimeLabel", QT_TRANSLATE_NOOP("QObject", "Length of the session")},
    {"COMList", QT_TRANSLATE_NOOP("QObject", "Port")},
    {"BaudList", QT_TRANSLATE_NOOP("QObject", "Baud rate")},
    {"IDText", QT_TRANSLATE_NOOP("QObject", "Instrument")},
    {"TelNumberBox", QT_TRANSLATE_NOOP("QObject", "Number")},
    {"AirBaudRateText", QT_TRANSLATE_NOOP("QObject", "Modem")},
    {"ConnectedPic", QT_TRANSLATE_NOOP("QObject", "State of the connection")},
    {"Picture3", QT_TRANSLATE_NOOP("QObject", "State of the connection")},
    {"FileLabel", QT_TRANSLATE_NOOP("QObject", "Progress")},
    {"PlaybackPosition", QT_TRANSLATE_NOOP("QObject", "Position in the recording")},
    {"sldSpeed", QT_TRANSLATE_NOOP("QObject", "Speed")},
    {"WaitLabel", QT_TRANSLATE_NOOP("QObject", "Wait")},
    {"ReconnectLabel", QT_TRANSLATE_NOOP("QObject", "State of the lost connection")},
};

/// Captions of controls that the window has beside those of the instrument's panel.
const Tip kOwn[] = {
    {"PlaybackBack", QT_TRANSLATE_NOOP("QObject", "Back")},
    {"PlaybackPlay", QT_TRANSLATE_NOOP("QObject", "Play")},
    {"PlaybackPlay", QT_TRANSLATE_NOOP("QObject", "Pause")},
    {"PlaybackForward", QT_TRANSLATE_NOOP("QObject", "Forward")},
    {"PlaybackRepeat", QT_TRANSLATE_NOOP("QObject", "Repeat")},
    {"PlaybackRealTime", QT_TRANSLATE_NOOP("QObject", "Real time")},
    {"PlaybackClose", QT_TRANSLATE_NOOP("QObject", "Close")},
    {"ViewMenu", QT_TRANSLATE_NOOP("QObject", "View")},
    {"ReconnectButton", QT_TRANSLATE_NOOP("QObject", "Reconnect")},
    {"ReconnectCloseButton", QT_TRANSLATE_NOOP("QObject", "Close")},
    {"ReconnectAlways", QT_TRANSLATE_NOOP("QObject", "Reconnect by Itself")},
    {"SpectrogramShow", QT_TRANSLATE_NOOP("QObject", "Spectrogram")},
    {"SpectrogramPause", QT_TRANSLATE_NOOP("QObject", "Pause Spectrogram")},
    {"SpectrogramSave", QT_TRANSLATE_NOOP("QObject", "Save Spectrogram as Recording...")},
    {"UtilityDoctor", QT_TRANSLATE_NOOP("QObject", "Connection Doctor...")},
    {"UtilityRecord", QT_TRANSLATE_NOOP("QObject", "Record Session...")},
    {"RecentMenu", QT_TRANSLATE_NOOP("QObject", "Recent Files")},
    {"SearchRatesButton", QT_TRANSLATE_NOOP("QObject", "Search Baud Rates")},
    {"chkTls", QT_TRANSLATE_NOOP("QObject", "Encrypt the connection (TLS)")},
    {"chkKeep", QT_TRANSLATE_NOOP("QObject", "Keep the client at work: refuse newcomers")},
    {"cmdCopyAddress", QT_TRANSLATE_NOOP("QObject", "Copy address")},
    {"cmdDisconnectClient", QT_TRANSLATE_NOOP("QObject", "Disconnect client")},
    {"cmdRehearse", QT_TRANSLATE_NOOP("QObject", "Check")},
    {"AddressCaption", QT_TRANSLATE_NOOP("QObject", "Connection")},
    {"cmdRunAgain", QT_TRANSLATE_NOOP("QObject", "Run again")},
    {"cmdCopy", QT_TRANSLATE_NOOP("QObject", "Copy")},
    {"cmdClose", QT_TRANSLATE_NOOP("QObject", "Close")},
    {"ViewFullScreen", QT_TRANSLATE_NOOP("QObject", "Full Screen")},
    {"Picture", QT_TRANSLATE_NOOP("QObject", "Picture")},
    {"PictureSave", QT_TRANSLATE_NOOP("QObject", "Save Picture...")},
    {"PictureCopy", QT_TRANSLATE_NOOP("QObject", "Copy Picture")},
    {"ColourMapList", QT_TRANSLATE_NOOP("QObject", "Automatic")},
    {"DepthList", QT_TRANSLATE_NOOP("QObject", "As recorded")},
    {"DepthList", QT_TRANSLATE_NOOP("QObject", "25 rows")},
    {"DepthList", QT_TRANSLATE_NOOP("QObject", "50 rows")},
    {"DepthList", QT_TRANSLATE_NOOP("QObject", "100 rows")},
    {"LevelsList", QT_TRANSLATE_NOOP("QObject", "Reference level")},
    {"LevelsList", QT_TRANSLATE_NOOP("QObject", "Automatic")},
    {"LevelsList", QT_TRANSLATE_NOOP("QObject", "By hand")},
    {"cmdSaveReport", QT_TRANSLATE_NOOP("QObject", "Save report...")},
    {"chkAttachLog", QT_TRANSLATE_NOOP("QObject", "Attach the last 200 lines of the session")},
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
    return ownCaption(control, caption).simplified();
}

bool darkInk = true;

/// For a contrast of 4.5:1 on the grounds of the themes.
constexpr double kDarkestOnDark = 0.25;
constexpr double kLightestOnLight = 0.15;

/// Relative luminance, 0 to 1, of an sRGB colour.
double luminance(const QColor& color) {
    const auto linear = [](double part) {
        return part <= 0.03928 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) +
           0.0722 * linear(color.blueF());
}

}  // namespace

QString toolTipOf(const Control& control) {
    const std::string base = control.name().substr(0, control.name().find('('));
    for (const Tip& tip : kTips)
        if (base == tip.name) return QObject::tr(tip.text);
    if (base == "SoftKey") return QObject::tr("Soft key");
    if (base == "SoftTextBox")
        return QObject::tr("Value: type a number with its prefix, then Enter");
    if (base == "ChoiceBox") return QObject::tr("Choice");
    return {};
}

QString accessibleNameOf(const Control& control) {
    const std::string base = control.name().substr(0, control.name().find('('));
    for (const Tip& row : kNames)
        if (base == row.name) return QObject::tr(row.text);
    const QString written = writtenOn(control);
    const QString number = numberOf(control.name());
    if (base == "SoftKey")
        return QObject::tr("Soft key %1").arg(number) +
               (written.isEmpty() ? QString() : ", " + written);
    if (base == "SoftTextBox") return QObject::tr("Value %1").arg(number);
    if (base == "ChoiceBox") return QObject::tr("Choice %1").arg(number);
    // A readout is read with its value.
    if (control.kind() == ControlKind::Label && !written.isEmpty()) return written;
    if (!written.isEmpty() && control.kind() != ControlKind::Label) {
        const QString tip = toolTipOf(control);
        return tip.isEmpty() ? written : written + ", " + tip;
    }
    return toolTipOf(control);
}

QString ownCaption(const Control& control, const std::string& caption) {
    for (const Tip& own : kOwn)
        if (control.name() == own.name && caption == own.text) return QObject::tr(own.text);
    return QString::fromStdString(caption);
}

void useDarkInk(bool darkTheme) { darkInk = darkTheme; }

QColor inkOf(Color color) {
    const QColor plain(static_cast<int>(color & 0xFF), static_cast<int>(color >> 8 & 0xFF),
                       static_cast<int>(color >> 16 & 0xFF));
    int hue = 0;
    int saturation = 0;
    int lightness = 0;
    plain.getHsl(&hue, &saturation, &lightness);
    QColor ink = QColor::fromHsl(std::max(hue, 0), saturation, lightness);
    // Blue looks darker than green of the same lightness.
    constexpr int kStep = 4;
    while (darkInk ? luminance(ink) < kDarkestOnDark && lightness < 255
                   : luminance(ink) > kLightestOnLight && lightness > 0) {
        lightness = std::clamp(lightness + (darkInk ? kStep : -kStep), 0, 255);
        ink = QColor::fromHsl(std::max(hue, 0), saturation, lightness);
    }
    return ink;
}

}  // namespace zel
