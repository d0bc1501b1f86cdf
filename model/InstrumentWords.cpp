#include "model/InstrumentWords.h"

#include <span>
#include <string>
#include <string_view>

#include "model/CodeTables.h"

namespace zel {
namespace {

constexpr unsigned kBoth = kWordSet | kWordGet;
constexpr unsigned kCmd = kWordCmd;
constexpr unsigned kGet = kWordGet;
using T = CodeTable;

constexpr std::string_view kOnOff = "0 off, 1 on";
constexpr std::string_view kText = "text, 32 characters at most";

constexpr InstrumentWord kWords[] = {
    {"FREQ", kBoth, "Centre frequency", "Hz", "0 to 3000000000, less the offset"},
    {"SPAN", kBoth, "Span; 0 for zero span", "Hz", "0 to 3000000000"},
    {"FREQOFFS", kBoth, "Offset that is added to the frequency", "Hz",
     "-100000000000 to 100000000000"},
    {"REFLVL", kBoth, "Reference level", "as UNIT says", "depends on UNIT and the offset"},
    {"REFLVLOFFS", kBoth, "Offset that is added to the reference level", "dB", "-200 to 200"},
    {"RANGE", kBoth, "Range of the level axis", "", "", T::Range},
    {"UNIT", kBoth, "Unit of levels", "", "", T::ReferenceUnit},
    {"RFINPUT", kBoth, "Impedance of the input", "", "", T::RFInput},
    {"DYNRANGE", kBoth, "Dynamic range", "", "0 low distortion, 1 low noise"},
    {"RBW", kBoth, "Resolution bandwidth", "", "", T::ResolutionBandwidth},
    {"VBW", kBoth, "Video bandwidth", "", "", T::VideoBandwidth},
    {"SWPTIME", kBoth, "Sweep time; 0 for automatic", "s", "0 to 1000"},
    {"SWPCONT", kBoth, "Sweeps one by one or without end", "", "", T::SweepContinuous},
    {"TRIGSRC", kBoth, "Trigger source", "", "", T::TriggerSource},
    {"TRIGLVL", kBoth, "Trigger level of the video trigger", "%", "0 to 100"},
    {"TRIGDEL", kBoth, "Delay from the trigger to the sweep", "s", "0 to 100"},
    // The captions of two hold modes stand the other way round in the panel's list.
    {"TRACEMODE", kBoth, "Trace mode", "",
     "0 Clear Write, 1 Average, 2 Min Hold, 3 Max Hold, 4 View"},
    {"TRACEDET", kBoth, "Detector", "", "", T::Detector},
    {"MEAS", kBoth, "Measurement mode", "", "", T::MeasurementMode},
    {"BAUD", kBoth, "Speed of the serial port", "", "0 19200, 1 38400, 2 57600, 3 115200"},
    {"IDN?", kGet, "Maker, model, serial number and firmware", "", "text"},
    {"LEVEL", kGet, "Level at the marker, or of the receiver", "as UNIT says", "number"},
    {"MARK1ON", kBoth, "Marker 1 shown", "", kOnOff},
    {"DELTA1ON", kBoth, "Delta marker 1 shown", "", kOnOff},
    {"MARK1", kBoth, "Position of marker 1", "Hz, s or m", "within the view"},
    {"DELTA1", kBoth, "Distance of delta marker 1 from marker 1", "Hz, s or m", "within the view"},
    {"MARKMODE", kBoth, "Marker mode", "", "0 Normal, 1 Noise, 2 Freq Count"},
    {"TRD1", kBoth, "Name of transducer factor 1", "", kText},
    {"TRD2", kBoth, "Name of transducer factor 2", "", kText},
    {"LIMLOW", kBoth, "Name of the lower limit line", "", kText},
    {"LIMUPP", kBoth, "Name of the upper limit line", "", kText},
    {"LIMPASS", kGet, "Result of the limit lines", "", "", T::LimitPass},
    {"TGLVL", kBoth, "Level of the tracking generator", "dBm", "-20 to 0"},
    {"TRANSCAL", kGet, "Scalar transmission calibration", "", "", T::Calibration},
    {"REFLCAL", kGet, "Scalar reflection calibration", "", "", T::Calibration},
    {"TRANSVECTCAL", kGet, "Vector transmission calibration", "", "", T::Calibration},
    {"REFLVECTCAL", kGet, "Vector reflection calibration", "", "", T::Calibration},
    {"PWR", kGet, "Power at the power sensor", "dBm", "number"},
    {"REFL", kGet, "Return loss at the power sensor", "dB", "number"},
    {"MEASTIME", kBoth, "Measuring time; of the power sensor as a code", "s",
     "0 Short, 1 Normal, 2 Long; TDMA power: seconds"},
    {"CHPWR", kGet, "Channel power", "as CHPWRUNIT says", "number"},
    {"CHPWRSTD", kBoth, "Standard of the channel power", "", "", T::Standard},
    {"CHPWRUNIT", kBoth, "Unit of the channel power", "", "", T::ChannelPowerUnit},
    {"CHPWRBW", kBoth, "Channel bandwidth of the channel power", "Hz", "1000 to 1000000000"},
    {"OBW", kGet, "Occupied bandwidth", "Hz", "number"},
    {"OBWSTD", kBoth, "Standard of the occupied bandwidth", "", "", T::Standard},
    {"OBWCHBW", kBoth, "Channel bandwidth of the occupied bandwidth", "Hz", "1000 to 1000000000"},
    {"TDMAPWR", kGet, "Power of the time slot", "dBm", "number"},
    {"TDMASTD", kBoth, "Standard of the TDMA power", "", "", T::TDMAStandard},
    {"CABLEMOD", kBoth, "Name of the cable model", "", kText},
    {"CABLELEN", kBoth, "Length of the cable", "m", "1 to 1000"},
    {"DTFMODE", kBoth, "Distance to fault mode", "", "", T::DTFMode},
    {"LENUNIT", kBoth, "Unit of lengths, as the instrument names it", "", kText},
    {"TRACEBIN", kGet, "The trace: 301 samples, with auto peak 602, 4 bytes each", "0.001 dB",
     "binary"},
    {"CTRACEBIN", kGet, "The complex trace: 301 pairs of real and imaginary part", "", "binary"},
    {"WAIT", kCmd, "Answers when the sweep under way has ended"},
    {"INIT", kCmd, "Starts a sweep"},
    {"RESTART", kCmd, "Starts a sweep, and averages and holds with it"},
    {"REMOTE", kCmd, "Locks the keys of the instrument: the program works it"},
    {"LOCAL", kCmd, "Gives the instrument back to its keys"},
    {"PRESET", kCmd, "All settings as the maker set them"},
    {"SAVE", kCmd, "Stores settings under a name, given with a comma"},
    {"RECALL", kCmd, "Fetches stored settings by their name, given with a comma"},
    {"MARKPK", kCmd, "Marker to the highest peak"},
    {"MARKNXTPK", kCmd, "Marker to the next lower peak"},
    {"MARKMIN", kCmd, "Marker to the lowest level"},
    {"MARKTOCENT", kCmd, "Centre frequency to the marker"},
    {"MARKTOLVL", kCmd, "Reference level to the marker's level"},
    {"LVLADJUST", kCmd, "Fits the reference level to the signal"},
    {"PWRTOREF", kCmd, "The power sensor's reading becomes the reference"},
    {"ZERO", kCmd, "Zeroes the power sensor"},
    {"LIMDEL", kCmd, "Removes the limit lines"},
    {"THROFF", kCmd, "Threshold off"},
    {"TRACETOMEM", kCmd, "Copies the trace into the memory trace"},
    {"CAL_DTF", kCmd, "Calibrates distance to fault"},
    {"CAL_TGSCLTRN", kCmd, "Calibrates scalar transmission"},
    {"CAL_TGSCLRFL", kCmd, "Calibrates scalar reflection"},
    {"CAL_TGVECTRN", kCmd, "Calibrates vector transmission"},
    {"CAL_TGVECRFL", kCmd, "Calibrates vector reflection"},
};

/// The caption without the bracket that its code follows.
std::string nameOf(const CodeRow& row) {
    std::string name(row.caption);
    while (!name.empty() && (name.back() == '(' || name.back() == ' ')) name.pop_back();
    return name;
}

}  // namespace

std::span<const InstrumentWord> instrumentWords() { return kWords; }

std::string wordValues(const InstrumentWord& word) {
    if (!word.codes) return std::string(word.range);
    std::string text;
    for (const CodeRow& row : codeTable(*word.codes)) {
        const std::string name = nameOf(row);
        // A row that is only an entry of a list is no code of the instrument.
        if (name.empty()) continue;
        text += (text.empty() ? "" : ", ") + std::to_string(row.code) + " " + name;
    }
    return text;
}

std::string wordLine(const InstrumentWord& word) {
    return std::string(word.word) + "\t" + std::string(word.meaning) + "\t" +
           std::string(word.unit) + "\t" + wordValues(word);
}

}  // namespace zel
