#include "desktop/windows/SupportWindows.h"

#include <QCheckBox>
#include <QFontDatabase>
#include <QFontInfo>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QPushButton>
#include <QScrollBar>
#include <QStyle>
#include <QVBoxLayout>
#include <cmath>
#include <string>

#include "desktop/binders/Binder.h"
#include "desktop/windows/FormWindow.h"
#include "forms/SupportForms.h"
#include "platform/Controls.h"
#include "support/SupportAddress.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kButtonWidth = 100;
constexpr int kPictureSize = 40;
constexpr int kTextColumns = 84;

QPushButton* key(Binder& binder, Button& control) {
    auto* button = new QPushButton;
    button->setAutoDefault(false);
    button->setMinimumWidth(kButtonWidth);
    binder.bind(control, button);
    return button;
}

/// The last row: what can be done at the left, the key that closes at the right.
void addKeys(QVBoxLayout& layout, std::initializer_list<QPushButton*> work, QPushButton* close,
             QPushButton* usual) {
    auto* row = new QHBoxLayout;
    for (QPushButton* button : work) row->addWidget(button);
    row->addStretch(1);
    row->addWidget(close);
    usual->setDefault(true);
    layout.addLayout(row);
}

QFont evenFont() {
    QFont font("Lucida Console");
    if (!QFontDatabase::hasFamily(font.family()))
        font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    font.setStyleHint(QFont::Monospace);
    return font;
}

/// A text of many lines to read and to copy, in a font whose columns line up.
QPlainTextEdit* reading(Binder& binder, TextBox& control, int lines) {
    auto* view = new QPlainTextEdit;
    view->setReadOnly(true);
    view->setFont(evenFont());
    view->setLineWrapMode(QPlainTextEdit::NoWrap);
    view->setTabChangesFocus(true);
    const QFontMetrics metrics(view->font());
    view->setMinimumWidth(metrics.horizontalAdvance('x') * kTextColumns / 2);
    view->setMinimumHeight(metrics.lineSpacing() * lines);
    binder.bindShow(control, view, [&control, view] {
        const QString text =
            QString::fromStdString(replaceAll(control.Text.get(), kCrLf, "\n")).trimmed();
        if (view->toPlainText() != text) view->setPlainText(text);
        view->setVisible(control.Visible);
    });
    return view;
}

/// A label whose caption keeps the signs of its keys.
QLabel* words(Binder& binder, Label& control) {
    auto* label = new QLabel;
    label->setWordWrap(true);
    label->setTextFormat(Qt::PlainText);
    binder.bindShow(control, label, [&control, label] {
        label->setText(
            QString::fromStdString(captionText(control.Caption)).trimmed().replace("\r\n", "\n"));
        label->setVisible(control.Visible);
    });
    return label;
}

void setCaptionSize(QLabel* label, double factor) {
    QFont font = label->font();
    font.setBold(true);
    font.setPixelSize(static_cast<int>(std::lround(QFontInfo(font).pixelSize() * factor)));
    label->setFont(font);
}

}  // namespace

AboutWindow::AboutWindow(AboutForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(18, 16, 18, 14);
    layout->setSpacing(8);
    QLabel* title = words(binder, form.TitleLabel);
    setCaptionSize(title, 1.7);
    layout->addWidget(title);
    layout->addWidget(words(binder, form.VersionLabel));
    layout->addWidget(words(binder, form.LicenceLabel));
    auto* parts = new QHBoxLayout;
    for (Button* control : {&form.ShowSystemInfo, &form.ShowDriverInfo, &form.ShowLegalNotes})
        parts->addWidget(key(binder, *control));
    layout->addLayout(parts);
    constexpr int kLines = 4;  // at least; all three parts may be shown
    for (TextBox* control : {&form.SystemInfo, &form.DriverInfo, &form.LegalNotes}) {
        QPlainTextEdit* view = reading(binder, *control, kLines);
        // The window has the same size whatever it shows.
        layout->addWidget(view, 1);
    }
    layout->addStretch(0);
    QPushButton* close = key(binder, form.ButtonOK);
    addKeys(*layout, {key(binder, form.CreateSupportString), key(binder, form.StartNISpy)}, close,
            close);
    setCancel(form.ButtonOK);
    setMinimumSize(580, 460);
    followForm();
}

ErrorWindow::ErrorWindow(ErrorForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(18, 16, 18, 14);
    layout->setSpacing(10);
    auto* head = new QHBoxLayout;
    head->setSpacing(14);
    auto* picture = new QLabel;
    picture->setPixmap(style()->standardIcon(QStyle::SP_MessageBoxCritical).pixmap(kPictureSize));
    picture->setAlignment(Qt::AlignTop);
    binder.bindShow(form.ErrirPicture, picture, [] {});
    head->addWidget(picture);
    auto* plain = new QVBoxLayout;
    QLabel* first = words(binder, form.Label(0));
    setCaptionSize(first, 1.1);
    plain->addWidget(first);
    plain->addWidget(words(binder, form.Label(2)));
    head->addLayout(plain, 1);
    layout->addLayout(head);

    layout->addWidget(words(binder, form.Label(1)));
    auto* details = new QVBoxLayout;
    details->setSpacing(2);
    for (TextBox& info : form.Info) {
        auto* line = new PanelLineEdit;
        line->setFont(evenFont());
        binder.bind(info, line);
        details->addWidget(line);
    }
    auto* calls = new QListWidget;
    calls->setFont(evenFont());
    calls->setMinimumHeight(QFontMetrics(calls->font()).lineSpacing() * 6);
    binder.bindShow(form.CallerList, calls, [&form, calls] {
        calls->clear();
        for (const std::string& item : form.CallerList.Items.get())
            calls->addItem(QString::fromStdString(item));
    });
    details->addWidget(calls, 1);
    layout->addLayout(details, 1);

    layout->addWidget(words(binder, form.Label(3)));
    layout->addWidget(words(binder, form.Label(4)));
    auto* attach = new QCheckBox;
    binder.bind(form.chkAttachLog, attach);
    layout->addWidget(attach);
    QPushButton* copy = key(binder, form.CopyToClipboard);
    binder.bindShow(form.CopyToClipboard, copy, [&form, copy] {
        copy->setText(QString::fromStdString(form.CopyToClipboard.Caption));  // with its key
        copy->setEnabled(form.CopyToClipboard.Enabled);
    });
    QPushButton* close = key(binder, form.ButtonOK);
    addKeys(*layout, {copy, key(binder, form.cmdSaveReport)}, close, close);
    setCancel(form.ButtonOK);
    setMinimumSize(620, 480);
    followForm();
}

DoctorWindow::DoctorWindow(DoctorForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(14, 12, 14, 12);
    layout->setSpacing(8);
    auto* fields = new QFormLayout;
    auto* address = new PanelLineEdit;
    address->setPlaceholderText(
        QObject::tr("serial:DEVICE@BAUD or tcp:HOST:PORT; empty: all ports"));
    binder.bind(form.AddressBox, address);
    QLabel* caption = words(binder, form.AddressCaption);
    caption->setWordWrap(false);
    caption->setBuddy(address);
    fields->addRow(caption, address);
    layout->addLayout(fields);
    constexpr int kLines = 14;
    QPlainTextEdit* findings = reading(binder, form.FindingsBox, kLines);
    findings->setLineWrapMode(QPlainTextEdit::WidgetWidth);
    layout->addWidget(findings, 1);
    QLabel* status = words(binder, form.StatusLabel);
    status->setMinimumHeight(status->fontMetrics().lineSpacing());
    layout->addWidget(status);
    QPushButton* again = key(binder, form.cmdRunAgain);
    addKeys(*layout, {again, key(binder, form.cmdCopy)}, key(binder, form.cmdClose), again);
    setCancel(form.cmdClose);
    setMinimumSize(640, 440);
    followForm();
}

}  // namespace zel
