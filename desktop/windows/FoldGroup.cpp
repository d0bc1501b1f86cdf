#include "desktop/windows/FoldGroup.h"

#include <QLayout>
#include <QScrollArea>
#include <QTimer>
#include <QVBoxLayout>

namespace zel {

FoldGroup::FoldGroup(const QString& name, const QString& caption, QWidget* content)
    : name_(name), heading_(new QToolButton), content_(content) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    row_ = new QHBoxLayout;
    row_->setSpacing(4);
    heading_->setObjectName("heading");
    heading_->setText(caption);
    heading_->setAccessibleName(caption);
    heading_->setCheckable(true);
    heading_->setChecked(true);
    heading_->setArrowType(Qt::DownArrow);
    heading_->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    heading_->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    row_->addWidget(heading_, 1);
    layout->addLayout(row_);
    layout->addWidget(content_);
    connect(heading_, &QToolButton::toggled, this, [this](bool open) {
        heading_->setArrowType(open ? Qt::DownArrow : Qt::RightArrow);
        content_->setVisible(open);
    });
    connect(heading_, &QToolButton::clicked, this, [this](bool open) {
        choice_ = open ? Choice::Open : Choice::Shut;
        emit chosen();
    });
}

void FoldGroup::setChoice(Choice choice) {
    choice_ = choice;
    if (choice != Choice::ByRoom) setOpen(choice == Choice::Open);
}

void FoldGroup::setOpen(bool open) { heading_->setChecked(open); }

int FoldGroup::contentHeight() const {
    return content_->layout()->minimumSize().height() + layout()->spacing();
}

FoldGroup* FoldGroup::around(const QWidget& widget) {
    for (QWidget* at = widget.parentWidget(); at != nullptr; at = at->parentWidget())
        if (auto* group = qobject_cast<FoldGroup*>(at); group != nullptr)
            return group->content_->isAncestorOf(&widget) ? group : nullptr;
    return nullptr;
}

bool FoldGroup::offers(const QWidget& widget) {
    const FoldGroup* group = around(widget);
    if (group == nullptr) return widget.isVisible();
    return group->isVisible() && widget.isVisibleTo(group->content_);
}

void FoldGroup::reveal(const QWidget& widget) {
    FoldGroup* group = around(widget);
    if (group == nullptr || group->isOpen()) return;
    // Who goes to a part by a key wants it, whether there is room for it or not.
    group->choice_ = Choice::Open;
    group->setOpen(true);
    QTimer::singleShot(0, group, [group] {
        for (QWidget* at = group->parentWidget(); at != nullptr; at = at->parentWidget())
            if (auto* area = qobject_cast<QScrollArea*>(at)) area->ensureWidgetVisible(group);
    });
}

}  // namespace zel
