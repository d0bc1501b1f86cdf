#pragma once
// The panel's window: the graph and its readouts, the keys, the tools, the menus, the state.

#include <QMainWindow>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/windows/FormWindow.h"
#include "desktop/windows/GraphSide.h"
#include "desktop/windows/PanelSide.h"
#include "desktop/windows/RecentConnections.h"
#include "desktop/windows/StatusLine.h"
#include "desktop/windows/Terminators.h"
#include "desktop/windows/Theme.h"
#include "desktop/windows/ToolStrip.h"
#include "desktop/windows/WindowMemory.h"
#include "forms/ControllerForm.h"
#include "platform/Form.h"
#include "platform/LinkAddress.h"
#include "platform/Services.h"
#include "shell/Program.h"

namespace zel {

class MainWindow : public QMainWindow {
  public:
    explicit MainWindow(Program& program);
    ~MainWindow() override;

    GraphWidget& graph() { return graphSide_->graph(); }
    Binder& binder() { return binder_; }
    PanelSide& side() { return *side_; }
    StatusLine& status() { return *status_; }
    /// A menu of the themes; `choose` hears each choice, after which all is drawn again.
    void addThemeMenu(ThemeChoice now, const std::function<void(ThemeChoice)>& choose);
    /// A menu of the languages; a choice counts from the next start on.
    void addLanguageMenu(const QString& now, const std::function<void(const QString&)>& choose);
    /// Takes place, size, folded groups and the last connections from the settings, and keeps them.
    void useSettings(SettingsStore& settings);
    /// The simulated instrument is there, or is not: offers to connect, or says why not.
    void simulatorReady(const QString& device);
    void simulatorEnded(const QString& why);
    /// Builds the windows of all forms, which else come with their first use.
    void buildAll();
    /// Shows everything as the forms have it, at once.
    void showNow();
    void copyPicture();
    /// Loads a saved view, as the menu does.
    void openFile(const QString& file);

  protected:
    void closeEvent(QCloseEvent* event) override;
    void showEvent(QShowEvent* event) override;
    /// Digits that nobody took begin an entry.
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;

  private:
    void buildCentre();
    void buildWindows();
    /// A window that is built when its form is shown for the first time.
    struct Offer {
        Form& form;
        std::function<void()> build;
        bool built = false;
    };
    template <class Window, class Shown>
    void offer(Form& form, Shown& shown);
    template <class Window, class Shown>
    void offer(Shown& form);
    void build(Offer& offer);
    void buildViewKeys();
    void followState();
    void showState();
    void greyWhatRefuses();
    /// Why a control would do nothing for who looks at the window; empty when it does something.
    std::string reasonHere(const Control& control) const;
    QString titleText() const;
    void connectTo(const LinkAddress& address);
    void tellOpened(const std::string& path);
    void drawImage(const std::string& path, std::string& problem);

    Program& program_;
    ControllerForm& panel_;
    Binder binder_;
    GraphSide* graphSide_ = nullptr;
    PanelSide* side_ = nullptr;
    TerminatorRow* terminators_ = nullptr;
    StatusLine* status_ = nullptr;
    ToolStrip* tools_ = nullptr;
    std::vector<std::unique_ptr<Offer>> offers_;
    std::vector<std::unique_ptr<FormWindow>> windows_;
    std::unique_ptr<WindowMemory> memory_;
    std::unique_ptr<RecentConnections> recent_;
    int lockState_ = -1;
    bool connectToSimulator_ = false;
};

}  // namespace zel
