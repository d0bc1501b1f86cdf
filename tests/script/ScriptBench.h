#pragma once
// The program with a script in its window, a folder for files and a scripted instrument.

#include <string>
#include <vector>

#include "script/Scripts.h"
#include "support/Text.h"
#include "tests/files/FileSession.h"

namespace zel {

struct ScriptBench : TestSession {
    ScriptBench() {
        platform.folder.folder = folder.file("home");
        startConnected();
        panel.cmdSpecial.Click();
    }

    /// The lines are the list, as if they had been opened from a file in the folder.
    void load(const Texts& lines) {
        std::string text;
        for (const std::string& line : lines) text += line + "\r\n";
        forms.specialMeas.chkSave.setValue(false);
        scripts().window.open(folder.write("script.txt", text));
    }
    void run(const Texts& lines) {
        load(lines);
        form.cmdExecute.Click();
    }
    Scripts& scripts() { return program.scripts(); }
    /// Lines of a result file, each without date and time.
    Texts results(const std::string& name) {
        Texts lines = linesOf(folder.read(name));
        for (std::string& line : lines) line.erase(0, line.find(" <"));
        return lines;
    }
    Texts boxTexts() const { return platform.boxes.texts(); }
    /// Runs `work` in the middle of the statement of that index, once.
    void atStatement(int index, const std::function<void()>& work) {
        scripts().executor.StatementBegins.connect([=, done = false](int at) mutable {
            if (at != index || done) return;
            done = true;
            work();
        });
    }

    Folder folder{platform.files};
    SpecialMeasForm& form = forms.specialMeas;
};

}  // namespace zel
