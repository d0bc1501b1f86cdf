#include "support/LoggedDialogs.h"

#include <optional>
#include <string>

#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "support/SessionLog.h"

namespace zel {
namespace {

const char* wordOf(BoxAnswer answer) {
    switch (answer) {
        case BoxAnswer::Ok:
            return "ok";
        case BoxAnswer::Cancel:
            return "cancel";
        case BoxAnswer::Yes:
            return "yes";
        case BoxAnswer::No:
            return "no";
    }
    return "";
}

std::optional<std::string> noted(SessionLog* log, const std::optional<std::string>& answer) {
    if (log != nullptr) log->input("answer " + answer.value_or("cancel"));
    return answer;
}

}  // namespace

BoxAnswer LoggedBoxes::show(const Box& box) {
    const BoxAnswer answer = boxes_.show(box);
    if (log != nullptr && box.buttons != BoxButtons::Ok)
        log->input(std::string("answer ") + wordOf(answer));
    return answer;
}

std::optional<std::string> LoggedBoxes::prompt(const std::string& text, const std::string& title,
                                               const std::string& preset) {
    return noted(log, boxes_.prompt(text, title, preset));
}

std::optional<std::string> LoggedFileDialogs::save(const FileDialogRequest& request) {
    return noted(log, dialogs_.save(request));
}

std::optional<std::string> LoggedFileDialogs::open(const FileDialogRequest& request) {
    return noted(log, dialogs_.open(request));
}

}  // namespace zel
