#include "desktop/windows/WatchPage.h"

#include <QFileDialog>
#include <QGridLayout>
#include <QPushButton>
#include <cstddef>
#include <utility>

#include "analysis/MaskWatch.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {
namespace {

constexpr int kMostAfter = 100'000;

QLabel* wrapped(const QString& text) {
    auto* label = new QLabel(text);
    label->setWordWrap(true);
    return label;
}

}  // namespace

WatchPage::WatchPage(TraceTools& tools, MaskWatch& watch) : TracePage(tools), watch_(watch) {
    auto* grid = new QGridLayout(this);
    grid->setColumnStretch(1, 1);
    grid->addWidget(wrapped(QObject::tr("When a sweep fails the mask of the page Limits:")), 0, 0,
                    1, 3);

    save_ = new QCheckBox(QObject::tr("Save it to"));
    save_->setObjectName("WatchSave");
    file_ = new QLineEdit;
    file_->setObjectName("WatchFile");
    file_->setAccessibleName(QObject::tr("File of the failing sweeps"));
    file_->setToolTip(QObject::tr("Sweeps are added to the end of the file: a recording"));
    auto* choose = new QPushButton(QObject::tr("Choose..."));
    grid->addWidget(save_, 1, 0);
    grid->addWidget(file_, 1, 1);
    grid->addWidget(choose, 1, 2);

    after_ = new QSpinBox;
    after_->setObjectName("WatchAfter");
    after_->setRange(0, kMostAfter);
    after_->setSuffix(QObject::tr(" sweeps after it"));
    auto* too = new QLabel(QObject::tr("and record"));
    too->setBuddy(after_);
    grid->addWidget(too, 2, 0, Qt::AlignRight);
    grid->addWidget(after_, 2, 1, Qt::AlignLeft);

    run_ = new QCheckBox(QObject::tr("Run"));
    run_->setObjectName("WatchRun");
    command_ = new QLineEdit;
    command_->setObjectName("WatchCommand");
    command_->setAccessibleName(QObject::tr("Command"));
    command_->setPlaceholderText(QObject::tr("program and arguments"));
    grid->addWidget(run_, 3, 0);
    grid->addWidget(command_, 3, 1, 1, 2);
    grid->addWidget(
        wrapped(QObject::tr("{x}, {margin}, {time} and {file} are filled in. No shell reads the "
                            "line; \"...\" keeps words together. One command runs at a time.")),
        4, 1, 1, 2);

    counts_ = wrapped({});
    counts_->setObjectName("WatchCounts");
    grid->addWidget(counts_, 5, 0, 1, 3);
    word_ = wrapped({});
    word_->setObjectName("WatchWord");
    grid->addWidget(word_, 6, 0, 1, 3);
    grid->setRowStretch(7, 1);

    connect(choose, &QPushButton::clicked, this, [this] {
        const QString path =
            QFileDialog::getSaveFileName(this, QObject::tr("File of the failing sweeps"),
                                         file_->text(), QObject::tr("Views (*.csv);;All Files (*)"),
                                         nullptr, QFileDialog::DontConfirmOverwrite);
        if (path.isEmpty()) return;
        file_->setText(path);
        save_->setChecked(true);
        takeSettings();
    });
    for (QCheckBox* box : {save_, run_})
        connect(box, &QCheckBox::clicked, this, [this] { takeSettings(); });
    for (QLineEdit* box : {file_, command_})
        connect(box, &QLineEdit::editingFinished, this, [this] { takeSettings(); });
    connect(after_, &QSpinBox::editingFinished, this, [this] { takeSettings(); });
    showState();
}

void WatchPage::takeSettings() {
    WatchSettings settings;
    QString word;
    if (save_->isChecked()) {
        settings.file = file_->text().trimmed().toStdString();
        if (settings.file.empty()) word = QObject::tr("Give the file to which failing sweeps go.");
        settings.after = static_cast<std::size_t>(after_->value());
    }
    if (run_->isChecked()) {
        const auto words = commandWords(command_->text().toStdString());
        if (!words) {
            word = QObject::tr("The command has a quote without an end.");
        } else if (words->empty()) {
            word = QObject::tr("Give the command to run.");
        } else {
            settings.command = *words;
        }
    }
    // A look at the page is no change: the counts go on.
    const WatchSettings& now = watch_.settings();
    if (settings.file != now.file || settings.after != now.after || settings.command != now.command)
        watch_.set(std::move(settings));
    showState();
    if (!word.isEmpty()) word_->setText(word);
}

void WatchPage::showState() {
    watch_.follow();
    const bool watches = watch_.settings().any();
    QString counts;
    if (watches) {
        counts = tools_.request.mask ? QObject::tr("Watching")
                                     : QObject::tr("There is no mask yet: page Limits");
        if (const std::string done = watch_.text(); !done.empty())
            counts += ": " + QString::fromStdString(done);
    }
    counts_->setText(counts);
    word_->setText(QString::fromStdString(watch_.problem()));
}

}  // namespace zel
