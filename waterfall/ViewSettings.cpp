#include "waterfall/ViewSettings.h"

#include <string>
#include <string_view>

#include "forms/WaterfallForm.h"
#include "model/Numeric.h"
#include "platform/Graph3D.h"
#include "support/INIIO.h"
#include "support/IniFile.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kFile = "3dgraph.ini";
constexpr const char* kAxes[] = {"Axis1", "Axis2", "Axis3"};
constexpr double kDesignMaxima[] = {12, 10, 10};

struct Entry {
    const char* section;  ///< without the letter of the set
    const char* key;
    double GraphView3D::*number;
};
/// In the order of writing.
constexpr Entry kEntries[] = {
    {"Distance", "Zoom", &GraphView3D::Distance},
    {"Rotation", "Latitude", &GraphView3D::Latitude},
    {"Rotation", "Longitude", &GraphView3D::Longitude},
    {"Translation", "TransX", &GraphView3D::TransX},
    {"Translation", "TransY", &GraphView3D::TransY},
    {"Translation", "TransZ", &GraphView3D::TransZ},
};
constexpr const char* kKinds[] = {"Distance", "Rotation", "Translation"};

struct Set {
    const char* letter;
    GraphView3D WaterfallForm::*view;
    bool WaterfallForm::*moved[3];  ///< in the order of `kKinds`
};
constexpr Set kSets[] = {
    {"W",
     &WaterfallForm::WaterfallView,
     {&WaterfallForm::waterfallZoomed, &WaterfallForm::waterfallRotated,
      &WaterfallForm::waterfallPanned}},
    {"S",
     &WaterfallForm::SpectrogramView,
     {&WaterfallForm::spectrogramZoomed, &WaterfallForm::spectrogramRotated,
      &WaterfallForm::spectrogramPanned}},
};

}  // namespace

std::string ViewSettings::stored(const std::string& file, const std::string& section,
                                 const std::string& key) {
    return std::get<std::string>(ReadIni(files_, file, section, key, IniValue(std::string())));
}

bool ViewSettings::read(const std::string& file, const std::string& section, const std::string& key,
                        double& number) {
    const std::string text = stored(file, section, key);
    if (text.empty()) return false;
    number = ParseNumberInvariant(text);
    return true;
}

std::string ViewSettings::fileName() {
    const std::string folder = folder_.path();
    return folder.empty() ? std::string() : folder + "/" + kFile;
}

void ViewSettings::readAxes() {
    const std::string file = fileName();
    if (file.empty()) return;
    for (int i = 0; i < 3; ++i) {
        double minimum = form_.Graph3D.axis(i + 1).Minimum;
        double maximum = form_.Graph3D.axis(i + 1).Maximum;
        read(file, kAxes[i], "min", minimum);
        read(file, kAxes[i], "max", maximum);
        form_.Graph3D.setRange(i + 1, minimum, maximum);
    }
}

void ViewSettings::readCameras() {
    const std::string file = fileName();
    for (const Set& set : kSets) {
        GraphView3D& view = form_.*set.view;
        view = form_.Graph3D.view();
        for (int kind = 0; kind < 3 && !file.empty(); ++kind) {
            for (const Entry& entry : kEntries) {
                if (std::string_view(entry.section) != kKinds[kind]) continue;
                const std::string section = std::string(entry.section) + set.letter;
                if (read(file, section, entry.key, view.*entry.number))
                    form_.*set.moved[kind] = true;
            }
        }
    }
}

bool ViewSettings::readMode() {
    const std::string file = fileName();
    const std::string text = file.empty() ? std::string() : stored(file, "Mode", "View");
    if (text.empty()) return form_.IsSpectrogram;
    const std::string upper = upperCase(trimmed(text));
    return upper == "TRUE" || upper == "WAHR" || ParseNumberInvariant(text) != 0;
}

double ViewSettings::readDistance(double fallback) {
    if (const std::string file = fileName(); !file.empty())
        read(file, "Distance", "Zoom", fallback);
    return fallback;
}

void ViewSettings::write() {
    const std::string file = fileName();
    if (file.empty()) return;
    IniFile ini = IniFile::load(files_, file);
    ini.setValue("Mode", "View", form_.IsSpectrogram ? "1" : "0");
    for (const char* kind : kKinds)
        for (const Set& set : kSets)
            for (const Entry& entry : kEntries)
                if (std::string_view(entry.section) == kind)
                    ini.setValue(kind + std::string(set.letter), entry.key,
                                 generalNumber(form_.*set.view.*entry.number));
    for (int i = 0; i < 3; ++i) {
        ini.setValue(kAxes[i], "Max", generalNumber(form_.Graph3D.axis(i + 1).Maximum));
        ini.setValue(kAxes[i], "Min", generalNumber(form_.Graph3D.axis(i + 1).Minimum));
    }
    ini.save(files_, file);
}

void ViewSettings::writeReset() {
    const std::string file = fileName();
    if (file.empty()) return;
    IniFile ini = IniFile::load(files_, file);
    for (int i = 0; i < 3; ++i) {
        ini.setValue(kAxes[i], "Max", generalNumber(kDesignMaxima[i]));
        ini.setValue(kAxes[i], "Min", "0");
    }
    for (const Set& set : kSets)
        for (const Entry& entry : kEntries)
            if (std::string_view(entry.section) == "Translation")
                ini.setValue(entry.section + std::string(set.letter), entry.key,
                             generalNumber(form_.*set.view.*entry.number));
    ini.save(files_, file);
}

}  // namespace zel
