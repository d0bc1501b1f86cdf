#include "desktop/windows/Theme.h"

#include <QApplication>
#include <QPalette>
#include <QStyle>
#include <QStyleFactory>
#include <utility>

#include "desktop/binders/ToolTips.h"
#include "desktop/windows/ThemeColors.h"

namespace zel {
namespace {

constexpr const char* kStyleSheet = R"(
QWidget { font-size: 12px; }
QPushButton { background: @button; color: @text; border: 1px solid @border; border-radius: 6px;
    padding: 2px 6px; min-height: 20px; }
QPushButton:hover { background: @buttonHover; }
QPushButton:pressed { background: @accent; color: @accentText; }
QPushButton:focus { border: 2px solid @focus; padding: 1px 5px; }
QPushButton:default { border-color: @accent; background: @accent; color: @accentText; }
QPushButton:default:hover { border-color: @text; }
QPushButton:default:focus { border-color: @text; }
QPushButton:disabled { color: @dim; background: @window; }
QPushButton[face="red"] { background: @red; color: #ffffff; font-weight: bold; }
QPushButton[face="green"] { background: @green; color: #ffffff; font-weight: bold; }
QPushButton[face="yellow"] { background: @yellow; color: @yellowText; font-weight: bold;
    border-color: @yellowEdge; }
QPushButton[face="yellow"]:hover { border-color: @yellowText; }
QPushButton[face="yellow"]:pressed { background: @accent; color: @accentText; }
QPushButton[face="blue"] { background: @accent; color: @accentText; font-weight: bold; }
QPushButton[face]:disabled { color: @dim; background: @window; font-weight: normal; }
QPushButton[face]:focus { border: 2px solid @text; }
QPushButton#StopButton { background: @red; color: #ffffff; font-weight: bold; }
QComboBox { color: @text; }
QLineEdit, QComboBox { background: @base; border: 1px solid @border;
    border-radius: 4px; padding: 1px 4px; min-height: 18px; }
QLineEdit:focus, QComboBox:focus { border: 2px solid @focus; padding: 0px 3px; }
QComboBox QAbstractItemView { background: @base; color: @text; border: 1px solid @border;
    selection-background-color: @accent; selection-color: @accentText; }
QComboBox::drop-down { border: none; width: 18px; }
QComboBox::down-arrow { width: 0; height: 0; border-left: 4px solid @base;
    border-right: 4px solid @base; border-top: 5px solid @caption; }
QComboBox::down-arrow:disabled { border-left-color: @window; border-right-color: @window;
    border-top-color: @dim; }
QLineEdit[face="locked"] { background: transparent; border: 1px dashed @border; }
QComboBox[face="locked"] { background: transparent; border: 1px dashed @border; }
QComboBox[face="locked"]::down-arrow { border: none; }
QLineEdit[face="locked"]:focus, QComboBox[face="locked"]:focus { border: 2px dashed @focus; }
QComboBox[refused="true"], QLineEdit[refused="true"], QLineEdit[refused="true"]:focus { border: 2px solid @problem;
    color: @problem; padding: 0px 3px; }
QPushButton[face="terminator"] { background: @base; padding: 1px 2px; font-size: 11px; }
QPushButton[face="terminator"]:hover { background: @buttonHover; }
QPushButton[face="terminator"]:pressed { background: @accent; color: @accentText; }
QLineEdit:disabled, QComboBox:disabled { color: @dim; background: @window; }
QLabel#caption { color: @caption; font-size: 11px; }
QLabel[readout="true"] { font-size: 13px; font-weight: 600; }
QLabel[file="true"] { color: @file; }
QLabel#caption[problem="true"] { color: @problem; }
QLineEdit[struck="true"] { color: @problem; text-decoration: line-through; }
QComboBox[struck="true"] { border-color: @problem; text-decoration: line-through; }
QFrame#group, QScrollArea#panel { background: @panel; border: 1px solid @hairline;
    border-radius: 6px; }
QWidget#column { background: transparent; }
QFrame#card { background: @panel; border: 1px solid @border; border-radius: 6px; }
QPushButton[soft="true"] { min-height: 28px; }
QPushButton[way="true"] { text-align: left; padding: 4px 10px; min-height: 24px; }
QPushButton[narrow="true"] { padding: 2px 0px; font-size: 10px; min-height: 20px; }
QPushButton[tool="true"] { padding: 2px 8px; min-height: 24px; }
QLineEdit[flat="true"], QLineEdit[flat="true"]:read-only { background: transparent; border: none;
    color: @caption; }
QToolBar { background: @window; border: none; border-bottom: 1px solid @hairline; spacing: 4px;
    padding: 4px 6px; }
QToolBar::separator { background: transparent; width: 8px; }
QToolBar QToolButton { background: @button; color: @text; border: 1px solid @border;
    border-radius: 6px; padding: 2px 6px; min-height: 22px; }
QToolBar QToolButton:hover { background: @buttonHover; }
QToolBar QToolButton:focus { border: 2px solid @focus; padding: 1px 5px; }
QToolBar QToolButton:pressed, QToolBar QToolButton:checked { background: @accent;
    color: @accentText; }
QToolBar QToolButton:disabled { color: @dim; background: @window; }
QToolBar QToolButton[popupMode="1"] { padding-right: 18px; }
QToolBar QToolButton::menu-button { border: none; width: 16px; }
QToolBar QToolButton#StopTool:enabled { background: @red; color: #ffffff; }
QToolButton#heading { background: transparent; color: @caption; border: none; font-size: 11px;
    font-weight: 600; text-align: left; padding: 1px 0px; min-height: 14px; }
QToolButton#heading:hover { color: @text; }
QToolButton#heading:focus { border: 1px solid @focus; border-radius: 3px; }
QMenuBar, QStatusBar { background: @window; }
QStatusBar::item { border: none; }
QScrollBar:vertical { background: transparent; width: 8px; margin: 0; }
QScrollBar::handle:vertical { background: @border; border-radius: 4px; min-height: 24px; }
QScrollBar::add-line:vertical, QScrollBar::sub-line:vertical { height: 0; }
QToolTip { background: @base; color: @text; border: 1px solid @border; }
QStatusBar QLabel { padding: 0 6px; }
QMenu { background: @panel; border: 1px solid @border; }
QMenuBar::item:disabled, QMenu::item:disabled { color: @dim; }
QRadioButton, QCheckBox, QSlider { border: 1px solid transparent; }
QRadioButton:focus, QCheckBox:focus { background: @buttonHover; border: 1px solid @focus; }
QSlider:focus { border: 1px solid @focus; }
QTabWidget::pane { background: @panel; border: 1px solid @hairline; }
QTabBar::tab { background: transparent; color: @caption; border: 1px solid transparent;
    padding: 4px 5px; }
QTabBar::tab:hover { color: @text; }
QTabBar::tab:selected { background: @panel; color: @text; border-color: @hairline;
    border-bottom: 2px solid @accent; }
QTabBar::tab:focus { border: 1px solid @focus; }
QRadioButton::indicator, QCheckBox::indicator { width: 12px; height: 12px;
    border: 1px solid @dim; background: @base; }
QCheckBox::indicator { border-radius: 3px; }
QRadioButton::indicator { border-radius: 7px; }
QRadioButton::indicator:checked, QCheckBox::indicator:checked { background: @accent;
    border: 1px solid @text; }
QCheckBox::indicator:checked { image: url(:/pictures/check.svg); }
QRadioButton::indicator:disabled, QCheckBox::indicator:disabled { border-color: @border; }
)";

QString styled(const ThemeColors& c) {
    const std::pair<const char*, const char*> names[] = {
        {"@buttonHover", c.buttonHover},
        {"@button", c.button},
        {"@accentText", c.accentText},
        {"@accent", c.accent},
        {"@border", c.border},
        {"@panel", c.panel},
        {"@hairline", c.hairline},
        {"@yellowText", c.yellowText},
        {"@yellowEdge", c.yellowEdge},
        {"@yellow", c.yellow},
        {"@window", c.window},
        {"@base", c.base},
        {"@text", c.text},
        {"@dim", c.dim},
        {"@caption", c.caption},
        {"@red", c.red},
        {"@green", c.green},
        {"@focus", c.focus},
        {"@problem", c.problem},
        {"@file", c.file},
    };
    QString sheet = kStyleSheet;
    for (const auto& [name, value] : names) sheet.replace(name, value);
    return sheet;
}

QPalette paletteOf(const ThemeColors& c) {
    QPalette palette;
    palette.setColor(QPalette::Window, c.window);
    palette.setColor(QPalette::WindowText, c.text);
    palette.setColor(QPalette::Base, c.base);
    palette.setColor(QPalette::AlternateBase, c.window);
    palette.setColor(QPalette::Text, c.text);
    palette.setColor(QPalette::Button, c.button);
    palette.setColor(QPalette::ButtonText, c.text);
    palette.setColor(QPalette::ToolTipBase, c.base);
    palette.setColor(QPalette::ToolTipText, c.text);
    palette.setColor(QPalette::Highlight, c.accent);
    palette.setColor(QPalette::HighlightedText, c.accentText);
    palette.setColor(QPalette::PlaceholderText, c.caption);
    palette.setColor(QPalette::Link, c.focus);
    palette.setColor(QPalette::LinkVisited, c.focus);
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(QPalette::Disabled, role, c.dim);
    return palette;
}

/// As the desktop's own settings have it, before any palette of ours.
bool systemIsDark() {
    static const bool dark = QApplication::palette().color(QPalette::Window).lightness() < 128;
    return dark;
}

}  // namespace

ThemeChoice themeFromText(const QString& text) {
    if (text == "light") return ThemeChoice::Light;
    return text == "dark" ? ThemeChoice::Dark : ThemeChoice::System;
}

QString themeText(ThemeChoice choice) {
    return choice == ThemeChoice::Light ? "light" : choice == ThemeChoice::Dark ? "dark" : "system";
}

bool prepareTheme(QApplication& application, ThemeChoice choice) {
    const bool system = systemIsDark();
    const bool dark = choice == ThemeChoice::Dark || (choice == ThemeChoice::System && system);
    application.setStyle(QStyleFactory::create("Fusion"));
    application.setPalette(paletteOf(dark ? kDark : kLight));
    useDarkInk(dark);
    return dark;
}

void dressTheme(QApplication& application, bool dark) {
    application.setStyleSheet(styled(dark ? kDark : kLight));
}

bool applyTheme(QApplication& application, ThemeChoice choice) {
    const bool dark = prepareTheme(application, choice);
    dressTheme(application, dark);
    return dark;
}

}  // namespace zel
