#include "desktop/windows/EmptyScreen.h"

#include <QFrame>
#include <QLabel>
#include <QVBoxLayout>
#include <cstddef>
#include <functional>
#include <utility>

#include "desktop/windows/ThemeIcons.h"

namespace zel {
namespace {

constexpr int kMostRecent = 3;
constexpr int kWidth = 300;

}  // namespace

EmptyScreen::EmptyScreen(Ways ways, QWidget* parent) : QWidget(parent), ways_(std::move(ways)) {
    setAttribute(Qt::WA_TransparentForMouseEvents, false);
    auto* outer = new QVBoxLayout(this);
    auto* card = new QFrame;
    card->setObjectName("card");
    card->setFixedWidth(kWidth);
    layout_ = new QVBoxLayout(card);
    layout_->setContentsMargins(16, 14, 16, 16);
    layout_->setSpacing(8);
    auto* heading = new QLabel(QObject::tr("Nothing to show yet"));
    heading->setProperty("readout", true);
    layout_->addWidget(heading);
    QPushButton* first = addWay(QObject::tr("Connect..."), "connect", ways_.connect);
    first->setProperty("face", "blue");
    first->setIcon(themeIcon("connect", Qt::white));
    for (int i = 0; i < kMostRecent; ++i) {
        recent_.push_back(addWay({}, "connect", [this, i] { ways_.connectAgain(i); }));
        recent_.back()->hide();
    }
    addWay(QObject::tr("Try it on a simulated instrument"), "simulator", ways_.simulate);
    addWay(QObject::tr("Open a file..."), "open", ways_.open);
    outer->addWidget(card, 0, Qt::AlignCenter);
}

QPushButton* EmptyScreen::addWay(const QString& text, const char* icon, std::function<void()> act) {
    auto* button = new QPushButton(text);
    button->setIcon(themeIcon(icon));
    button->setIconSize({20, 20});
    button->setProperty("way", true);
    connect(button, &QPushButton::clicked, this, [act = std::move(act)] { act(); });
    layout_->addWidget(button);
    return button;
}

void EmptyScreen::setRecent(const QStringList& names) {
    for (std::size_t i = 0; i < recent_.size(); ++i) {
        const bool there = static_cast<qsizetype>(i) < names.size();
        recent_[i]->setVisible(there);
        if (!there) continue;
        const QString name = names[static_cast<qsizetype>(i)];
        recent_[i]->setText(fontMetrics().elidedText(QString(name).replace("&", "&&"),
                                                     Qt::ElideMiddle, kWidth - 90));
        recent_[i]->setToolTip(QObject::tr("Connect to %1").arg(name));
        recent_[i]->setAccessibleName(QObject::tr("Connect to %1").arg(name));
    }
}

}  // namespace zel
