#include "console/ConsoleDialogs.h"

#include <array>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::array<std::pair<BoxIcon, const char*>, 6> kIcons{{
    {BoxIcon::Plain, "plain"},
    {BoxIcon::Critical, "critical"},
    {BoxIcon::Question, "question"},
    {BoxIcon::Warning, "warning"},
    {BoxIcon::Exclamation, "exclamation"},
    {BoxIcon::Information, "information"},
}};

const char* iconName(BoxIcon icon) {
    for (const auto& [known, name] : kIcons)
        if (known == icon) return name;
    return "plain";
}

std::string oneLine(const std::string& text) {
    const std::string joined = replaceAll(text, kCrLf, "\n");
    return replaceAll(replaceAll(joined, "\r", "\n"), "\n", " / ");
}

struct Word {
    const char* text;
    bool affirmative;
};
constexpr std::array<Word, 4> kWords{
    {{"yes", true}, {"ok", true}, {"no", false}, {"cancel", false}}};

bool isCancel(const std::string& answer) { return lowerCase(trimmed(answer)) == "cancel"; }

}  // namespace

std::optional<std::string> AnswerQueue::next() {
    if (answers_.empty() && await) await();
    if (answers_.empty()) return std::nullopt;
    std::string answer = std::move(answers_.front());
    answers_.pop_front();
    return answer;
}

std::string boxLine(BoxIcon icon, const std::string& title, const std::string& text) {
    return std::string("box[") + iconName(icon) + "] " + oneLine(title) + " | " + oneLine(text);
}

BoxAnswer ConsoleBoxes::show(const Box& box) {
    output_.repeatable(boxLine(box.icon, box.title, box.text));
    if (box.icon == BoxIcon::Critical) ++failures_;
    if (reader) output_.settle();  // what is answered must have been seen
    const bool asks = box.buttons != BoxButtons::Ok;
    std::optional<std::string> answer;
    if (reader) {
        answer = reader();
    } else if (asks) {
        answer = answers_.next();
    }
    if (!asks) return BoxAnswer::Ok;
    const bool yes = box.buttons != BoxButtons::OkCancel;
    const bool cancels = box.buttons != BoxButtons::YesNo;
    const BoxAnswer agreed = yes ? BoxAnswer::Yes : BoxAnswer::Ok;
    if (!answer || (reader && trimmed(*answer).empty())) return agreed;
    for (const Word& word : kWords) {
        if (lowerCase(trimmed(*answer)) != word.text) continue;
        if (word.affirmative) return agreed;
        const bool cancel = cancels && (!yes || isCancel(*answer));
        return cancel ? BoxAnswer::Cancel : BoxAnswer::No;
    }
    if (misfit) misfit(*answer);
    return agreed;
}

std::optional<std::string> ConsoleBoxes::prompt(const std::string& text, const std::string& title,
                                                const std::string& preset) {
    output_.repeatable(boxLine(BoxIcon::Question, title, text));
    std::optional<std::string> answer = answers_.next();
    if (!answer || lowerCase(trimmed(*answer)) == "ok") return preset;
    if (isCancel(*answer)) return std::nullopt;
    return answer;
}

std::optional<std::string> ConsoleFileDialogs::save(const FileDialogRequest& request) {
    return next("save", request);
}

std::optional<std::string> ConsoleFileDialogs::open(const FileDialogRequest& request) {
    return next("open", request);
}

std::optional<std::string> ConsoleFileDialogs::next(const char* kind,
                                                    const FileDialogRequest& request) {
    if (!reader) {
        std::optional<std::string> answer = answers_.next();
        if (answer && isCancel(*answer)) answer.reset();
        return answer;
    }
    const bool saves = std::string_view(kind) == "save";
    const std::string title =
        !request.title.empty() ? request.title : std::string(saves ? "Save As" : "Open");
    output_.line(std::string("file[") + kind + "] " + oneLine(title));
    std::optional<std::string> answer = reader();
    if (answer && trimmed(*answer).empty()) answer.reset();
    return answer;
}

}  // namespace zel
