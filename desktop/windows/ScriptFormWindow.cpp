#include "desktop/windows/ScriptFormWindow.h"

#include <QFontDatabase>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QTextCursor>
#include <QTextOption>
#include <QVBoxLayout>
#include <string>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/windows/FormWindow.h"
#include "forms/ScriptForms.h"
#include "platform/Controls.h"

namespace zel {
namespace {

constexpr int kMargin = 12;
constexpr int kKeyWidth = 88;
constexpr QSize kScriptSize{640, 460};
constexpr QSize kStatisticsSize{620, 460};

QPushButton* key(Binder& binder, Button& control) {
    auto* button = new QPushButton;
    button->setAutoDefault(false);
    button->setMinimumWidth(kKeyWidth);
    binder.bind(control, button);
    return button;
}

QCheckBox* box(Binder& binder, CheckBox& control) {
    auto* check = new QCheckBox;
    binder.bind(control, check);
    return check;
}

QHBoxLayout* rowOf(QWidget* row) {
    auto* layout = new QHBoxLayout(row);
    layout->setContentsMargins(0, 0, 0, 0);
    return layout;
}

}  // namespace

ScriptFormWindow::ScriptFormWindow(SpecialMeasForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent), script_(form), list_(new QListWidget) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
    layout->addWidget(fileRow());
    list_->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    list_->setUniformItemSizes(true);
    list_->setAlternatingRowColors(true);
    list_->setMinimumHeight(120);
    connect(list_, &QListWidget::currentRowChanged, this, [this](int row) {
        if (script_.lstCommands.ListIndex == row) return;
        script_.lstCommands.ListIndex = row;
        script_.lstCommands.Clicked();
    });
    binder.bindShow(form.lstCommands, list_, [this] { showList(); });
    layout->addWidget(list_, 1);
    layout->addWidget(optionRow());
    auto* progress = new QLabel;
    progress->setObjectName("caption");
    binder.bind(form.lblProgress, progress);
    QSizePolicy policy = progress->sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    progress->setSizePolicy(policy);
    layout->addWidget(progress);
    layout->addWidget(keyRow());
    resize(kScriptSize);
    setCancel(form.cmdCancel);
    followForm();
}

QWidget* ScriptFormWindow::fileRow() {
    auto* row = new QWidget;
    auto* layout = rowOf(row);
    for (Button* control : {&script_.cmdOpenCommandsFile, &script_.cmdEdit, &script_.cmdNew})
        layout->addWidget(key(binder_, *control));
    layout->addStretch(1);
    auto* caption = new QLabel("Available Files");
    auto* files = new QComboBox;
    files->setMinimumWidth(160);
    caption->setBuddy(files);
    layout->addWidget(caption);
    layout->addWidget(files);
    connect(files, &QComboBox::activated, this,
            [this](int index) { script_.cmboSpecialMeasList.pick(index); });
    binder_.bindShow(script_.cmboSpecialMeasList, files, [this, caption, files] {
        const DropDownList& list = script_.cmboSpecialMeasList;
        const QSignalBlocker quiet(files);
        files->clear();
        for (const std::string& item : list.items()) files->addItem(QString::fromStdString(item));
        files->setCurrentIndex(list.ListIndex());
        files->setEnabled(list.Enabled);
        // Nothing to choose from takes no room.
        const bool any = list.Visible && list.ListCount() > 0;
        files->setVisible(any);
        caption->setVisible(any);
    });
    return row;
}

QWidget* ScriptFormWindow::optionRow() {
    auto* row = new QWidget;
    auto* layout = rowOf(row);
    layout->addWidget(box(binder_, script_.chkStep));
    layout->addWidget(box(binder_, script_.chkWaterfall));
    layout->addWidget(box(binder_, script_.chkGetSweep));
    layout->addStretch(1);
    layout->addWidget(box(binder_, script_.chkSave));
    layout->addWidget(key(binder_, script_.cmdSave));
    return row;
}

QWidget* ScriptFormWindow::keyRow() {
    auto* row = new QWidget;
    auto* layout = rowOf(row);
    layout->addWidget(key(binder_, script_.cmdRehearse));
    layout->addStretch(1);
    auto* execute = key(binder_, script_.cmdExecute);
    execute->setDefault(true);
    layout->addWidget(execute);
    layout->addWidget(key(binder_, script_.cmdNext));
    layout->addWidget(key(binder_, script_.cmdStop));
    layout->addWidget(key(binder_, script_.cmdCancel));
    return row;
}

void ScriptFormWindow::showList() {
    const QSignalBlocker quiet(list_);
    const std::vector<std::string>& items = script_.lstCommands.Items;
    if (items != shown_) {
        shown_ = items;
        list_->clear();
        QStringList lines;
        for (const std::string& item : items)
            lines << QString::fromStdString(item).replace('\n', ' ').replace('\r', ' ');
        list_->addItems(lines);
    }
    if (list_->currentRow() != script_.lstCommands.ListIndex) {
        list_->setCurrentRow(script_.lstCommands.ListIndex);
        if (QListWidgetItem* item = list_->currentItem()) list_->scrollToItem(item);
    }
    list_->setEnabled(script_.lstCommands.Enabled);
    list_->setVisible(script_.lstCommands.Visible);
}

StatisticsWindow::StatisticsWindow(STDForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
    layout->addWidget(figures(form));
    auto* caption = new QLabel;
    binder.bind(form.lblRefMeas, caption);
    layout->addWidget(caption);
    QTextEdit* reference = textBox(form.refMeasBox);
    reference->setMaximumHeight(90);
    layout->addWidget(reference);
    layout->addWidget(textBox(form.rtfReceive), 1);
    auto* keys = new QHBoxLayout;
    for (OptionButton* control : {&form.optRadians, &form.optDegrees}) {
        auto* option = new QRadioButton;
        binder.bind(*control, option);
        keys->addWidget(option);
    }
    keys->addStretch(1);
    keys->addWidget(key(binder, form.cmdClear));
    keys->addWidget(key(binder, form.cmdExecute));
    keys->addWidget(key(binder, form.cmdStop));
    layout->addLayout(keys);
    resize(kStatisticsSize);
    followForm();
}

/// The figures side by side, each under its name.
QWidget* StatisticsWindow::figures(STDForm& form) {
    struct Figure {
        Frame& frame;
        Label& label;
    };
    const Figure rows[] = {{form.frameMeanLevel, form.lblMeanLevel},
                           {form.frameStdLevel, form.lblStdLevel},
                           {form.frameMeanPhase, form.lblMeanPhase},
                           {form.frameStdPhase, form.lblStdPhase},
                           {form.frameAvgCount, form.lblAvgCount}};
    auto* group = new QFrame;
    group->setObjectName("group");
    auto* grid = new QGridLayout(group);
    int column = 0;
    for (const Figure& row : rows) {
        auto* name = new QLabel(QString::fromStdString(row.frame.Caption));
        name->setObjectName("caption");
        auto* value = new QLabel;
        value->setProperty("readout", true);
        value->setMinimumHeight(value->fontMetrics().height() + 6);
        binder_.bind(row.label, value);
        grid->addWidget(name, 0, column);
        grid->addWidget(value, 1, column);
        grid->setColumnStretch(column, 1);
        ++column;
    }
    return group;
}

QTextEdit* StatisticsWindow::textBox(RichText& control) {
    // Each name has two tabs after it: the first goes beyond the longest name, the second a step
    // on, so that the values stand in one column.
    constexpr double kStep = 8;
    auto* view = new QTextEdit;
    view->setReadOnly(true);
    const double column = view->fontMetrics().horizontalAdvance("Phase Std Dev(rad):  ") + kStep;
    QTextBlockFormat columns;
    columns.setTabPositions(
        {{column, QTextOption::LeftTab}, {column + kStep, QTextOption::LeftTab}});
    binder_.bindShow(control, view, [&control, view, columns] {
        const QString text = QString::fromStdString(control.Text()).replace("\r\n", "\n");
        if (view->toPlainText() == text) return;
        view->clear();
        QTextCursor cursor(view->document());
        cursor.setBlockFormat(columns);
        for (const TextRun& run : control.runs()) {
            QTextCharFormat format;
            format.setFontWeight(run.bold ? QFont::Bold : QFont::Normal);
            format.setFontItalic(run.italic);
            // Black is the colour of the theme's texts, whatever the theme.
            if (run.color != 0)
                format.setForeground(QColor(static_cast<int>(run.color & 0xFF),
                                            static_cast<int>(run.color >> 8 & 0xFF),
                                            static_cast<int>(run.color >> 16 & 0xFF)));
            cursor.insertText(QString::fromStdString(run.text).replace("\r\n", "\n"), format);
        }
        view->verticalScrollBar()->setValue(view->verticalScrollBar()->maximum());
    });
    return view;
}

}  // namespace zel
