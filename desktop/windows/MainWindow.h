#pragma once
// The panel's window: the graph and its readouts, the keys, the menus, the state of things.

#include <QMainWindow>
#include <QProgressBar>
#include <memory>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/windows/FormWindow.h"
#include "desktop/windows/Terminators.h"
#include "desktop/windows/Theme.h"
#include "shell/Program.h"

namespace zel {

class MainWindow : public QMainWindow {
  public:
    explicit MainWindow(Program& program);
    ~MainWindow() override;

    GraphWidget& graph() { return *graph_; }
    Binder& binder() { return binder_; }
    /// A menu of the themes; `choose` hears each choice, after which all is drawn again.
    void addThemeMenu(ThemeChoice now, const std::function<void(ThemeChoice)>& choose);
    /// Shows everything as the forms have it, at once.
    void showNow();

  protected:
    void closeEvent(QCloseEvent* event) override;
    /// Digits that nobody took begin an entry.
    void keyPressEvent(QKeyEvent* event) override;

  private:
    QWidget* graphSide();
    void buildMenus();
    void buildStatusLine();
    void showState();
    void drawImage(const std::string& path, std::string& problem);

    Program& program_;
    ControllerForm& panel_;
    Binder binder_;
    GraphWidget* graph_ = nullptr;
    TerminatorRow* terminators_ = nullptr;
    QLabel* state_ = nullptr;
    QLabel* activity_ = nullptr;
    QProgressBar* busy_ = nullptr;
    std::vector<std::unique_ptr<FormWindow>> windows_;
    QTimer activityOff_;
};

}  // namespace zel
