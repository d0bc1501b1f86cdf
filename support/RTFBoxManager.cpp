#include "support/RTFBoxManager.h"

#include <cstddef>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Controls.h"
#include "platform/Form.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::string_view kShown = "<CR> ";
constexpr std::string_view kReplaced = "<CR>";

/// Replaces the first mark of the runs; false where there is none.
bool showMark(std::vector<TextRun>& runs) {
    for (std::size_t i = 0; i < runs.size(); ++i) {
        const std::string_view mark = kCarriageReturnMark;
        const auto at = runs[i].text.find(mark);
        if (at == std::string::npos) continue;
        TextRun shown = runs[i];
        shown.text = kShown;
        shown.bold = true;
        TextRun rest = runs[i];
        rest.text = runs[i].text.substr(at + mark.size());
        runs[i].text.erase(at);
        std::vector<TextRun> parts{std::move(runs[i]), std::move(shown), std::move(rest)};
        std::erase_if(parts, [](const TextRun& run) { return run.text.empty(); });
        const auto place = runs.erase(runs.begin() + static_cast<std::ptrdiff_t>(i));
        runs.insert(place, parts.begin(), parts.end());
        return true;
    }
    return false;
}

}  // namespace

void appendRichText(RichText& box, const std::string& text, bool bold, bool italic, Color color,
                    bool newLine) {
    box.append({text, bold, italic, color});
    if (contains(text, kCarriageReturnMark)) {
        std::string working = text;
        markCarriageReturns(box, working);
    } else if (newLine) {
        box.append({kCrLf, bold, italic, color});
    }
}

void markCarriageReturns(RichText& box, std::string& text) {
    std::vector<TextRun> runs = box.runs();
    for (auto at = text.find(kCarriageReturnMark); at != std::string::npos;
         at = text.find(kCarriageReturnMark)) {
        showMark(runs);
        text.replace(at, std::string_view(kCarriageReturnMark).size(), kReplaced);
    }
    box.setRuns(std::move(runs));
}

}  // namespace zel
