#include "script/ResultOutput.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "files/FileOps.h"
#include "files/OutputFile.h"
#include "forms/Forms.h"
#include "model/Numeric.h"
#include "platform/Clock.h"
#include "platform/MessageBox.h"
#include "platform/Session.h"
#include "script/ResultNames.h"
#include "support/CodePage.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "support/TimeText.h"

namespace zel {
namespace {

constexpr int kTextFilter = 2;
constexpr std::size_t kNameLength = 15;
constexpr double kDegrees = 57.2957795;

/// The number that a part begins with, in general form with one blank after it.
std::string partNumber(std::string_view part) {
    return generalNumber(GetNumeric(std::string(part))) + " ";
}

}  // namespace

std::string resultTimeText(const Clock& clock) {
    constexpr double kDayMicros = 86400e6;
    const double now = clock.date();
    // A date has steps of about a microsecond: rounded to these, then cut to milliseconds.
    const double micros = std::nearbyint((now - std::floor(now)) * kDayMicros);
    const auto ms = static_cast<std::int64_t>(std::min(micros, kDayMicros - 1) / 1000);
    const std::int64_t fraction = ms % 1000;
    const std::string digits = std::to_string(1000 + fraction).substr(1);
    const double second = static_cast<double>(ms / 1000) / 86400.0;
    return clock.dateText(std::floor(now)) + "; " + timeOfDayText(second) + "." + digits + "; ";
}

std::string resultNumbers(const std::string& value) {
    const auto semicolon = value.find(';');
    if (semicolon == std::string::npos) return partNumber(value);
    if (semicolon == 0) return "0 ; 0 ";  // nothing before it, so it parts nothing
    const std::string_view parts = value;
    return partNumber(parts.substr(0, semicolon)) + "; " + partNumber(parts.substr(semicolon + 1));
}

std::string resultName(const std::string& name) {
    std::string field(firstCharacters(upperCaseText(name), kNameLength));
    field.append(kNameLength - characterCount(field), '_');
    return lowerCaseText(field);
}

ResultOutput::ResultOutput(Forms& forms, FileOps& files, const Session& session)
    : form_(forms.specialMeas),
      panel_(forms.controller),
      statistics_(forms.std),
      files_(files),
      session_(session) {
    handlers_.on(form_.cmdSave.Clicked, [this] { cmdSave_Click(); });
    handlers_.on(form_.chkSave.Clicked, [this] { chkSave_Click(); });
    handlers_.on(form_.ResolveName, [this](std::string& name) {
        name = resolveName(files_.service(), name, form_.ScriptFolder, form_.DataFileNameTyped)
                   .value_or("");
    });
}

bool ResultOutput::chooseFile() {
    const std::string path = files_.ShowSaveDataDialog(kTextFilter);
    if (path.empty()) return false;
    form_.DataFileNameSpec = path;
    form_.outputFileTemplate = path;  // the name that a write goes back to
    form_.DataFileNameTyped = true;
    return true;
}

void ResultOutput::cmdSave_Click() { chooseFile(); }

void ResultOutput::chkSave_Click() {
    if (!form_.chkSave.Value()) form_.DataFileNameSpec.clear();
    panel_.RecordDataFlag = !form_.chkSave.Value();
}

void ResultOutput::buildOutputFileName(std::int16_t index, bool returnTemplate,
                                       const std::string& suffix, std::string& fileTemplate) {
    const bool fromTemplate = !fileTemplate.empty();
    form_.outputFileTemplate = fromTemplate ? fileTemplate : form_.DataFileNameSpec;
    const bool indexed = !fromTemplate && suffix.empty();
    // A name that a person typed keeps its blanks; the one of the number text goes always.
    std::string place = indexed ? trimmed(numberText(index)) : suffix;
    if (form_.DataFileNameTyped) place = replaceAll(place, " ", "");
    form_.DataFileNameSpec = replaceAll(form_.outputFileTemplate, "*", place);
    if (!form_.DataFileNameTyped)
        form_.DataFileNameSpec = replaceAll(form_.DataFileNameSpec, " ", "");
    if (indexed && returnTemplate) fileTemplate = form_.outputFileTemplate;
}

void ResultOutput::restoreOutputFileName() {
    if (form_.fileNameIsIndexed) form_.DataFileNameSpec = form_.outputFileTemplate;
}

bool ResultOutput::askForFile() {
    const BoxAnswer answer = session_.boxes.show(
        {BoxIcon::Question,
         "There are instructions to save data in the script, but no file has been selected.\r\n"
         "Do you want to select a file now?",
         "No output file specified", BoxButtons::YesNoCancel});
    if (answer == BoxAnswer::No) {
        form_.noSaveAnswered = true;
        return false;
    }
    if (answer == BoxAnswer::Cancel) {
        form_.cmdStop.Click();
    } else {
        chooseFile();
    }
    return true;
}

std::string ResultOutput::line(const std::string& name, const std::string& value) const {
    return resultTimeText(session_.clock) + " <" + resultName(name) + ">; " + value;
}

void ResultOutput::append(const std::string& line) {
    const auto path = resolveName(files_.service(), form_.DataFileNameSpec, form_.ScriptFolder,
                                  form_.DataFileNameTyped);
    if (!path) return;
    OutputFile file(files_.service(), *path, OutputFile::Mode::Append);
    file.line(codePageBytes(line));
    file.close();
}

void ResultOutput::saveValue(std::string& name, const std::string& value) {
    name = upperCaseText(name);
    std::string none;
    const bool measured = contains(name, ":");
    if (name == "CTRACE_TEMP") {
        buildOutputFileName(0, false, "TEMP_" + numberText(form_.ctraceMeasurementNo), none);
    } else if (measured) {
        buildOutputFileName(form_.ctraceMeasurementNo, false, "", none);
    } else if (name != "CTRACE") {
        buildOutputFileName(0, false, "VALUES", none);
    }
    if (form_.DataFileNameSpec.empty() && !form_.noSaveAnswered && !askForFile()) return;
    const bool text = name == "COMMENT" || name == "LOOPCOUNT";
    append(line(name, text ? value : resultNumbers(value)));
    restoreOutputFileName();
}

void ResultOutput::saveValue(const char* name, const std::string& value) {
    std::string changed = name;
    saveValue(changed, value);
}

void ResultOutput::saveDisplayedMeasurement(double levelAvg, double stdDevLevel, double phaseAvg,
                                            double stdDevPhase) {
    const std::string number = numberText(form_.ctraceMeasurementNo);
    const bool radians = statistics_.optRadians.Value();
    const std::string unit = radians ? "(r)" : "(d)";
    const auto save = [&](const std::string& name, double value) {
        std::string changed = number + ":" + name;
        saveValue(changed, numberText(value));
    };
    save("meanLVL", levelAvg);
    save("stdLVL", stdDevLevel);
    save("meanPhase" + unit, radians ? phaseAvg : phaseAvg * kDegrees);
    save("stdPhase" + unit, stdDevPhase);  // is in that unit already
}

}  // namespace zel
