#pragma once
// The instrument's front panel on the screen, and the session variables that all rooms share.

#include <cstdint>
#include <string>
#include <vector>

#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/Graph.h"

namespace zel {

/// What holds for the view on the graph, whatever the instrument does meanwhile. Of a loaded file
/// it is what the file says: the mirror stays the instrument's, but for the fields that a file
/// sets, and its range is then dB a division and no code.
struct ShownView {
    std::string xUnit;                ///< "Hz", "s", "m"; empty before the first view
    std::int16_t instrumentMode = 0;  ///< of a sweep; 0 for none
    bool fromFile = false;
    std::string mode;       ///< as the file names it; empty when it does not
    std::string rbw;        ///< Hz
    std::string vbw;        ///< Hz
    std::string sweepTime;  ///< s
    std::string detector;   ///< as the file names it
};

class ControllerForm : public Form {
  public:
    ControllerForm();

    // Soft menus, values of State.
    static constexpr std::int16_t AMPT = 1;
    static constexpr std::int16_t SPAN = 2;
    static constexpr std::int16_t Freq = 3;
    static constexpr std::int16_t BW = 4;
    static constexpr std::int16_t SWEEP = 5;
    static constexpr std::int16_t TRACE = 6;
    static constexpr std::int16_t MEAS = 7;
    static constexpr std::int16_t MEAS_TRD = 71;
    static constexpr std::int16_t MEAS_LLINES = 72;
    static constexpr std::int16_t Marker = 8;
    static constexpr std::int16_t TRACKINGGEN = 9;
    static constexpr std::int16_t POWER = 10;
    static constexpr std::int16_t CHNPOWER = 11;
    static constexpr std::int16_t OCCBW = 12;
    static constexpr std::int16_t TDMA = 13;
    static constexpr std::int16_t DISTFAULT = 14;

    // Connection kinds, values of ConnectionState; 0 before the first choice.
    static constexpr std::int16_t DIRECTCON = 1;
    static constexpr std::int16_t MODEMCON = 2;
    static constexpr std::int16_t GSMCON = 3;
    static constexpr std::int16_t TCPCON = 4;
    static constexpr std::int16_t HTTPCON = 5;
    static constexpr std::int16_t MODEMGSMCON = 6;
    static constexpr std::int16_t GSMMODEMCON = 7;

    // Measurement modes, values of InstrumentMode and of the instrument's MEAS.
    static constexpr std::int16_t ANALYZER = 1;
    static constexpr std::int16_t TRACKINGGENERATOR = 2;
    static constexpr std::int16_t POWERSENSOR = 3;
    static constexpr std::int16_t CHANNELPOWER = 4;
    static constexpr std::int16_t OCCBANDWIDTH = 5;
    static constexpr std::int16_t TDMAPOWERMODE = 6;
    static constexpr std::int16_t DISTTOFAULTMEASURE = 7;
    static constexpr std::int16_t RECEIVER = 8;

    // Session variables.
    double StartT = 0;       ///< date at which the connection began; 0 shows the time of day
    std::int16_t State = 0;  ///< current soft menu; 0 before the first
    std::int16_t LastState = 0;
    std::int32_t UserAnswer = 0;
    bool immConnectState = false;  ///< quick connect was used: no dialog is shown
    std::int16_t ConnectionState = 0;
    std::int16_t InstrumentMode = ANALYZER;
    bool STOPFlag = false;   ///< true while an acquisition is allowed to go on
    double MarkerValue = 0;  ///< x of marker 1, in the unit of the x axis
    double MarkerLevel = 0;  ///< y of marker 1, in the unit of the y axis
    double DeltaValue = 0;   ///< x of the delta marker
    double LastSpan = 0;     ///< span before the last manual change, Hz
    bool RecordDataFlag = false;
    std::string DataFileName;           ///< target of a recording or a script
    std::string CommonDialog1FileName;  ///< the name that stands in the file dialog
    std::vector<double> DataXAxisArrayToLoad;
    std::vector<double> DataValArrayToLoad;
    bool ContinuosLoopActive = false;
    /// A view or a single trace is under way, be it one that is to stop.
    bool AcquisitionRunning = false;
    bool SingleSweepModeActive = false;
    bool TriggerKeyIsLevel = false;  ///< the trigger key and its box are the level, else the delay
    std::string mLoadOption;
    bool isConnected = false;  ///< the handshake is done
    bool LinkLost = false;     ///< the line has died: what is shown will not become newer
    double RecordTimeValue = 0;
    bool ErrorFlag = false;  ///< a link failure was reported already
    bool ChoiceBoxActivated = false;
    bool BinaryModeActive = false;  ///< a binary transfer was made: noise is no longer judged
    bool isSpecMeas = false;
    bool isZELViewLinFile = false;
    bool IsLINValued = false;
    bool GraphZoomed = false;  ///< the user's zoom is on: new traces leave the x axis alone
    std::string CommandLine;   ///< the words that the program was started with
    bool STAT = false;         ///< the last word test's result (DebugIt)
    std::int16_t SoftBoxFirstKey = 1;
    std::int16_t ManualFirstKey = 1;
    std::string InstrumentAnswer;  ///< last answer of a query of the read cycle
    std::string LastPowerText;
    std::string LastReflectionText;
    std::string LastReadingText;

    // The current sweep; see the read cycle.
    std::vector<double> TraceData;      ///< 301 samples
    std::vector<double> PeakTraceData;  ///< 602 samples, min and max pairs, auto peak detector
    std::vector<double> RawTraceData;   ///< in the reference unit, not clipped to the display
    std::vector<double> TraceColours;   ///< 0 to 100, one a point
    double TraceMinimum = 0;
    double TraceMaximum = 0;
    double TraceIntervals = 300;
    double ViewCenter = 0;  ///< Hz
    double ViewSpan = 0;    ///< Hz
    double ViewStart = 0;   ///< Hz, s or m
    double ViewStop = 0;
    double ViewXOffset = 0;
    double RawScale = 1000;
    std::vector<double> XVector;
    std::vector<double> YVector;
    std::int32_t YVectorVal = 0;  ///< row number of the current trace in the waterfall
    ShownView Shown;              ///< of the view on the graph
    bool SeriesPlays = false;     ///< the traces of a loaded recording go over the graph

    /// Saves the trace just read: "trace" or "power".
    Event<const std::string&> SaveView;
    /// Loads the file of that path, as `LoadData` does with the one that was chosen.
    Event<const std::string&> OpenFile;
    std::string DebugLogName = "debug.log";  ///< in the application's folder
    Event<> CloseDebugLog;                   ///< before its deletion
    Event<int> ShowHelp;                     ///< opens the help topic of that context number
    /// A row of the spectrogram is to be shown as the trace; 0 is the newest.
    Event<int> SpectrogramRow;
    Event<> TraceLoaded;  ///< after each trace of a file that was read and drawn
    /// The front draws the graph into the file of that path, its ending names the kind. The second
    /// text takes what went wrong.
    Event<const std::string&, std::string&> DrawImage;

    // Menus.
    MenuItem FileMenu{*this, "FileMenu", "File"};
    MenuItem LoadData{*this, "LoadData", "Load Data...", &FileMenu};
    MenuItem RecentMenu{*this, "RecentMenu", "Recent Files", &FileMenu};
    ControlArray<MenuItem, 8> RecentFile{*this, "RecentFile", std::string(), &RecentMenu};
    MenuItem SaveCurrentView{*this, "SaveCurrentView", "Save Current View...", &FileMenu};
    MenuItem MenuFileSaveImage{*this, "MenuFileSaveImage", "Save Image...", &FileMenu};
    MenuItem RecordData{*this, "RecordData", "Record Data...", &FileMenu};
    MenuItem FileLine{*this, "FileLine", "-", &FileMenu};
    MenuItem ExitObject{*this, "ExitObject", "Exit", &FileMenu};
    MenuItem Connection{*this, "Connection", "Connection"};
    MenuItem ImmConnect{*this, "ImmConnect", "Direct Connect", &Connection};
    MenuItem Direct{*this, "Direct", "Direct Serial Port Connection...", &Connection};
    MenuItem Modem{*this, "Modem", "Two Modems Connection...", &Connection};
    MenuItem GSM{*this, "GSM", "Two Mobile Phones Connection...", &Connection};
    MenuItem ModemToGSM{*this, "ModemToGSM", "Modem To Mobile Phone Connection...", &Connection};
    MenuItem GSMToModem{*this, "GSMToModem", "Mobile Phone to Modem Connection...", &Connection};
    MenuItem TCPConnection{*this, "TCPConnection", "TCP/IP Connection...", &Connection};
    MenuItem ConnectionLine{*this, "ConnectionLine", "-", &Connection};
    MenuItem SetDevice{*this, "SetDevice", "Set Communication Device...", &Connection};
    MenuItem Disconnect{*this, "Disconnect", "Disconnect", &Connection};
    MenuItem ReconnectAlways{*this, "ReconnectAlways", "Reconnect by Itself", &Connection};
    MenuItem Utility{*this, "Utility", "Utility"};
    MenuItem UtilityGraphSettings{*this, "UtilityGraphSettings", "Graph Settings...", &Utility};
    MenuItem UtilityServer{*this, "UtilityServer", "Server Mode...", &Utility};
    MenuItem UtilityStartup{*this, "UtilityStartup", "Run on Startup", &Utility};
    MenuItem UtilityTrouble{*this, "UtilityTrouble", "Instrument Simulator", &Utility};
    MenuItem UtilityDoctor{*this, "UtilityDoctor", "Connection Doctor...", &Utility};
    MenuItem UtilityRecord{*this, "UtilityRecord", "Record Session...", &Utility};
    MenuItem DelLogFile{*this, "DelLogFile", "Delete Log File", &Utility};
    MenuItem ViewMenu{*this, "ViewMenu", "View"};
    MenuItem SpectrogramShow{*this, "SpectrogramShow", "Spectrogram", &ViewMenu};
    MenuItem SpectrogramPause{*this, "SpectrogramPause", "Pause Spectrogram", &ViewMenu};
    MenuItem SpectrogramSave{*this, "SpectrogramSave", "Save Spectrogram as Recording...",
                             &ViewMenu};
    MenuItem HelpMenu{*this, "HelpMenu", "Help"};
    MenuItem HelpHelp{*this, "HelpHelp", "Contents", &HelpMenu};
    MenuItem HelpAbout{*this, "HelpAbout", "About ZELRemote...", &HelpMenu};

    // The graph and the readouts under it.
    Graph CWGraph1{*this, "CWGraph1"};
    Picture SpectrogramPicture{*this, "SpectrogramPicture"};  ///< earlier sweeps, time downwards
    Button cmdZoom{*this, "cmdZoom", "Zoom"};
    Button cmd3D{*this, "cmd3D", "3D"};
    Button cmdSpecial{*this, "cmdSpecial", "Script"};
    Button PlaySingleButton{*this, "PlaySingleButton", "Single"};
    Button PlayContinuousButton{*this, "PlayContinuousButton", "Continuous"};
    Button StopButton{*this, "StopButton", "Stop"};
    Label CFLabel{*this, "CFLabel"};
    Label SpanLabel{*this, "SpanLabel"};
    Label MarkerLabel{*this, "MarkerLabel"};
    Label DeltaLabel{*this, "DeltaLabel"};
    Label PaceLabel{*this, "PaceLabel"};          ///< age of the trace, sweeps a second
    Frame PlaybackFrame{*this, "PlaybackFrame"};  ///< shown as long as a recording is loaded
    Button PlaybackBack{*this, "PlaybackBack", "Back"};
    Button PlaybackPlay{*this, "PlaybackPlay", "Play"};  ///< "Pause" while it plays
    Button PlaybackForward{*this, "PlaybackForward", "Forward"};
    Slider PlaybackPosition{*this, "PlaybackPosition"};  ///< the trace on the graph, from 1
    Label PlaybackLabel{*this, "PlaybackLabel"};         ///< position and time of the trace
    CheckBox PlaybackRepeat{*this, "PlaybackRepeat", "Repeat"};
    CheckBox PlaybackRealTime{*this, "PlaybackRealTime", "Real time"};
    Button PlaybackClose{*this, "PlaybackClose", "Close"};
    Frame ReconnectFrame{*this, "ReconnectFrame"};  ///< shown while a port has gone or come back
    Label ReconnectLabel{*this, "ReconnectLabel"};
    Button ReconnectButton{*this, "ReconnectButton", "Reconnect"};
    Button ReconnectCloseButton{*this, "ReconnectCloseButton", "Close"};
    Label FileLabel{*this, "FileLabel"};  ///< progress of a recording or of a file that loads
    Label WaitLabel{*this, "WaitLabel"};  ///< what is waited for, and how long at most
    TextBox DebugTextBox{*this, "DebugTextBox"};

    // Soft positions.
    OptionButton GetOption{*this, "GetOption", "option", "Get"};
    OptionButton SetOption{*this, "SetOption", "option", "Set"};
    ControlArray<Frame, 5> SoftFrame{*this, "SoftFrame"};
    ControlArray<Button, 5> SoftKey{*this, "SoftKey"};
    ControlArray<TextBox, 5> SoftTextBox{*this, "SoftTextBox"};
    ControlArray<DropDownList, 5> ChoiceBox{*this, "ChoiceBox"};

    // Hard keys; each shows a picture of the image list.
    Button FrequencyButton{*this, "FrequencyButton", "FREQ"};
    Button SpanButton{*this, "SpanButton", "SPAN"};
    Button AmplitudeButton{*this, "AmplitudeButton", "AMPL"};
    Button BWButton{*this, "BWButton", "BW"};
    Button SweepButton{*this, "SweepButton", "SWEEP"};
    Button TraceButton{*this, "TraceButton", "TRACE"};
    Button MeasButton{*this, "MeasButton", "MEAS"};
    Button TrackButton1{*this, "TrackButton1", "TRACK"};
    Button MarkerButton{*this, "MarkerButton", "MARKER"};

    // Measurement modes.
    Button AnalyzerButton{*this, "AnalyzerButton", "Analyzer"};
    OptionButton AnalyzerCheck{*this, "AnalyzerCheck", "mode"};
    Button TrackButton{*this, "TrackButton", "Tracking Gen"};
    OptionButton TrackingGenCheck{*this, "TrackingGenCheck", "mode"};
    Button PwrButton{*this, "PwrButton", "Power Sensor"};
    OptionButton PowerSensorCheck{*this, "PowerSensorCheck", "mode"};
    Button ChnPwrButton{*this, "ChnPwrButton", "Channel Power"};
    OptionButton ChannelPowerCheck{*this, "ChannelPowerCheck", "mode"};
    Button OccBWButton{*this, "OccBWButton", "Occupied BW"};
    OptionButton OccBWCheck{*this, "OccBWCheck", "mode"};
    Button TDMAButton{*this, "TDMAButton", "TDMA Power"};
    OptionButton TDMAPowerCheck{*this, "TDMAPowerCheck", "mode"};
    Button DistFaultButton{*this, "DistFaultButton", "Dist. to Fault"};
    OptionButton DistFaultCheck{*this, "DistFaultCheck", "mode"};

    // Marker keys.
    CheckBox MarkerCheckBox{*this, "MarkerCheckBox", "Marker"};
    CheckBox DeltaCheckBox{*this, "DeltaCheckBox", "Delta"};
    Button MarkPkButton{*this, "MarkPkButton", "Peak"};
    Button NextPeakButton{*this, "NextPeakButton", "Next Peak"};
    Button MinPeakButton{*this, "MinPeakButton", "Min"};
    Button MarkToCentButton{*this, "MarkToCentButton", "Mkr to Center"};
    Button MarkToRefButton{*this, "MarkToRefButton", "Mkr to Ref"};

    // Instrument control.
    Button ResetButton{*this, "ResetButton", "Preset"};
    Button LocalButton{*this, "LocalButton", "Local"};
    Button OnOffButton{*this, "OnOffButton", "L"};
    TextBox ManualCommandText{*this, "ManualCommandText", "Enter a Command"};
    Button SendButton{*this, "SendButton", "Send"};
    TextBox ManualCommandTextAnsw{*this, "ManualCommandTextAnsw"};

    // Connection state.
    Picture ConnectedPic{*this, "ConnectedPic", "connected"};
    Picture Picture3{*this, "Picture3", "remote"};
    Label TimeLabel{*this, "TimeLabel"};
    Timer UpNow{*this, "UpNow", 1000};
    Timer PaceTimer{*this, "PaceTimer", 250};
};

}  // namespace zel
