#include "support/SupportReport.h"

#include <cstddef>
#include <string>
#include <vector>

#include "platform/Clock.h"
#include "platform/Machine.h"
#include "platform/MessageBox.h"
#include "support/DriverFolders.h"
#include "support/SupportAddress.h"
#include "support/Text.h"
#include "support/VersionInfo.h"

namespace zel {
namespace {

constexpr std::size_t kColumn = 20;  // where the values begin
constexpr const char* kNotInstalled = "not installed";
constexpr const char* kUnknown = "unknown";

constexpr const char* kLegalNotes[] = {
    "ZELRemote is free software: you can redistribute it and/or modify",
    "it under the terms of the GNU General Public License as published",
    "by the Free Software Foundation, either version 3 of the License,",
    "or (at your option) any later version.",
    "",
    "This program is distributed in the hope that it will be useful,",
    "but without any warranty; without even the implied warranty of",
    "merchantability or fitness for a particular purpose. See the GNU",
    "General Public License for more details.",
};

std::string title(const std::string& name) { return "*** " + name + " ***" + kCrLf; }

std::string row(const std::string& label, const std::string& value) {
    const std::size_t gap = label.size() < kColumn ? kColumn - label.size() : 1;
    return label + std::string(gap, ' ') + value + kCrLf;
}

std::string orDash(const std::string& text) { return text.empty() ? "-" : text; }

/// "31.01.2026 23:59:59".
std::string installedText(const Clock& clock, double date) {
    if (date <= 0) return kUnknown;
    const std::vector<std::string> parts = split(clock.Clock::dateText(date), '-');
    if (parts.size() != 3) return kUnknown;
    return parts[2] + "." + parts[1] + "." + parts[0] + " " + clock.Clock::timeText(date);
}

std::string systemPart(const ReportSources& s, const MachineFacts& facts) {
    std::string text = title("GLOBAL SETUP");
    text += row("Product:", kProgramTitle);
    text += row("Version:", versionText(kVersion));
    text += row("Date:", s.clock.Clock::dateText(s.clock.date()));
    text += kCrLf + title("Operating system");
    text += row("Operating system:", orDash(facts.operatingSystem));
    text += row("Installed", installedText(s.clock, facts.installed));
    text += row("Admin rights", facts.adminRights ? "YES" : "NO");
    text += kCrLf + title("Language settings");
    text += row("Country", orDash(facts.country));
    text += row("Language", orDash(facts.language));
    text += row("Locale", orDash(facts.locale));
    text += row("Local ID", orDash(facts.codeset));
    text += kCrLf + title("DLL and EXE versions");
    text += row(facts.runtimeName, facts.runtimeVersion);
    for (const char* label : {"CVI runtime", "MSI service", "Internet Explorer"})
        text += row(label, kNotInstalled);
    return text + kCrLf;
}

std::string driverPart(const ReportSources& s, const MachineFacts& facts) {
    std::string text = title("NI ActiveX versions");
    for (const char* label : {"NI Analysis", "NI UI", "NI 3D graph"})
        text += row(label, kNotInstalled);
    text += kCrLf + title("Remote Control");
    text += facts.ieeeDriver.empty() ? std::string("IEEE BUS IS NOT INSTALLED") + kCrLf
                                     : row("IEEE driver", facts.ieeeDriver);
    text +=
        facts.visa.empty() ? std::string("VISA IS NOT INSTALLED") + kCrLf : row("VISA", facts.visa);
    text += row("Secondary VISA", kNotInstalled);
    text += row("Instrument drivers", kNotInstalled);
    return text + s.folders.text() + kCrLf;
}

std::string legalPart() {
    std::string text = title("Legal notes");
    for (const char* line : kLegalNotes) text += std::string(line) + kCrLf;
    return text + kCrLf + "Support: " + kSupportAddress + kCrLf;
}

}  // namespace

SupportReport makeSupportReport(const ReportSources& sources) {
    const MachineFacts facts = sources.machine.facts();
    return {systemPart(sources, facts), driverPart(sources, facts), legalPart()};
}

}  // namespace zel
