#include "desktop/windows/WindowMemory.h"

#include <QGuiApplication>
#include <QScreen>
#include <string>

#include "desktop/windows/FoldGroup.h"
#include "desktop/windows/PanelSide.h"

namespace zel {
namespace {

constexpr const char* kApplication = "ZELRemote";
constexpr const char* kSection = "Desktop";
constexpr QSize kFirstSize(1440, 900);
constexpr double kShareOfScreen = 0.92;

struct ChoiceName {
    FoldGroup::Choice choice;
    const char* name;
};
constexpr ChoiceName kChoices[] = {{FoldGroup::Choice::ByRoom, ""},
                                   {FoldGroup::Choice::Open, "open"},
                                   {FoldGroup::Choice::Shut, "folded"}};

std::string keyOf(const FoldGroup& group) { return "Group" + group.name().toStdString(); }

void fitToScreen(QMainWindow& window) {
    const QScreen* screen = QGuiApplication::primaryScreen();
    if (screen == nullptr) return;
    const QRect room = screen->availableGeometry();
    window.resize(
        kFirstSize.boundedTo(room.size() * kShareOfScreen).expandedTo(window.minimumSize()));
    QRect frame(QPoint(), window.size());
    frame.moveCenter(room.center());
    window.move(frame.topLeft());
}

}  // namespace

void WindowMemory::restore(QMainWindow& window, PanelSide& side) {
    const std::string place = settings_.get(kApplication, kSection, "Window", "");
    if (place.empty() ||
        !window.restoreGeometry(QByteArray::fromBase64(QByteArray::fromStdString(place))))
        fitToScreen(window);
    for (FoldGroup* group : side.groups()) {
        const std::string name = settings_.get(kApplication, kSection, keyOf(*group), "");
        for (const ChoiceName& row : kChoices)
            if (name == row.name) group->setChoice(row.choice);
    }
    side.foldByRoom();
}

void WindowMemory::keep(const QMainWindow& window) {
    settings_.set(kApplication, kSection, "Window", window.saveGeometry().toBase64().toStdString());
}

void WindowMemory::keepFolded(const PanelSide& side) {
    for (const FoldGroup* group : side.groups())
        for (const ChoiceName& row : kChoices)
            if (row.choice == group->choice())
                settings_.set(kApplication, kSection, keyOf(*group), row.name);
}

}  // namespace zel
